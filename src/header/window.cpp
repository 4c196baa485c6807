// The header strip: a window procedure over a record kept in a module-wide list. A strip whose
// record could not be made still exists; it answers its messages with their failure results.
#include "header/window.h"

#include <korcontrols/header.h>

#include "base/gdi_scopes.h"
#include "base/windows_helpers.h"
#include "header/drag.h"
#include "header/drawing.h"
#include "header/items.h"
#include "header/record.h"

namespace kor {

namespace {

constinit wchar_t className[] = KORHEADER_CLASS;

LRESULT OnCreate(HWND hwnd, const CREATESTRUCTW* creation) {
    if (!creation || FindHeaderRecord(hwnd)) return 1;
    return CreateHeaderRecord(*creation, hwnd) ? 0 : 1;  // 1 lets the window exist without a record
}

LRESULT OnDestroy(HeaderRecord& header) {
    EndHeaderDrag(header);
    RetireHeaderRecord(header);
    return 0;
}

LRESULT OnSize(const HeaderRecord& header, WPARAM how, LPARAM size) {
    UpdateSizeBounds(header, LowWord(static_cast<WPARAM>(size)),
                     HighWord(static_cast<WPARAM>(size)));
    return DefWindowProcW(header.window, WM_SIZE, how, size);
}

LRESULT OnPaint(const HeaderRecord& header) {
    PaintScope paint(header.window);
    DrawHeaderItems(header, paint.area());
    return 0;
}

// Pointer position along the strip.
int AlongStrip(const HeaderRecord& header, LPARAM position) {
    const auto words = static_cast<WPARAM>(position);
    return IsVertical(header) ? HighWord(words) : LowWord(words);
}

LRESULT AnswerWithoutRecord(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    switch (message) {
    case HCM_INSERTITEM: return -1;
    case HCM_DELETEITEM: return 0;
    case HCM_SETITEM: return 0;
    case HCM_SETITEMSTATE: return 0;
    case HCM_GETITEMCOUNT: return -1;
    case HCM_GETITEM: return 0;
    case HCM_GETITEMSIZE: return -1;
    case WM_PAINT:
        ValidateRect(hwnd, nullptr);  // otherwise the system sends WM_PAINT endlessly
        return 1;
    case WM_MOUSEMOVE:
    case WM_LBUTTONDOWN:
    case WM_LBUTTONUP: return 1;
    default: return DefWindowProcW(hwnd, message, wParam, lParam);
    }
}

LRESULT CALLBACK HeaderProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    if (message == WM_CREATE) return OnCreate(hwnd, reinterpret_cast<CREATESTRUCTW*>(lParam));
    HeaderRecord* header = FindHeaderRecord(hwnd);
    if (!header) return AnswerWithoutRecord(hwnd, message, wParam, lParam);
    const RecordUse use(header);

    const auto index = static_cast<int>(wParam);
    const auto* item = reinterpret_cast<const HeaderItemDesc*>(lParam);
    switch (message) {
    case WM_DESTROY: return OnDestroy(*header);
    case WM_SIZE: return OnSize(*header, wParam, lParam);
    case WM_PAINT: return OnPaint(*header);
    case WM_LBUTTONDOWN: return OnHeaderButtonDown(*header, AlongStrip(*header, lParam));
    case WM_MOUSEMOVE: return OnHeaderPointerMove(*header, AlongStrip(*header, lParam));
    case WM_LBUTTONUP: return OnHeaderButtonUp(*header);
    case WM_CAPTURECHANGED:
        if (reinterpret_cast<HWND>(lParam) != hwnd) LoseHeaderDrag(*header);
        break;
    case WM_CANCELMODE: LoseHeaderDrag(*header); break;
    case HCM_INSERTITEM: return InsertItem(*header, index, item);
    case HCM_DELETEITEM: return DeleteItem(*header, index);
    case HCM_SETITEM: return SetItem(*header, index, item);
    case HCM_SETITEMSTATE: return SetItemState(*header, index, static_cast<uint32_t>(lParam));
    case HCM_GETITEMCOUNT: return static_cast<LRESULT>(header->count);
    case HCM_GETITEM: return GetItem(*header, index, reinterpret_cast<HeaderItemDesc*>(lParam));
    case HCM_GETITEMSIZE: return GetItemSize(*header, index);
    default: break;
    }
    return DefWindowProcW(hwnd, message, wParam, lParam);
}

}  // namespace

bool RegisterHeaderClass(HINSTANCE instance) {
    WNDCLASSW windowClass = {};
    windowClass.style = CS_VREDRAW | CS_HREDRAW | CS_DBLCLKS;
    windowClass.lpfnWndProc = HeaderProc;
    windowClass.hInstance = instance;
    windowClass.hbrBackground = static_cast<HBRUSH>(GetStockObject(LTGRAY_BRUSH));
    windowClass.lpszClassName = className;
    if (!windowClass.hbrBackground) return false;  // the next grid tries again
    return RegisterClassW(&windowClass) != 0;
}

void WhenHeaderResizeIsLost(void (*handler)(HWND strip)) { headerDrag.resizeLost = handler; }

}  // namespace kor
