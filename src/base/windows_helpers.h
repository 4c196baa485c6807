// Small helpers around windows and messages that hold on every platform.
#pragma once

#include "numbers/shapes.h"
#include "platform/platform.h"

namespace kor {

// The client rectangle, empty when there is no window.
inline RECT ClientRectOf(HWND hwnd) {
    RECT client = {};
    if (hwnd) GetClientRect(hwnd, &client);
    return client;
}

// Replaces a window's procedure; the result is the one before, null when the window is null.
inline WNDPROC Subclass(HWND hwnd, WNDPROC procedure) {
    if (!hwnd) return nullptr;
    return reinterpret_cast<WNDPROC>(
        SetWindowLongPtrW(hwnd, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(procedure)));
}

// Passes a message on to the procedure that a subclass replaced.
inline LRESULT PassOn(WNDPROC replaced, HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    return replaced ? CallWindowProcW(replaced, hwnd, message, wParam, lParam)
                    : DefWindowProcW(hwnd, message, wParam, lParam);
}

// Invalidates an area without erasing. Without a window nothing happens; the platform would repaint
// every window on the screen.
inline void InvalidateArea(HWND hwnd, const RECT& area) {
    if (hwnd) InvalidateRect(hwnd, &area, FALSE);
}

// An array of points for the platform's calls.
static_assert(sizeof(Point) == sizeof(POINT) && offsetof(Point, y) == offsetof(POINT, y));
inline POINT* PlatformPoints(Point* points) { return reinterpret_cast<POINT*>(points); }

// Two 16-bit words as one message parameter; what does not fit is cut off.
constexpr LPARAM WordPair(int lowWord, int highWord) {
    return static_cast<LPARAM>(static_cast<uint32_t>(static_cast<uint16_t>(lowWord)) |
                               static_cast<uint32_t>(static_cast<uint16_t>(highWord)) << 16);
}

// The words of a message parameter. A pointer left of or above the window has a negative position,
// which the unsigned reading turns into a very large one.
constexpr int LowWord(WPARAM parameter) { return static_cast<uint16_t>(parameter); }
constexpr int HighWord(WPARAM parameter) { return static_cast<uint16_t>(parameter >> 16); }
constexpr int SignedLowWord(LPARAM parameter) { return static_cast<int16_t>(parameter); }
constexpr int SignedHighWord(LPARAM parameter) { return static_cast<int16_t>(parameter >> 16); }

}  // namespace kor
