// The only file of the model that knows the operating system.
#include "file_io.h"

#include "last_words.h"

#ifndef WIN32_LEAN_AND_MEAN
#define WIN32_LEAN_AND_MEAN
#endif
#ifndef NOMINMAX
#define NOMINMAX
#endif
#include <windows.h>

#include <algorithm>
#include <new>

namespace workbook {

namespace {

constexpr size_t kChunk = size_t{1} << 20;  // bytes per call to the system
constexpr int kTemporaryNames = 100;

class FileHandle {
public:
    explicit FileHandle(HANDLE handle) : handle_(handle) {}
    ~FileHandle() { close(); }
    FileHandle(const FileHandle&) = delete;
    FileHandle& operator=(const FileHandle&) = delete;

    bool isOpen() const { return handle_ != INVALID_HANDLE_VALUE; }
    HANDLE get() const { return handle_; }
    bool close() {
        if (!isOpen()) return true;
        const bool closed = CloseHandle(handle_) != 0;
        handle_ = INVALID_HANDLE_VALUE;
        return closed;
    }

private:
    HANDLE handle_;
};

// The system's sentence for an error number, without the line break at its end.
std::wstring SystemMessage(DWORD error) {
    wchar_t buffer[512];
    DWORD length = FormatMessageW(FORMAT_MESSAGE_FROM_SYSTEM | FORMAT_MESSAGE_IGNORE_INSERTS,
                                  nullptr, error, 0, buffer, 512, nullptr);
    while (length > 0 && (buffer[length - 1] == L'\n' || buffer[length - 1] == L'\r')) --length;
    if (length == 0) return L"System error " + std::to_wstring(error) + L".";
    return {buffer, length};
}

FileProblem ProblemWith(const wchar_t* what, const std::wstring& path, const std::wstring& why) {
    return {std::wstring(what) + L" \"" + path + L"\": " + why};
}

FileProblem CannotRead(const std::wstring& path, DWORD error) {
    return ProblemWith(L"Cannot read", path, SystemMessage(error));
}

FileProblem CannotWrite(const std::wstring& path, DWORD error) {
    return ProblemWith(L"Cannot write", path, SystemMessage(error));
}

std::wstring TooLargeMessage(size_t largest) {
    return L"The file is larger than " + std::to_wstring(largest >> 20) + L" MB.";
}

FileContents ReadUnguarded(const std::wstring& path, size_t largest) {
    FileHandle file(CreateFileW(path.c_str(), GENERIC_READ, FILE_SHARE_READ | FILE_SHARE_DELETE,
                                nullptr, OPEN_EXISTING, FILE_ATTRIBUTE_NORMAL, nullptr));
    if (!file.isOpen()) return {{}, CannotRead(path, GetLastError())};
    LARGE_INTEGER size{};
    if (!GetFileSizeEx(file.get(), &size)) return {{}, CannotRead(path, GetLastError())};
    if (static_cast<unsigned long long>(size.QuadPart) > largest)
        return {{}, ProblemWith(L"Cannot open", path, TooLargeMessage(largest))};

    FileContents contents;
    for (;;) {
        const size_t known = contents.bytes.size();
        contents.bytes.resize(known + kChunk);
        DWORD count = 0;
        if (!ReadFile(file.get(), contents.bytes.data() + known, kChunk, &count, nullptr))
            return {{}, CannotRead(path, GetLastError())};
        contents.bytes.resize(known + count);
        if (count == 0) return contents;
        if (contents.bytes.size() > largest)
            return {{}, ProblemWith(L"Cannot open", path, TooLargeMessage(largest))};
    }
}

// A new, empty file beside `path`. On failure the handle is INVALID_HANDLE_VALUE.
HANDLE CreateTemporary(const std::wstring& path, std::wstring& temporaryPath) {
    for (int attempt = 0; attempt < kTemporaryNames; ++attempt) {
        temporaryPath = path + L"." + std::to_wstring(GetCurrentProcessId()) + L"-" +
                        std::to_wstring(attempt) + L".tmp";
        const HANDLE file = CreateFileW(temporaryPath.c_str(), GENERIC_WRITE, 0, nullptr,
                                        CREATE_NEW, FILE_ATTRIBUTE_NORMAL, nullptr);
        if (file != INVALID_HANDLE_VALUE || GetLastError() != ERROR_FILE_EXISTS) return file;
    }
    return INVALID_HANDLE_VALUE;
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

std::optional<FileProblem> ReplaceUnguarded(const std::wstring& path, std::string_view bytes) {
    // Renaming over a write-protected file fails on some systems only.
    const DWORD attributes = GetFileAttributesW(path.c_str());
    if (attributes != INVALID_FILE_ATTRIBUTES && (attributes & FILE_ATTRIBUTE_READONLY) != 0)
        return CannotWrite(path, ERROR_ACCESS_DENIED);

    std::wstring temporaryPath;
    FileHandle file(CreateTemporary(path, temporaryPath));
    if (!file.isOpen()) return CannotWrite(path, GetLastError());

    // Not short-circuited into one condition: the error number belongs to the step that failed.
    DWORD error = WriteAll(file.get(), bytes) ? ERROR_SUCCESS : GetLastError();
    if (!file.close() && error == ERROR_SUCCESS) error = GetLastError();
    if (error == ERROR_SUCCESS && !MoveFileExW(temporaryPath.c_str(), path.c_str(),
                                               MOVEFILE_REPLACE_EXISTING | MOVEFILE_WRITE_THROUGH))
        error = GetLastError();
    if (error == ERROR_SUCCESS) return std::nullopt;
    DeleteFileW(temporaryPath.c_str());
    return CannotWrite(path, error);
}

}  // namespace

FileContents ReadWholeFile(const std::wstring& path, size_t largest) noexcept {
    try {
        return ReadUnguarded(path, largest);
    } catch (const std::bad_alloc&) {
        return {{}, FileProblem{TextOrNothing(L"There is not enough memory to read the file.")}};
    }
}

std::optional<FileProblem> ReplaceFileBytes(const std::wstring& path,
                                            std::string_view bytes) noexcept {
    try {
        return ReplaceUnguarded(path, bytes);
    } catch (const std::bad_alloc&) {
        return FileProblem{TextOrNothing(L"There is not enough memory to write the file.")};
    }
}

}  // namespace workbook
