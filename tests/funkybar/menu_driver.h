// Acts in a menu that the library has opened, and closes it if nobody does.
#pragma once

#include <windows.h>

#include <functional>

namespace kortest {

// One at a time. A timer of the thread looks for the menu's window, which runs inside the menu's
// own message loop.
class MenuDriver {
public:
    // `whenOpen` is called once, soon after the menu has been shown.
    explicit MenuDriver(std::function<void(HWND popup)> whenOpen);
    ~MenuDriver();
    MenuDriver(const MenuDriver&) = delete;
    MenuDriver& operator=(const MenuDriver&) = delete;

    bool wasOpen() const { return wasOpen_; }

    // After three seconds the driver ended the menu itself.
    bool gaveUp() const { return gaveUp_; }

private:
    static void CALLBACK tick(HWND window, UINT message, UINT_PTR id, DWORD time);
    void look();

    std::function<void(HWND popup)> whenOpen_;
    UINT_PTR timer_;
    DWORD begin_;
    bool wasOpen_ = false;
    bool gaveUp_ = false;
};

HWND OpenPopup();  // the window of this thread's visible popup menu, or null
HMENU MenuOf(HWND popup);

// Posts key presses to a window, for the menu's loop to take.
void PostKeys(HWND window, std::initializer_list<WPARAM> keys);

}  // namespace kortest
