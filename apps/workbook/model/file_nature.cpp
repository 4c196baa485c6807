// The part of the model that knows access rights and links.
#include "file_nature.h"

#include <utility>

namespace workbook {

namespace {

constexpr DWORD kKeptAttributes = FILE_ATTRIBUTE_HIDDEN | FILE_ATTRIBUTE_SYSTEM |
                                  FILE_ATTRIBUTE_ARCHIVE | FILE_ATTRIBUTE_NOT_CONTENT_INDEXED;

bool MeansNoRightsHere(DWORD error) {
    return error == ERROR_NOT_SUPPORTED || error == ERROR_INVALID_FUNCTION;
}

// Nothing when they cannot be read.
std::optional<std::vector<BYTE>> RightsOf(HANDLE file) {
    DWORD size = 0;
    GetKernelObjectSecurity(file, DACL_SECURITY_INFORMATION, nullptr, 0, &size);
    if (size == 0 && MeansNoRightsHere(GetLastError())) return std::vector<BYTE>();
    std::vector<BYTE> rights(size);
    if (!GetKernelObjectSecurity(file, DACL_SECURITY_INFORMATION, rights.data(), size, &size))
        return std::nullopt;
    return rights;
}

}  // namespace

std::optional<FileNature> NatureOf(HANDLE file) {
    FileNature nature;
    if (!GetFileInformationByHandleEx(file, FileBasicInfo, &nature.basic, sizeof nature.basic))
        return std::nullopt;
    std::optional<std::vector<BYTE>> rights = RightsOf(file);
    if (!rights) return std::nullopt;
    nature.rights = std::move(*rights);
    return nature;
}

bool HasRights(HANDLE file, const FileNature& nature) {
    return nature.rights.empty() || RightsOf(file) == nature.rights;
}

bool GiveAttributes(HANDLE file, const FileNature& nature) {
    FILE_BASIC_INFO basic = {};  // a time of 0 is left as it is
    basic.CreationTime = nature.basic.CreationTime;
    basic.FileAttributes = nature.basic.FileAttributes & kKeptAttributes;
    if (basic.FileAttributes == 0) basic.FileAttributes = FILE_ATTRIBUTE_NORMAL;
    return SetFileInformationByHandle(file, FileBasicInfo, &basic, sizeof basic) != 0;
}

bool GiveRights(HANDLE file, const FileNature& nature) {
    auto* const rights = const_cast<BYTE*>(nature.rights.data());
    return SetKernelObjectSecurity(file, DACL_SECURITY_INFORMATION, rights) != 0;
}

std::wstring PlaceOf(HANDLE file, const std::wstring& path) {
    std::wstring place(GetFinalPathNameByHandleW(file, nullptr, 0, VOLUME_NAME_DOS), L'\0');
    const DWORD length = GetFinalPathNameByHandleW(
        file, place.data(), static_cast<DWORD>(place.size()), VOLUME_NAME_DOS);
    if (length == 0 || length >= place.size()) return path;
    place.resize(length);
    return place;
}

}  // namespace workbook
