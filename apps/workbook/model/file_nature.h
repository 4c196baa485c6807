// What a file has besides its contents, which the file that takes its place takes over.
#ifndef WORKBOOK_MODEL_FILE_NATURE_H
#define WORKBOOK_MODEL_FILE_NATURE_H

#include "file_handle.h"

#include <optional>
#include <string>
#include <vector>

namespace workbook {

struct FileNature {
    FILE_BASIC_INFO basic = {};  // attributes and times
    std::vector<BYTE> rights;    // a security descriptor; empty where the disk knows none
};

// Nothing when a call failed; GetLastError() says why.
std::optional<FileNature> NatureOf(HANDLE file);

// Whether the file has the rights already; also false when that cannot be found out.
bool HasRights(HANDLE file, const FileNature& nature);

// Both are false when a call failed; GetLastError() says why.
bool GiveAttributes(HANDLE file, const FileNature& nature);
bool GiveRights(HANDLE file, const FileNature& nature);

// The file behind the links by which `file` was opened; `path` itself when the system cannot say.
std::wstring PlaceOf(HANDLE file, const std::wstring& path);

}  // namespace workbook

#endif
