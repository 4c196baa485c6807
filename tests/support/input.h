// Mouse and keyboard as messages to one window.
#pragma once

#include <windows.h>

#include <string>

namespace kortest {

// Client coordinates; negative ones wrap as the system's do.
LRESULT PressAt(HWND window, int x, int y);
LRESULT MoveTo(HWND window, int x, int y);
LRESULT ReleaseAt(HWND window, int x, int y);
void ClickAt(HWND window, int x, int y);

// WM_KEYDOWN and WM_CHAR. A key press has lParam 1.
LRESULT PressKey(HWND window, WPARAM key);
LRESULT TypeCharacter(HWND window, wchar_t character);

std::wstring TextOf(HWND window);

// While it lives GetKeyState tells that the key is down.
class KeyHeld {
public:
    explicit KeyHeld(int virtualKey);
    ~KeyHeld();
    KeyHeld(const KeyHeld&) = delete;
    KeyHeld& operator=(const KeyHeld&) = delete;

private:
    int key_;
};

}  // namespace kortest
