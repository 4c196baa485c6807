// Whole files: reading them, and replacing them so that a failure loses nothing.
#ifndef WORKBOOK_MODEL_FILE_IO_H
#define WORKBOOK_MODEL_FILE_IO_H

#include "file_mark.h"

#include <optional>
#include <string>
#include <string_view>

namespace workbook {

enum class FileProblemKind {
    Failed,
    ChangedByOthers,  // the file holds something else than was expected: it was left alone
    RemovedByOthers   // the file that was expected is not there: nothing was written
};

struct FileProblem {
    std::wstring message;  // a sentence for the user: which file, and why
    FileProblemKind kind = FileProblemKind::Failed;
};

struct FileContents {
    std::string bytes;
    std::optional<FileProblem> problem;  // when set, bytes is empty
};

// Reads a file of at most `largest` bytes.
FileContents ReadWholeFile(const std::wstring& path, size_t largest) noexcept;

// Writes the bytes to a new file beside `path`, has them put to the disk, and renames it over
// `path`. When anything fails, the old file is as it was and the new one is gone again.
//
// The new file takes over the old one's access rights, attributes and time of creation. Where
// `path` is a link it stays one, and the file behind it is replaced.
//
//   expected  what the old file must hold; nothing: it is replaced whatever it holds
std::optional<FileProblem>
ReplaceFileBytes(const std::wstring& path, std::string_view bytes,
                 const std::optional<FileMark>& expected = std::nullopt) noexcept;

}  // namespace workbook

#endif
