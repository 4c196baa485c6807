#include "support/input.h"

namespace kortest {
namespace {

LPARAM MousePosition(int x, int y) {
    return MAKELPARAM(static_cast<WORD>(x), static_cast<WORD>(y));
}

void SetKeyDown(int virtualKey, bool isDown) {
    BYTE keys[256]{};
    GetKeyboardState(keys);
    keys[virtualKey] = isDown ? 0x80 : 0;
    SetKeyboardState(keys);
}

}  // namespace

LRESULT PressAt(HWND window, int x, int y) {
    return SendMessageW(window, WM_LBUTTONDOWN, MK_LBUTTON, MousePosition(x, y));
}

LRESULT MoveTo(HWND window, int x, int y) {
    return SendMessageW(window, WM_MOUSEMOVE, MK_LBUTTON, MousePosition(x, y));
}

LRESULT ReleaseAt(HWND window, int x, int y) {
    return SendMessageW(window, WM_LBUTTONUP, 0, MousePosition(x, y));
}

void ClickAt(HWND window, int x, int y) {
    PressAt(window, x, y);
    ReleaseAt(window, x, y);
}

LRESULT PressKey(HWND window, WPARAM key) { return SendMessageW(window, WM_KEYDOWN, key, 1); }

LRESULT TypeCharacter(HWND window, wchar_t character) {
    return SendMessageW(window, WM_CHAR, character, 1);
}

std::wstring TextOf(HWND window) {
    const auto length = SendMessageW(window, WM_GETTEXTLENGTH, 0, 0);
    std::wstring text(static_cast<size_t>(length) + 1, L'\0');
    const auto copied =
        SendMessageW(window, WM_GETTEXT, text.size(), reinterpret_cast<LPARAM>(text.data()));
    text.resize(static_cast<size_t>(copied));
    return text;
}

KeyHeld::KeyHeld(int virtualKey) : key_(virtualKey) { SetKeyDown(key_, true); }

KeyHeld::~KeyHeld() { SetKeyDown(key_, false); }

}  // namespace kortest
