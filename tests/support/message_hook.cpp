#include "support/message_hook.h"

#include <utility>

namespace kortest {

namespace {

constexpr wchar_t kHookProperty[] = L"message hook";

}  // namespace

MessageHook::MessageHook(HWND window) : window_(window) {
    SetPropW(window, kHookProperty, this);
    original_ = reinterpret_cast<WNDPROC>(
        SetWindowLongPtrW(window, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(procedure)));
}

MessageHook::~MessageHook() {
    if (!IsWindow(window_)) return;
    RemovePropW(window_, kHookProperty);
    SetWindowLongPtrW(window_, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(original_));
}

void MessageHook::before(UINT message, Action action) {
    message_ = message;
    action_ = std::move(action);
}

LRESULT CALLBACK MessageHook::procedure(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    auto* hook = static_cast<MessageHook*>(GetPropW(window, kHookProperty));
    const WNDPROC original = hook->original_;
    if (message == hook->message_ && hook->action_) {
        const Action action = std::exchange(hook->action_, nullptr);
        action(wParam, lParam);
    }
    if (message == WM_NCDESTROY) RemovePropW(window, kHookProperty);
    return CallWindowProcW(original, window, message, wParam, lParam);
}

}  // namespace kortest
