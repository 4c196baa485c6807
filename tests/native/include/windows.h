// The platform's types and constants as far as the library's arithmetic needs them, for the machine
// that builds. Nothing here talks to a window; what cannot be left out ends the program.
#pragma once

#include <cstddef>
#include <cstdint>
#include <cstdio>
#include <cstdlib>
#include <cwchar>

#include <malloc.h>

#define __cdecl
#define WINAPI
#define CALLBACK
#define __inline inline

using BYTE = uint8_t;
using WORD = uint16_t;
using DWORD = uint32_t;
using UINT = uint32_t;
using INT = int32_t;
using LONG = int32_t;
using BOOL = int32_t;
using WCHAR = wchar_t;
using SIZE_T = size_t;
using LONG_PTR = intptr_t;
using ULONG_PTR = uintptr_t;
using WPARAM = uintptr_t;
using LPARAM = intptr_t;
using LRESULT = intptr_t;
using COLORREF = DWORD;
using LPCWSTR = const wchar_t*;
using LPWSTR = wchar_t*;

using HANDLE = void*;
using HGDIOBJ = void*;
using HLOCAL = void*;
using HINSTANCE = void*;
using HICON = void*;
using HWND = struct Window*;
using HDC = struct Dc*;
using HBITMAP = struct Bitmap*;
using HRGN = struct Region*;
using HPEN = struct Pen*;
using HBRUSH = struct Brush*;
using HFONT = struct Font*;

using WNDPROC = LRESULT (*)(HWND, UINT, WPARAM, LPARAM);

struct POINT {
    LONG x;
    LONG y;
};
struct SIZE {
    LONG cx;
    LONG cy;
};
struct RECT {
    LONG left;
    LONG top;
    LONG right;
    LONG bottom;
};
struct LOGFONTW {
    LONG lfHeight;
    LONG lfWidth;
};

constexpr int TRUE = 1;
constexpr int FALSE = 0;
constexpr UINT WM_NOTIFY = 0x004E;
constexpr UINT WM_USER = 0x0400;
constexpr UINT LMEM_FIXED = 0;
constexpr UINT LMEM_MOVEABLE = 2;
constexpr UINT LMEM_ZEROINIT = 0x40;
constexpr int PS_SOLID = 0;
constexpr int BITSPIXEL = 12;
constexpr int GWLP_USERDATA = -21;

constexpr COLORREF RGB(int red, int green, int blue) {
    return static_cast<COLORREF>(red | green << 8 | blue << 16);
}

// ---- The local heap: the machine's own, whose ends the sanitizer watches ----

inline HLOCAL LocalAlloc(UINT flags, SIZE_T size) {
    return flags & LMEM_ZEROINIT ? std::calloc(1, size) : std::malloc(size);
}
inline HLOCAL LocalReAlloc(HLOCAL block, SIZE_T size, UINT) { return std::realloc(block, size); }
inline HLOCAL LocalFree(HLOCAL block) {
    std::free(block);
    return nullptr;
}
inline SIZE_T LocalSize(HLOCAL block) { return malloc_usable_size(block); }

// ---- Objects: a record is made with pens, which nothing draws with ----

inline HPEN CreatePen(int, int, COLORREF) { return nullptr; }
inline BOOL DeleteObject(HGDIOBJ) { return TRUE; }

// What is given to records that want a window before they reckon.
inline HWND GetDesktopWindow() { return reinterpret_cast<HWND>(1); }

// ---- What only windows and drawing need ----

struct PAINTSTRUCT {
    RECT rcPaint;
};

constexpr UINT DT_LEFT = 0;
constexpr UINT DT_RIGHT = 2;
constexpr int NULL_BRUSH = 5;

[[noreturn]] inline void NoWindowsHere(const char* function) {
    std::fprintf(stderr, "%s: there are no windows here\n", function);
    std::abort();
}

#define KOR_NOT_HERE(Result, function)                                                             \
    template <typename... Arguments>                                                               \
    [[noreturn]] Result function(Arguments...) {                                                   \
        NoWindowsHere(#function);                                                                  \
    }

KOR_NOT_HERE(HDC, BeginPaint)
KOR_NOT_HERE(HDC, CreateCompatibleDC)
KOR_NOT_HERE(HFONT, CreateFontIndirectW)
KOR_NOT_HERE(BOOL, DeleteDC)
KOR_NOT_HERE(BOOL, Ellipse)
KOR_NOT_HERE(BOOL, EndPaint)
KOR_NOT_HERE(HDC, GetDC)
KOR_NOT_HERE(int, GetDeviceCaps)
KOR_NOT_HERE(int, GetObjectW)
KOR_NOT_HERE(HGDIOBJ, GetStockObject)
KOR_NOT_HERE(LONG_PTR, GetWindowLongPtrW)
KOR_NOT_HERE(BOOL, InvalidateRect)
KOR_NOT_HERE(BOOL, Polyline)
KOR_NOT_HERE(int, ReleaseDC)
KOR_NOT_HERE(HGDIOBJ, SelectObject)
KOR_NOT_HERE(LRESULT, SendMessageW)
KOR_NOT_HERE(LONG_PTR, SetWindowLongPtrW)

#undef KOR_NOT_HERE

// ---- The C runtime's own additions ----

inline long _wtol(const wchar_t* text) { return std::wcstol(text, nullptr, 10); }
inline double _wtof(const wchar_t* text) { return std::wcstod(text, nullptr); }
inline wchar_t* _itow(int value, wchar_t* text, int) {
    std::swprintf(text, 12, L"%d", value);
    return text;
}
#define _snwprintf std::swprintf
