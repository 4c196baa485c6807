#include "graph/tools/sheet_driver.h"

#include "support/input.h"

#include <commctrl.h>
#include <gtest/gtest.h>
#include <prsht.h>

namespace kortest {
namespace {

constexpr UINT kStepMilliseconds = 10;
constexpr ULONGLONG kPatienceMilliseconds = 30000;

SheetDriver* running = nullptr;

bool IsDialog(HWND window) {
    wchar_t name[16] = {};
    GetClassNameW(window, name, 16);
    return std::wstring(name) == L"#32770" && IsWindowVisible(window);
}

BOOL CALLBACK AddDialog(HWND window, LPARAM list) {
    if (IsDialog(window)) reinterpret_cast<std::vector<HWND>*>(list)->push_back(window);
    return TRUE;
}

std::vector<HWND> Dialogs() {
    std::vector<HWND> found;
    EnumThreadWindows(GetCurrentThreadId(), AddDialog, reinterpret_cast<LPARAM>(&found));
    return found;
}

BOOL CALLBACK AddButton(HWND window, LPARAM list) {
    wchar_t name[16] = {};
    GetClassNameW(window, name, 16);
    if (std::wstring(name) == L"Button" && IsWindowVisible(window))
        reinterpret_cast<std::vector<int>*>(list)->push_back(GetDlgCtrlID(window));
    return TRUE;
}

bool IsSheet(HWND dialog) { return FindWindowExW(dialog, nullptr, WC_TABCONTROLW, nullptr); }

std::wstring LongestStaticText(HWND dialog) {
    std::wstring longest;
    for (HWND label = nullptr;
         (label = FindWindowExW(dialog, label, L"Static", nullptr)) != nullptr;) {
        if (TextOf(label).size() > longest.size()) longest = TextOf(label);
    }
    return longest;
}

}  // namespace

SheetDriver::SheetDriver() { running = this; }

SheetDriver::~SheetDriver() { running = nullptr; }

void SheetDriver::run(const std::function<void()>& open,
                      const std::function<void(HWND sheet)>& use) {
    use_ = use;
    wasUp_ = false;
    deadline_ = GetTickCount64() + kPatienceMilliseconds;
    timer_ = SetTimer(nullptr, 0, kStepMilliseconds, &SheetDriver::onTimer);
    ASSERT_NE(timer_, 0u);
    open();
    KillTimer(nullptr, timer_);
}

void CALLBACK SheetDriver::onTimer(HWND, UINT, UINT_PTR, DWORD) {
    if (running) running->step();
}

void SheetDriver::step() {
    const bool isLate = GetTickCount64() > deadline_;
    for (const HWND dialog : Dialogs()) {
        if (isLate) {
            ADD_FAILURE() << "a dialog was left open";
            PostMessageW(dialog, WM_COMMAND, IDCANCEL, 0);
        } else if (!IsSheet(dialog)) {
            answer(dialog);
        } else if (!wasUp_) {
            wasUp_ = true;
            use_(dialog);
        }
    }
}

void SheetDriver::answer(HWND box) {
    if (!answered_.insert(box).second) return;
    BoxSeen seen{GetWindow(box, GW_OWNER), TextOf(box), LongestStaticText(box), {}};
    EnumChildWindows(box, AddButton, reinterpret_cast<LPARAM>(&seen.buttons));
    boxes_.push_back(seen);
    PostMessageW(box, WM_COMMAND, IDOK, 0);
}

HWND ShowPage(HWND sheet, int page) {
    PropSheet_SetCurSel(sheet, nullptr, page);
    const HWND window = PropSheet_IndexToHwnd(sheet, page);
    EXPECT_NE(window, nullptr) << "page " << page;
    return window;
}

void PressOk(HWND sheet) { PropSheet_PressButton(sheet, PSBTN_OK); }

void PressCancel(HWND sheet) { PropSheet_PressButton(sheet, PSBTN_CANCEL); }

void TypeInto(HWND page, int editId, const std::wstring& text) {
    const HWND edit = GetDlgItem(page, editId);
    ASSERT_NE(edit, nullptr) << editId;
    SendMessageW(edit, EM_SETSEL, 0, -1);
    SendMessageW(edit, WM_CHAR, L'\b', 0);
    for (const wchar_t character : text) TypeCharacter(edit, character);
}

std::wstring TextIn(HWND page, int controlId) { return TextOf(GetDlgItem(page, controlId)); }

void Choose(HWND page, int comboId, int item) {
    SendDlgItemMessageW(page, comboId, CB_SETCURSEL, static_cast<WPARAM>(item), 0);
}

int Chosen(HWND page, int comboId) {
    return static_cast<int>(SendDlgItemMessageW(page, comboId, CB_GETCURSEL, 0, 0));
}

std::vector<std::wstring> ItemsOf(HWND combo) {
    std::vector<std::wstring> items;
    const auto count = static_cast<int>(SendMessageW(combo, CB_GETCOUNT, 0, 0));
    for (int i = 0; i < count; ++i) {
        wchar_t text[64] = {};
        SendMessageW(combo, CB_GETLBTEXT, static_cast<WPARAM>(i), reinterpret_cast<LPARAM>(text));
        items.emplace_back(text);
    }
    return items;
}

}  // namespace kortest
