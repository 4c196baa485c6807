// The file that is written beside the one whose place it takes at the end.
#ifndef WORKBOOK_MODEL_NEW_FILE_H
#define WORKBOOK_MODEL_NEW_FILE_H

#include "file_nature.h"

#include <optional>
#include <string>
#include <string_view>

namespace workbook {

// Each step is false when a call failed; GetLastError() says why.
class NewFile {
public:
    NewFile() = default;
    ~NewFile();  // unless it has taken the old one's place, the file is deleted
    NewFile(const NewFile&) = delete;
    NewFile& operator=(const NewFile&) = delete;

    // Creates it beside `place`, empty, with the nature of the old file, if there is one.
    bool create(const std::wstring& place, const std::optional<FileNature>& old);

    // Writes it, has it put to the disk, and closes it.
    bool write(std::string_view bytes);

    bool moveTo(const std::wstring& place);

private:
    bool createAnyName(const std::wstring& place);
    bool createAgainLocked();
    bool give(const FileNature& nature);

    std::wstring path_;  // empty while there is none
    FileHandle handle_;
};

}  // namespace workbook

#endif
