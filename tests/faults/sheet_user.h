// Uses a modal property sheet from inside its own message loop, without any clock: a posted message
// looks for the sheet, and comes again as long as one is open.
#pragma once

#include <windows.h>

#include <functional>

namespace kortest {

class SheetUser {
public:
    SheetUser();
    ~SheetUser();
    SheetUser(const SheetUser&) = delete;
    SheetUser& operator=(const SheetUser&) = delete;

    // Does `open`, which may bring a sheet; `use` runs once while it is up. A sheet that stays open
    // is cancelled after a while, which fails the second result.
    struct Outcome {
        bool wasUp;
        bool wasLeftOpen;
    };
    Outcome run(const std::function<void()>& open, const std::function<void(HWND sheet)>& use);

private:
    static LRESULT CALLBACK procedure(HWND window, UINT message, WPARAM wParam, LPARAM lParam);
    void step();

    HWND window_;
    std::function<void(HWND)> use_;
    Outcome outcome_ = {};
    int steps_ = 0;
};

}  // namespace kortest
