#include "new_file.h"

#include <algorithm>

namespace workbook {

namespace {

constexpr size_t kChunk = size_t{1} << 20;  // bytes per call to the system
constexpr int kTemporaryNames = 100;

HANDLE CreateNew(const std::wstring& path, DWORD access, SECURITY_ATTRIBUTES* security) {
    return CreateFileW(path.c_str(), access, 0, security, CREATE_NEW, FILE_ATTRIBUTE_NORMAL,
                       nullptr);
}

// A file that nobody may open: whoever got hold of it now could read what is written later.
HANDLE CreateLocked(const std::wstring& path) {
    ACL nobody;
    InitializeAcl(&nobody, sizeof nobody, ACL_REVISION);
    SECURITY_DESCRIPTOR descriptor;
    InitializeSecurityDescriptor(&descriptor, SECURITY_DESCRIPTOR_REVISION);
    SetSecurityDescriptorDacl(&descriptor, TRUE, &nobody, FALSE);
    SECURITY_ATTRIBUTES security = {sizeof security, &descriptor, FALSE};
    return CreateNew(path, GENERIC_WRITE | READ_CONTROL | WRITE_DAC, &security);
}

bool WriteAll(HANDLE file, std::string_view bytes) {
    while (!bytes.empty()) {
        DWORD written = 0;
        const auto wanted = static_cast<DWORD>(std::min(bytes.size(), kChunk));
        if (!WriteFile(file, bytes.data(), wanted, &written, nullptr)) return false;
        if (written == 0) {
            SetLastError(ERROR_DISK_FULL);
            return false;
        }
        bytes.remove_prefix(written);
    }
    return FlushFileBuffers(file) != 0;
}

}  // namespace

NewFile::~NewFile() {
    handle_.close();
    if (path_.empty() || DeleteFileW(path_.c_str())) return;
    // To Wine a file that nobody may open is write-protected.
    SetFileAttributesW(path_.c_str(), FILE_ATTRIBUTE_NORMAL);
    DeleteFileW(path_.c_str());
}

bool NewFile::create(const std::wstring& place, const std::optional<FileNature>& old) {
    if (!createAnyName(place)) return false;
    return !old || give(*old);
}

bool NewFile::createAnyName(const std::wstring& place) {
    for (int attempt = 0; attempt < kTemporaryNames; ++attempt) {
        std::wstring path = place + L"." + std::to_wstring(GetCurrentProcessId()) + L"-" +
                            std::to_wstring(attempt) + L".tmp";
        handle_.reset(CreateNew(path, GENERIC_WRITE | READ_CONTROL, nullptr));
        if (handle_.isOpen()) path_.swap(path);
        if (handle_.isOpen() || GetLastError() != ERROR_FILE_EXISTS) return handle_.isOpen();
    }
    return false;
}

// In a folder new files usually have the rights that the old one has; then there is nothing to do.
// Otherwise it is made again without any, and gets its own before something is written to it.
bool NewFile::give(const FileNature& nature) {
    if (HasRights(handle_.get(), nature)) return GiveAttributes(handle_.get(), nature);
    if (!createAgainLocked() || !GiveAttributes(handle_.get(), nature)) return false;
    // Wine, whose rights are a Unix file's mode, gives the group whatever the owner gets, and what
    // was private would be no longer. There the attributes have made a locked file one that is its
    // owner's; if that is what is wanted, no more is done.
    return HasRights(handle_.get(), nature) || GiveRights(handle_.get(), nature);
}

bool NewFile::createAgainLocked() {
    handle_.close();
    if (!DeleteFileW(path_.c_str())) return false;
    handle_.reset(CreateLocked(path_));
    return handle_.isOpen();
}

bool NewFile::write(std::string_view bytes) {
    const DWORD error = WriteAll(handle_.get(), bytes) ? ERROR_SUCCESS : GetLastError();
    const bool closed = handle_.close();
    // The error number is that of the step that failed first.
    if (error != ERROR_SUCCESS) SetLastError(error);
    return closed && error == ERROR_SUCCESS;
}

bool NewFile::moveTo(const std::wstring& place) {
    if (!MoveFileExW(path_.c_str(), place.c_str(),
                     MOVEFILE_REPLACE_EXISTING | MOVEFILE_WRITE_THROUGH))
        return false;
    path_.clear();
    return true;
}

}  // namespace workbook
