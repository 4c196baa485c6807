// A host may unload the library and load it again, if it unregisters the six classes in between.
#include <gtest/gtest.h>

#include <windows.h>

#include <string>

namespace kortest {
namespace {

constexpr DWORD kPatienceMilliseconds = 60000;

TEST(Reload, WorksWhenTheClassesAreUnregistered) {
    wchar_t path[MAX_PATH] = L"";
    GetModuleFileNameW(nullptr, path, MAX_PATH);
    const std::wstring whole = path;
    std::wstring command =
        L"\"" + whole.substr(0, whole.find_last_of(L'\\') + 1) + L"reload_host.exe\"";
    STARTUPINFOW start{};
    start.cb = sizeof start;
    PROCESS_INFORMATION process{};
    ASSERT_TRUE(CreateProcessW(nullptr, command.data(), nullptr, nullptr, FALSE, 0, nullptr,
                               nullptr, &start, &process));
    EXPECT_EQ(WaitForSingleObject(process.hProcess, kPatienceMilliseconds), WAIT_OBJECT_0);
    DWORD status = 0;
    EXPECT_TRUE(GetExitCodeProcess(process.hProcess, &status));
    EXPECT_EQ(status, 0u) << "a line of reload_host.cpp";
    CloseHandle(process.hProcess);
    CloseHandle(process.hThread);
}

}  // namespace
}  // namespace kortest
