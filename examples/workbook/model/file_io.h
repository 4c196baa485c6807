// Whole files: reading them, and replacing them so that a failure loses nothing.
#ifndef WORKBOOK_MODEL_FILE_IO_H
#define WORKBOOK_MODEL_FILE_IO_H

#include <optional>
#include <string>
#include <string_view>

namespace workbook {

struct FileProblem {
    std::wstring message;  // a sentence for the user: which file, and why
};

struct FileContents {
    std::string bytes;
    std::optional<FileProblem> problem;  // when set, bytes is empty
};

// Reads a file of at most `largest` bytes.
FileContents ReadWholeFile(const std::wstring& path, size_t largest) noexcept;

// Writes the bytes to a new file beside `path`, has them put to the disk, and renames it over
// `path`. When anything fails, the old file is as it was and the new one is gone again.
std::optional<FileProblem> ReplaceFileBytes(const std::wstring& path,
                                            std::string_view bytes) noexcept;

}  // namespace workbook

#endif
