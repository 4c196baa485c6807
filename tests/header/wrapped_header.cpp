#include "wrapped_header.h"

#include <utility>

namespace kortest {
namespace {

constexpr wchar_t kWrappedClass[] = L"wrapped header";

Interceptor currentInterceptor;
WNDPROC libraryProc;

LRESULT CALLBACK WrappedProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    const auto passOn = [](HWND w, UINT m, WPARAM wp, LPARAM lp) {
        return CallWindowProcW(libraryProc, w, m, wp, lp);
    };
    return currentInterceptor(window, message, wParam, lParam, passOn);
}

}  // namespace

HWND CreateWrappedHeader(HWND parent, DWORD style, int width, int height, Interceptor interceptor) {
    HINSTANCE instance = GetModuleHandleW(nullptr);
    WNDCLASSW wrapped{};
    if (!GetClassInfoW(instance, KORHEADER_CLASS, &wrapped)) return nullptr;
    libraryProc = wrapped.lpfnWndProc;
    currentInterceptor = std::move(interceptor);
    wrapped.lpfnWndProc = WrappedProc;
    wrapped.lpszClassName = kWrappedClass;
    RegisterClassW(&wrapped);
    return CreateWindowExW(0, kWrappedClass, L"", WS_CHILD | WS_VISIBLE | style, 0, 0, width,
                           height, parent, nullptr, instance, nullptr);
}

}  // namespace kortest
