// The function bar's window: registration, lifetime and dispatch. All state is module-wide; a
// window only adds the font and the arrow, which exist from WM_CREATE to WM_DESTROY.
#include <korcontrols/funkybar.h>

#include "base/gdi_scopes.h"
#include "base/module.h"
#include "base/resources.h"
#include "funkybar/drawing.h"
#include "funkybar/items.h"
#include "funkybar/layout.h"
#include "funkybar/menu.h"
#include "funkybar/selection.h"

namespace kor {

namespace {

constexpr COLORREF kArrowMaskColour = RGB(0, 128, 128);
constexpr int kFontPoints = 10;

constinit wchar_t className[] = KORFUNKYBAR_CLASS;

// The system font, bold, ten points.
HFONT CreateBarFont(HWND hwnd) {
    LOGFONTW description = {};
    GetObjectW(GetStockObject(SYSTEM_FONT), sizeof description, &description);
    WindowDC dc(hwnd);
    description.lfWeight = FW_BOLD;
    description.lfHeight = FontHeight(kFontPoints, GetDeviceCaps(dc.get(), LOGPIXELSY));
    return CreateFontIndirectW(&description);
}

// For a second bar of the process both exist already.
LRESULT OnCreate(HWND hwnd) {
    if (!funkyBar.font) funkyBar.font = CreateBarFont(hwnd);
    if (!funkyBar.arrowImages) {
        funkyBar.arrowImages =
            ImageList_LoadImageW(moduleInstance, MAKEINTRESOURCEW(KOR_BITMAP_ARROW), kArrowWidth, 1,
                                 kArrowMaskColour, IMAGE_BITMAP, 0);
    }
    return 0;
}

// An open menu is cancelled: without its window it would stay on the screen and its loop would wait
// for ever.
LRESULT OnDestroy(HWND hwnd) {
    if (funkyBar.menuOpen) SendMessageW(hwnd, WM_CANCELMODE, 0, 0);
    RemoveAllItems();
    if (funkyBar.font) DeleteObject(funkyBar.font);
    funkyBar.font = nullptr;
    if (funkyBar.arrowImages) ImageList_Destroy(funkyBar.arrowImages);
    funkyBar.arrowImages = nullptr;
    return 0;
}

LRESULT OnPaint(HWND hwnd) {
    PaintBar(hwnd);
    return 0;
}

// Repaints when the bar had no current item and now shows the first one.
LRESULT OnInsertItem(HWND hwnd, const FunkyBarItemDesc* description) {
    const FunkyBarItem* shown = funkyBar.current;
    const int32_t result = InsertItem(description);
    if (funkyBar.current != shown) InvalidateRect(hwnd, nullptr, TRUE);
    return result;
}

LRESULT OnSetImageList(HIMAGELIST images) {
    if (!images) return 0;
    HIMAGELIST previous = funkyBar.itemImages;
    funkyBar.itemImages = images;
    return reinterpret_cast<LRESULT>(previous);
}

LRESULT OnDeleteItem(HWND hwnd, int32_t index) {
    if (RemoveItem(index)) RepaintBar(hwnd);
    return 0;
}

LRESULT OnDeleteAll(HWND hwnd) {
    if (!RemoveAllItems()) return 0;
    RepaintBar(hwnd);
    return 1;
}

LRESULT CALLBACK FunkyBarProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    switch (message) {
    case WM_CREATE: return OnCreate(hwnd);
    case WM_DESTROY: return OnDestroy(hwnd);
    case WM_PAINT: return OnPaint(hwnd);
    case WM_LBUTTONDOWN: return OpenItemMenu(hwnd);
    case WM_DRAWITEM: return OnDrawEntry(reinterpret_cast<const DRAWITEMSTRUCT*>(lParam));
    case WM_MEASUREITEM: return OnMeasureEntry(hwnd, reinterpret_cast<MEASUREITEMSTRUCT*>(lParam));
    case FBM_INSERTITEM:
        return OnInsertItem(hwnd, reinterpret_cast<const FunkyBarItemDesc*>(lParam));
    case FBM_GETITEM: return ReadItem(reinterpret_cast<FunkyBarItemDesc*>(lParam));
    case FBM_SETIMAGELIST: return OnSetImageList(reinterpret_cast<HIMAGELIST>(lParam));
    case FBM_GETIMAGELIST: return reinterpret_cast<LRESULT>(funkyBar.itemImages);
    case FBM_DELETEITEM: return OnDeleteItem(hwnd, static_cast<int32_t>(wParam));
    case FBM_DELETEALL: return OnDeleteAll(hwnd);
    case FBM_GETCOUNT: return funkyBar.count;
    case FBM_SETCURSEL: return SelectItem(hwnd, static_cast<int32_t>(wParam));
    case FBM_GETCURSEL: return IndexOfItem(funkyBar.current);
    default: return DefWindowProcW(hwnd, message, wParam, lParam);
    }
}

}  // namespace

}  // namespace kor

extern "C" DWORD KORCONTROLS_API InitFunkyControl(HINSTANCE instance) {
    if (!instance) return 0;
    WNDCLASSW windowClass = {};
    windowClass.lpfnWndProc = kor::FunkyBarProc;
    windowClass.hInstance = instance;
    windowClass.lpszClassName = kor::className;
    return RegisterClassW(&windowClass);
}
