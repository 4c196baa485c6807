#include "funkybar/menu_driver.h"

#include <utility>

namespace kortest {
namespace {

constexpr DWORD kPatience = 3000;
constexpr UINT kGetMenuHandle = 0x01E1;  // MN_GETHMENU

MenuDriver* driver = nullptr;

BOOL CALLBACK TakePopup(HWND window, LPARAM found) {
    wchar_t name[16]{};
    GetClassNameW(window, name, 16);
    if (lstrcmpW(name, L"#32768") != 0 || !IsWindowVisible(window)) return TRUE;
    *reinterpret_cast<HWND*>(found) = window;
    return FALSE;
}

}  // namespace

HWND OpenPopup() {
    HWND popup = nullptr;
    EnumThreadWindows(GetCurrentThreadId(), TakePopup, reinterpret_cast<LPARAM>(&popup));
    return popup;
}

HMENU MenuOf(HWND popup) {
    return reinterpret_cast<HMENU>(SendMessageW(popup, kGetMenuHandle, 0, 0));
}

void PostKeys(HWND window, std::initializer_list<WPARAM> keys) {
    for (const WPARAM key : keys) PostMessageW(window, WM_KEYDOWN, key, 1);
}

MenuDriver::MenuDriver(std::function<void(HWND popup)> whenOpen)
    : whenOpen_(std::move(whenOpen)), timer_(SetTimer(nullptr, 0, 10, tick)),
      begin_(GetTickCount()) {
    driver = this;
}

MenuDriver::~MenuDriver() {
    KillTimer(nullptr, timer_);
    driver = nullptr;
}

void CALLBACK MenuDriver::tick(HWND, UINT, UINT_PTR, DWORD) {
    if (driver) driver->look();
}

void MenuDriver::look() {
    if (GetTickCount() - begin_ > kPatience) {
        gaveUp_ = true;
        EndMenu();
        return;
    }
    if (wasOpen_) return;
    if (HWND popup = OpenPopup()) {
        wasOpen_ = true;
        whenOpen_(popup);
    }
}

}  // namespace kortest
