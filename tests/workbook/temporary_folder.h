// A folder of a test's own, deleted with its files at the end.
#ifndef TESTS_WORKBOOK_TEMPORARY_FOLDER_H
#define TESTS_WORKBOOK_TEMPORARY_FOLDER_H

#include <windows.h>

#include <algorithm>
#include <string>
#include <string_view>
#include <vector>

namespace workbook {

class TemporaryFolder {
public:
    TemporaryFolder() {
        wchar_t temporary[MAX_PATH + 1] = L"";
        GetTempPathW(MAX_PATH, temporary);
        path_ = temporary + std::wstring(L"workbook-test-") +
                std::to_wstring(GetCurrentProcessId()) + L"-" + std::to_wstring(GetTickCount());
        CreateDirectoryW(path_.c_str(), nullptr);
    }
    ~TemporaryFolder() {
        for (const std::wstring& name : names()) {
            SetFileAttributesW(at(name).c_str(), FILE_ATTRIBUTE_NORMAL);
            if (!DeleteFileW(at(name).c_str())) RemoveDirectoryW(at(name).c_str());
        }
        RemoveDirectoryW(path_.c_str());
    }
    TemporaryFolder(const TemporaryFolder&) = delete;
    TemporaryFolder& operator=(const TemporaryFolder&) = delete;

    std::wstring at(const std::wstring& name) const { return path_ + L"\\" + name; }

    // What is in it, in alphabetical order.
    std::vector<std::wstring> names() const {
        std::vector<std::wstring> found;
        WIN32_FIND_DATAW data;
        const HANDLE search = FindFirstFileW(at(L"*").c_str(), &data);
        if (search == INVALID_HANDLE_VALUE) return found;
        do {
            const std::wstring name = data.cFileName;
            if (name != L"." && name != L"..") found.push_back(name);
        } while (FindNextFileW(search, &data));
        FindClose(search);
        std::ranges::sort(found);
        return found;
    }

    // Written and read past the code under test.
    void put(const std::wstring& name, std::string_view bytes) const {
        const HANDLE file = CreateFileW(at(name).c_str(), GENERIC_WRITE, 0, nullptr, CREATE_ALWAYS,
                                        FILE_ATTRIBUTE_NORMAL, nullptr);
        DWORD written = 0;
        WriteFile(file, bytes.data(), static_cast<DWORD>(bytes.size()), &written, nullptr);
        CloseHandle(file);
    }
    std::string get(const std::wstring& name) const {
        const HANDLE file = CreateFileW(at(name).c_str(), GENERIC_READ,
                                        FILE_SHARE_READ | FILE_SHARE_WRITE | FILE_SHARE_DELETE,
                                        nullptr, OPEN_EXISTING, 0, nullptr);
        if (file == INVALID_HANDLE_VALUE) return "(no file)";
        std::string bytes(GetFileSize(file, nullptr), '\0');
        DWORD read = 0;
        ReadFile(file, bytes.data(), static_cast<DWORD>(bytes.size()), &read, nullptr);
        CloseHandle(file);
        return bytes;
    }

private:
    std::wstring path_;
};

}  // namespace workbook

#endif
