// Acts inside a message that the system sends to somebody else's window, as a host does that has
// subclassed it.
#pragma once

#include <windows.h>

#include <functional>

namespace kortest {

// Replaces a window's procedure for its own life or the window's. One for each window.
class MessageHook {
public:
    using Action = std::function<void(WPARAM wParam, LPARAM lParam)>;

    explicit MessageHook(HWND window);
    ~MessageHook();
    MessageHook(const MessageHook&) = delete;
    MessageHook& operator=(const MessageHook&) = delete;

    // Before the window sees the message for the next time, once.
    void before(UINT message, Action action);

    // Whether the last action has run.
    bool hasActed() const { return !action_; }

private:
    static LRESULT CALLBACK procedure(HWND window, UINT message, WPARAM wParam, LPARAM lParam);

    HWND window_;
    WNDPROC original_;
    UINT message_ = 0;
    Action action_;
};

}  // namespace kortest
