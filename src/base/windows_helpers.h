// Small helpers for windows and messages, the same on every platform.
#pragma once

#include "numbers/shapes.h"
#include "platform/platform.h"

namespace kor {

// The client rectangle; empty for a null window.
inline RECT ClientRectOf(HWND hwnd) {
    RECT client = {};
    if (hwnd) GetClientRect(hwnd, &client);
    return client;
}

// Replaces a window's procedure. Returns the previous one, or null for a null window.
inline WNDPROC Subclass(HWND hwnd, WNDPROC procedure) {
    if (!hwnd) return nullptr;
    return reinterpret_cast<WNDPROC>(
        SetWindowLongPtrW(hwnd, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(procedure)));
}

// Passes a message on to the procedure that a subclass replaced, or to DefWindowProcW when that is
// null.
inline LRESULT PassOn(WNDPROC replaced, HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    return replaced ? CallWindowProcW(replaced, hwnd, message, wParam, lParam)
                    : DefWindowProcW(hwnd, message, wParam, lParam);
}

// Invalidates an area without erasing. A null window is ignored: the platform would repaint every
// window on the screen.
inline void InvalidateArea(HWND hwnd, const RECT& area) {
    if (hwnd) InvalidateRect(hwnd, &area, FALSE);
}

// An array of points as the platform's calls take it.
static_assert(sizeof(Point) == sizeof(POINT) && offsetof(Point, y) == offsetof(POINT, y));
inline POINT* PlatformPoints(Point* points) { return reinterpret_cast<POINT*>(points); }

// Two words as one message parameter; each value is truncated to 16 bits.
constexpr LPARAM WordPair(int lowWord, int highWord) {
    return static_cast<LPARAM>(static_cast<uint32_t>(static_cast<uint16_t>(lowWord)) |
                               static_cast<uint32_t>(static_cast<uint16_t>(highWord)) << 16);
}

// The words of a message parameter. Left of or above the window a pointer position is negative;
// read unsigned, it becomes very large.
constexpr int LowWord(WPARAM parameter) { return static_cast<uint16_t>(parameter); }
constexpr int HighWord(WPARAM parameter) { return static_cast<uint16_t>(parameter >> 16); }
constexpr int SignedLowWord(LPARAM parameter) { return static_cast<int16_t>(parameter); }
constexpr int SignedHighWord(LPARAM parameter) { return static_cast<int16_t>(parameter >> 16); }

}  // namespace kor
