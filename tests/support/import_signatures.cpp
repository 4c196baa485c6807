// Argument counts of the platform functions that a library of controls may import.
#include "support/import_spy.h"

namespace kortest {
namespace {

struct Signature {
    const char* name;
    int argumentCount;
};

constexpr Signature kStdcall[] = {
    // kernel32: heap, resources, modules
    {"FindResourceW", 3},
    {"FreeLibrary", 1},
    {"GetLastError", 0},
    {"GetModuleHandleW", 1},
    {"GetProcAddress", 2},
    {"GetTickCount", 0},
    {"GlobalAlloc", 2},
    {"GlobalFree", 1},
    {"GlobalLock", 1},
    {"GlobalUnlock", 1},
    {"GetModuleFileNameW", 3},
    {"LoadLibraryW", 1},
    {"LoadResource", 2},
    {"LocalAlloc", 2},
    {"LocalFree", 1},
    {"LocalLock", 1},
    {"LocalReAlloc", 3},
    {"LocalSize", 1},
    {"LocalUnlock", 1},
    {"LockResource", 1},
    {"lstrcpyW", 2},
    {"lstrlenW", 1},
    {"MulDiv", 3},
    {"SetLastError", 1},
    // user32: classes and windows
    {"AdjustWindowRectEx", 4},
    {"CallWindowProcW", 5},
    {"ClientToScreen", 2},
    {"CreateWindowExW", 12},
    {"DefWindowProcW", 4},
    {"DestroyWindow", 1},
    {"EnableWindow", 2},
    {"GetClassInfoW", 3},
    {"GetClassNameW", 3},
    {"GetClientRect", 2},
    {"GetDlgItem", 2},
    {"GetFocus", 0},
    {"GetParent", 1},
    {"GetWindowLongW", 2},
    {"GetWindowLongPtrW", 2},
    {"GetWindowRect", 2},
    {"GetWindowTextW", 3},
    {"GetWindowTextLengthW", 1},
    {"IsWindow", 1},
    {"IsWindowVisible", 1},
    {"LoadBitmapW", 2},
    {"LoadCursorW", 2},
    {"LoadStringW", 4},
    {"MapWindowPoints", 4},
    {"MoveWindow", 6},
    {"RegisterClassW", 1},
    {"ScreenToClient", 2},
    {"SetFocus", 1},
    {"SetWindowLongW", 3},
    {"SetWindowLongPtrW", 3},
    {"SetWindowPos", 7},
    {"SetWindowTextW", 2},
    {"ShowWindow", 2},
    {"UnregisterClassW", 2},
    {"UpdateWindow", 1},
    // user32: messages, timers, input, scroll bars
    {"DispatchMessageW", 1},
    {"GetAsyncKeyState", 1},
    {"GetCapture", 0},
    {"GetCursorPos", 1},
    {"GetKeyState", 1},
    {"GetScrollInfo", 3},
    {"GetScrollPos", 2},
    {"GetSystemMetrics", 1},
    {"KillTimer", 2},
    {"PeekMessageW", 5},
    {"PostMessageW", 4},
    {"ReleaseCapture", 0},
    {"SendMessageW", 4},
    {"SetCapture", 1},
    {"SetScrollInfo", 4},
    {"SetScrollPos", 4},
    {"SetScrollRange", 5},
    {"SetTimer", 4},
    {"ShowScrollBar", 3},
    {"GetMessagePos", 0},
    // user32: menus
    {"AppendMenuW", 4},
    {"CreatePopupMenu", 0},
    {"DestroyMenu", 1},
    {"TrackPopupMenuEx", 6},
    // user32: painting
    {"BeginPaint", 2},
    {"DrawTextW", 5},
    {"EndPaint", 2},
    {"FillRect", 3},
    {"FrameRect", 3},
    {"GetDC", 1},
    {"GetSysColor", 1},
    {"GetSysColorBrush", 1},
    {"GetUpdateRect", 3},
    {"InflateRect", 3},
    {"IntersectRect", 3},
    {"InvalidateRect", 3},
    {"InvertRect", 2},
    {"PtInRect", 3},
    {"RedrawWindow", 4},
    {"ReleaseDC", 2},
    {"SetRect", 5},
    {"ValidateRect", 2},
    // comctl32
    {"ImageList_Destroy", 1},
    {"ImageList_Draw", 6},
    {"ImageList_GetImageInfo", 3},
    {"ImageList_LoadImageW", 7},
    // gdi32
    {"BitBlt", 9},
    {"CombineRgn", 4},
    {"CreateBitmap", 5},
    {"CreateCompatibleBitmap", 3},
    {"CreateCompatibleDC", 1},
    {"CreateDIBSection", 6},
    {"CreateFontIndirectW", 1},
    {"CreatePatternBrush", 1},
    {"CreatePen", 3},
    {"CreatePenIndirect", 1},
    {"CreateRectRgn", 4},
    {"CreateRectRgnIndirect", 1},
    {"CreateSolidBrush", 1},
    {"DeleteDC", 1},
    {"DeleteObject", 1},
    {"Ellipse", 5},
    {"ExcludeClipRect", 5},
    {"ExtTextOutW", 8},
    {"GetClipBox", 2},
    {"GetClipRgn", 2},
    {"GetCurrentObject", 2},
    {"GetDeviceCaps", 2},
    {"GetObjectW", 3},
    {"GetPixel", 3},
    {"GetStockObject", 1},
    {"GetTextExtentPoint32W", 4},
    {"GetTextExtentExPointW", 7},
    {"GetTextMetricsW", 2},
    {"IntersectClipRect", 5},
    {"LineTo", 3},
    {"MoveToEx", 4},
    {"PatBlt", 6},
    {"Polygon", 3},
    {"Polyline", 3},
    {"PolyPolyline", 4},
    {"Rectangle", 5},
    {"RestoreDC", 2},
    {"SaveDC", 1},
    {"SelectClipRgn", 2},
    {"SelectObject", 2},
    {"SetBkColor", 2},
    {"SetBkMode", 2},
    {"SetPixel", 4},
    {"SetRectRgn", 5},
    {"SetROP2", 2},
    {"SetTextAlign", 2},
    {"SetTextColor", 2},
    {"StretchBlt", 11},
    {"TextOutW", 5},
    // dialogs, clipboard
    {"CloseClipboard", 0},
    {"CreatePropertySheetPageW", 1},
    {"DestroyPropertySheetPage", 1},
    {"EmptyClipboard", 0},
    {"GdiFlush", 0},
    {"GetDlgItemTextW", 4},
    {"MessageBoxW", 4},
    {"OpenClipboard", 1},
    {"PropertySheetW", 1},
    {"SendDlgItemMessageW", 5},
    {"SetClipboardData", 2},
    {"SetDlgItemTextW", 3},
};

constexpr Signature kCdecl[] = {
    {"_itow", 3},   {"_wtol", 1},  {"calloc", 2},  {"free", 1},   {"malloc", 1}, {"memcpy", 3},
    {"memmove", 3}, {"memset", 3}, {"realloc", 2}, {"wcscpy", 2}, {"wcslen", 1}, {"wcsncpy", 3},
};

template <size_t count>
const Signature* Find(const Signature (&table)[count], const std::string& name) {
    for (const Signature& entry : table) {
        if (name == entry.name) return &entry;
    }
    return nullptr;
}

}  // namespace

bool FindImportSignature(const std::string& name, int* argumentCount,
                         CallingConvention* convention) {
    if (const Signature* entry = Find(kStdcall, name)) {
        *argumentCount = entry->argumentCount;
        *convention = CallingConvention::Stdcall;
        return true;
    }
    if (const Signature* entry = Find(kCdecl, name)) {
        *argumentCount = entry->argumentCount;
        *convention = CallingConvention::Cdecl;
        return true;
    }
    return false;
}

}  // namespace kortest
