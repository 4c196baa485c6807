// Where a desktop looks for the two print modules: beside the program, then beside the library, and
// nowhere else. A file of such a name in the current folder, which may be one that a document came
// in, or on the path is left alone.
#include <gtest/gtest.h>

#include <windows.h>

#include <array>
#include <sstream>
#include <string>

namespace kortest {
namespace {

constexpr DWORD kPatienceMilliseconds = 30000;
constexpr std::array<const wchar_t*, 2> kModules = {L"commdlg.dll", L"wingdi.dll"};

std::wstring FolderOfProgram() {
    wchar_t path[MAX_PATH] = L"";
    GetModuleFileNameW(nullptr, path, MAX_PATH);
    const std::wstring whole = path;
    return whole.substr(0, whole.find_last_of(L'\\') + 1);
}

// A folder below the temporary one, with its name's end; gone with its files at the end.
class Folder {
public:
    explicit Folder(const std::wstring& name) {
        wchar_t temporary[MAX_PATH] = L"";
        GetTempPathW(MAX_PATH, temporary);
        path_ = temporary + (L"print-modules-" + std::to_wstring(GetCurrentProcessId()) + L"-") +
                name + L"\\";
        CreateDirectoryW(path_.c_str(), nullptr);
    }
    ~Folder() {
        WIN32_FIND_DATAW found{};
        const HANDLE search = FindFirstFileW((path_ + L"*").c_str(), &found);
        do DeleteFileW((path_ + found.cFileName).c_str());
        while (FindNextFileW(search, &found));
        FindClose(search);
        RemoveDirectoryW(path_.c_str());
    }
    Folder(const Folder&) = delete;
    Folder& operator=(const Folder&) = delete;

    const std::wstring& path() const { return path_; }

    void take(const std::wstring& file) const {
        ASSERT_TRUE(CopyFileW((FolderOfProgram() + file).c_str(), (path_ + file).c_str(), FALSE));
    }
    void takeModules() const {
        for (const wchar_t* module : kModules) take(module);
    }

private:
    std::wstring path_;
};

class PrintModuleSearch : public ::testing::Test {
protected:
    PrintModuleSearch() {
        program.take(L"module_host.exe");
        library.take(L"korcontrols.dll");
        current.takeModules();
        onPath.takeModules();
    }

    // The modules that the host process has at its end, in the words of module_host.
    std::wstring run() const {
        SetEnvironmentVariableW(L"PATH", onPath.path().c_str());
        const std::wstring output = current.path() + L"output.txt";
        SECURITY_ATTRIBUTES inherited = {sizeof inherited, nullptr, TRUE};
        const HANDLE file = CreateFileW(output.c_str(), GENERIC_READ | GENERIC_WRITE, 0, &inherited,
                                        CREATE_ALWAYS, FILE_ATTRIBUTE_NORMAL, nullptr);
        std::wstring command = L"\"" + program.path() + L"module_host.exe\" \"" + library.path() +
                               L"korcontrols.dll\"";
        STARTUPINFOW start{};
        start.cb = sizeof start;
        start.dwFlags = STARTF_USESTDHANDLES;
        start.hStdOutput = file;
        PROCESS_INFORMATION process{};
        EXPECT_TRUE(CreateProcessW(nullptr, command.data(), nullptr, nullptr, TRUE, 0, nullptr,
                                   current.path().c_str(), &start, &process));
        EXPECT_EQ(WaitForSingleObject(process.hProcess, kPatienceMilliseconds), WAIT_OBJECT_0);
        DWORD status = 99;
        GetExitCodeProcess(process.hProcess, &status);
        EXPECT_EQ(status, 0u);
        CloseHandle(process.hProcess);
        CloseHandle(process.hThread);
        return textOf(file);
    }

    std::wstring both(const Folder& folder) const {
        return folder.path() + kModules[0] + L"\n" + folder.path() + kModules[1] + L"\n1\n";
    }

    Folder program{L"program"};
    Folder library{L"library"};
    Folder current{L"current"};
    Folder onPath{L"path"};

private:
    static std::wstring textOf(HANDLE file) {
        std::array<char, 2000> bytes{};
        DWORD size = 0;
        SetFilePointer(file, 0, nullptr, FILE_BEGIN);
        ReadFile(file, bytes.data(), static_cast<DWORD>(bytes.size()), &size, nullptr);
        CloseHandle(file);
        std::wstring text;
        for (DWORD i = 0; i < size; ++i) {
            if (bytes[i] != '\r') text += static_cast<wchar_t>(bytes[i]);
        }
        return text;
    }
};

TEST_F(PrintModuleSearch, LeavesTheCurrentFolderAndThePathAlone) {
    EXPECT_EQ(run(), L"none\nnone\n0\n");
}

TEST_F(PrintModuleSearch, FindsThemBesideTheLibrary) {
    library.takeModules();
    EXPECT_EQ(run(), both(library));
}

TEST_F(PrintModuleSearch, PrefersThoseBesideTheProgram) {
    library.takeModules();
    program.takeModules();
    EXPECT_EQ(run(), both(program));
}

}  // namespace
}  // namespace kortest
