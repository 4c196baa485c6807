#include "faults/sheet_user.h"

#include <commctrl.h>

#include <cwchar>
#include <prsht.h>

namespace kortest {
namespace {

constexpr wchar_t kClass[] = L"sheet user";
constexpr UINT kLook = WM_APP;
constexpr int kMostSteps = 200;

BOOL CALLBACK TakeSheet(HWND window, LPARAM found) {
    wchar_t name[16] = {};
    GetClassNameW(window, name, 16);
    if (std::wcscmp(name, L"#32770") != 0) return TRUE;
    if (!FindWindowExW(window, nullptr, WC_TABCONTROLW, nullptr)) return TRUE;
    *reinterpret_cast<HWND*>(found) = window;
    return FALSE;
}

HWND OpenSheet() {
    HWND sheet = nullptr;
    EnumThreadWindows(GetCurrentThreadId(), TakeSheet, reinterpret_cast<LPARAM>(&sheet));
    return sheet;
}

}  // namespace

SheetUser::SheetUser() {
    WNDCLASSW userClass{};
    userClass.lpfnWndProc = procedure;
    userClass.hInstance = GetModuleHandleW(nullptr);
    userClass.lpszClassName = kClass;
    RegisterClassW(&userClass);  // refused from the second time on
    window_ = CreateWindowExW(0, kClass, L"", WS_POPUP, 0, 0, 0, 0, nullptr, nullptr,
                              userClass.hInstance, nullptr);
    SetWindowLongPtrW(window_, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(this));
}

SheetUser::~SheetUser() { DestroyWindow(window_); }

SheetUser::Outcome SheetUser::run(const std::function<void()>& open,
                                  const std::function<void(HWND sheet)>& use) {
    use_ = use;
    PostMessageW(window_, kLook, 0, 0);
    open();
    return outcome_;
}

LRESULT CALLBACK SheetUser::procedure(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    if (message != kLook) return DefWindowProcW(window, message, wParam, lParam);
    reinterpret_cast<SheetUser*>(GetWindowLongPtrW(window, GWLP_USERDATA))->step();
    return 0;
}

void SheetUser::step() {
    const HWND sheet = OpenSheet();
    if (!sheet) return;
    if (!outcome_.wasUp) {
        outcome_.wasUp = true;
        use_(sheet);
    } else if (++steps_ == kMostSteps) {
        outcome_.wasLeftOpen = true;
        PropSheet_PressButton(sheet, PSBTN_CANCEL);
    } else if (steps_ > 2 * kMostSteps) {
        return;
    }
    PostMessageW(window_, kLook, 0, 0);
}

}  // namespace kortest
