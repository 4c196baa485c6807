// The two DLLs that stand in for Windows CE's print modules on a desktop. What they do together
// with a printer is seen in tests/e2e/test_printing.py.
#include "platform/print_dialog.h"

#include <gtest/gtest.h>

#include <cstring>

namespace kortest {
namespace {

int dialogs = 0;

// Cancels whatever comes up: the print dialog, or the message that there is no printer.
LRESULT CALLBACK CancelDialogs(int code, WPARAM window, LPARAM data) {
    wchar_t name[16]{};
    if (code == HCBT_ACTIVATE) GetClassNameW(reinterpret_cast<HWND>(window), name, 16);
    if (std::wcscmp(name, L"#32770") == 0) {
        ++dialogs;
        PostMessageW(reinterpret_cast<HWND>(window), WM_COMMAND, IDCANCEL, 0);
    }
    return CallNextHookEx(nullptr, code, window, data);
}

class PrintCompanions : public ::testing::Test {
protected:
    PrintCompanions()
        : dialogModule(LoadLibraryW(kor::kPrintDialogModule)),
          jobModule(LoadLibraryW(kor::kPrintJobModule)),
          hook_(SetWindowsHookExW(WH_CBT, CancelDialogs, nullptr, GetCurrentThreadId())) {}
    ~PrintCompanions() override { UnhookWindowsHookEx(hook_); }

    BOOL ask(kor::PrintDialogRecord* record) const {
        void* address = reinterpret_cast<void*>(GetProcAddress(dialogModule, "PrintDlg"));
        return reinterpret_cast<kor::PrintDialogProcedure>(address)(record);
    }

    static void expectUnchanged(const kor::PrintDialogRecord& expected,
                                const kor::PrintDialogRecord& record) {
        EXPECT_EQ(std::memcmp(&expected, &record, sizeof record), 0);
    }

    HMODULE dialogModule;
    HMODULE jobModule;

private:
    HHOOK hook_;
};

TEST_F(PrintCompanions, HaveTheirFunctionsByPlainNames) {
    ASSERT_NE(dialogModule, nullptr);
    ASSERT_NE(jobModule, nullptr);
    EXPECT_NE(GetProcAddress(dialogModule, "PrintDlg"), nullptr);
    for (const HMODULE module : {dialogModule, jobModule})
        EXPECT_NE(FindResourceW(module, MAKEINTRESOURCEW(1), RT_VERSION), nullptr);
}

TEST_F(PrintCompanions, JobFunctionsAreTheSystemsOwn) {
    const HMODULE system = GetModuleHandleW(L"gdi32.dll");
    for (const char* name : {"StartPage", "EndPage", "EndDoc"})
        EXPECT_EQ(GetProcAddress(jobModule, name), GetProcAddress(system, name)) << name;
    EXPECT_EQ(GetProcAddress(jobModule, "StartDoc"), GetProcAddress(system, "StartDocW"));
    EXPECT_NE(GetProcAddress(jobModule, "StartDoc"), nullptr);
}

TEST_F(PrintCompanions, DialogRefusesRecordsThatAreNotItsOwn) {
    EXPECT_FALSE(ask(nullptr));
    constexpr DWORD kRight = sizeof(kor::PrintDialogRecord);
    for (const DWORD size : {DWORD{0}, DWORD{20}, kRight - 1, kRight + 1}) {
        kor::PrintDialogRecord record{};
        record.size = size;
        const kor::PrintDialogRecord before = record;
        EXPECT_FALSE(ask(&record)) << size;
        expectUnchanged(before, record);
    }
    EXPECT_EQ(dialogs, 0);
}

TEST_F(PrintCompanions, CancelledDialogLeavesTheRecordAsItIs) {
    kor::PrintDialogRecord record{};
    record.size = sizeof record;
    const kor::PrintDialogRecord before = record;
    EXPECT_FALSE(ask(&record));
    EXPECT_GT(dialogs, 0) << "the dialog, or the message that there is no printer";
    expectUnchanged(before, record);
}

}  // namespace
}  // namespace kortest
