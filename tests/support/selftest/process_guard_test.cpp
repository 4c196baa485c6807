// The guard of a whole process, seen from outside: what a program says that misuses the library's
// heap.
#include <gtest/gtest.h>

#include <windows.h>

#include <cstdlib>
#include <memory>
#include <string>

namespace kortest {
namespace {

struct CloseHandleOf {
    void operator()(HANDLE handle) const { CloseHandle(handle); }
};
using Handle = std::unique_ptr<void, CloseHandleOf>;

struct Outcome {
    DWORD status;
    std::string text;

    bool says(const std::string& words) const { return text.find(words) != std::string::npos; }
};

Handle EmptyFile() {
    wchar_t folder[MAX_PATH]{}, name[MAX_PATH]{};
    GetTempPathW(MAX_PATH, folder);
    GetTempFileNameW(folder, L"kor", 0, name);
    SECURITY_ATTRIBUTES inherited{sizeof inherited, nullptr, TRUE};
    return Handle(CreateFileW(name, GENERIC_READ | GENERIC_WRITE, FILE_SHARE_WRITE, &inherited,
                              CREATE_ALWAYS, FILE_FLAG_DELETE_ON_CLOSE, nullptr));
}

std::string ContentsOf(HANDLE file) {
    std::string text(GetFileSize(file, nullptr), '\0');
    DWORD read = 0;
    SetFilePointer(file, 0, nullptr, FILE_BEGIN);
    ReadFile(file, text.data(), static_cast<DWORD>(text.size()), &read, nullptr);
    text.resize(read);
    return text;
}

std::wstring BesideThisProgram(const wchar_t* name) {
    wchar_t path[MAX_PATH]{};
    GetModuleFileNameW(nullptr, path, MAX_PATH);
    const std::wstring own = path;
    return own.substr(0, own.rfind(L'\\') + 1) + name;
}

// What the program does with KORCONTROLS_GUARD set to `guard`, or without it.
Outcome OutcomeOf(const wchar_t* test, const wchar_t* guard) {
    const Handle output = EmptyFile();
    std::wstring command =
        L"\"" + BesideThisProgram(L"guard_victim.exe") + L"\" --gtest_filter=" + test;
    STARTUPINFOW startup{};
    startup.cb = sizeof startup;
    startup.dwFlags = STARTF_USESTDHANDLES;
    startup.hStdOutput = startup.hStdError = output.get();
    PROCESS_INFORMATION process{};
    SetEnvironmentVariableW(L"KORCONTROLS_GUARD", guard);
    if (!CreateProcessW(nullptr, command.data(), nullptr, nullptr, TRUE, 0, nullptr, nullptr,
                        &startup, &process)) {
        ADD_FAILURE() << "guard_victim.exe does not start: " << GetLastError();
        return {};
    }
    const Handle thread(process.hThread), program(process.hProcess);
    DWORD status = 0;
    WaitForSingleObject(program.get(), INFINITE);
    GetExitCodeProcess(program.get(), &status);
    return {status, ContentsOf(output.get())};
}

TEST(ProcessGuard, LetsProperUsePass) {
    for (const wchar_t* side : {L"end", L"begin"}) {
        const Outcome outcome = OutcomeOf(L"Victim.LeavesItAlone", side);
        EXPECT_EQ(outcome.status, 0u) << outcome.text;
        EXPECT_TRUE(outcome.says("1 test from 1 test suite ran")) << outcome.text;
    }
}

TEST(ProcessGuard, FailsATestForAWriteBehindABlock) {
    const Outcome outcome = OutcomeOf(L"Victim.WritesBehindABlock", L"end");
    EXPECT_EQ(outcome.status, 1u);
    EXPECT_TRUE(outcome.says("overrun: block 1 of 16 bytes, write at offset 16")) << outcome.text;
    EXPECT_TRUE(outcome.says("[  FAILED  ] Victim.WritesBehindABlock")) << outcome.text;
}

TEST(ProcessGuard, FailsATestForAWriteBeforeABlock) {
    const Outcome outcome = OutcomeOf(L"Victim.WritesBeforeABlock", L"begin");
    EXPECT_EQ(outcome.status, 1u);
    EXPECT_TRUE(outcome.says("underrun: block 1 of 16 bytes, write at offset -1")) << outcome.text;
}

TEST(ProcessGuard, FailsATestForAWriteToAFreedBlock) {
    for (const wchar_t* side : {L"end", L"begin"}) {
        const Outcome outcome = OutcomeOf(L"Victim.WritesToAFreedBlock", side);
        EXPECT_EQ(outcome.status, 1u);
        EXPECT_TRUE(outcome.says("use after free: block 1 of 16 bytes")) << outcome.text;
    }
}

TEST(ProcessGuard, LiesBelowATestsOwnSpy) {
    const Outcome outcome = OutcomeOf(L"Victim.WritesBehindABlockThatASpySaw", L"end");
    EXPECT_EQ(outcome.status, 1u);
    EXPECT_TRUE(outcome.says("overrun: block 1 of 16 bytes")) << outcome.text;
    EXPECT_FALSE(outcome.says("spy.count")) << outcome.text;
}

TEST(ProcessGuard, SeesWhatComesWithTheFixturesEnd) {
    const Outcome outcome = OutcomeOf(L"LateVictim.WritesBehindABlock", L"end");
    EXPECT_EQ(outcome.status, 1u);
    EXPECT_TRUE(outcome.says("overrun: block 1 of 16 bytes")) << outcome.text;
}

TEST(ProcessGuard, IsNotThereUnasked) {
    EXPECT_EQ(OutcomeOf(L"Victim.GetsABlockInsideAPage", nullptr).status, 0u);
    EXPECT_EQ(OutcomeOf(L"Victim.GetsABlockInsideAPage", L"end").status, 1u);
}

TEST(ProcessGuard, RefusesAnotherWord) {
    const Outcome outcome = OutcomeOf(L"Victim.LeavesItAlone", L"middle");
    EXPECT_EQ(outcome.status, static_cast<DWORD>(EXIT_FAILURE));
    EXPECT_TRUE(outcome.says("KORCONTROLS_GUARD is \"middle\"")) << outcome.text;
}

TEST(ProcessGuard, SaysWhereATrapWas) {
    const Outcome outcome = OutcomeOf(L"Victim.Traps", nullptr);
    EXPECT_NE(outcome.status, 0u);
    EXPECT_TRUE(outcome.says("trapped at base + 0x")) << outcome.text;
}

}  // namespace
}  // namespace kortest
