#include "graph/children/tooltip.h"

#include <korcontrols/tooltip.h>

#include <algorithm>

#include "base/gdi_scopes.h"
#include "base/local_text.h"
#include "base/records.h"
#include "text/text_run.h"

namespace kor {

namespace {

constexpr uint32_t kCapacity = 128;  // characters; one more is allocated for the terminator
constexpr int kInset = 3;

constinit wchar_t className[] = KORTOOLTIP_CLASS;
constinit bool registered = false;

struct ToolTipRecord {
    HINSTANCE instance;
    HWND window;
    wchar_t* text;  // local heap
    uint32_t capacity;
    RECT frame;  // client coordinates
    RecordLife life;
};

void FreeRecord(ToolTipRecord* tip) {
    FreeLocal(tip->text);
    DeleteRecord(tip);
}

// Compatibility: a text of the full capacity is kept whole, but a longer one is truncated to one
// character less than that (ToolTipPicture.Of129CharactersIsCutTo127).
void TakeText(ToolTipRecord& tip, const wchar_t* text) {
    const size_t length = wcslen(text);
    const size_t kept = length <= tip.capacity ? length : tip.capacity - 1;
    memset(tip.text, 0, (tip.capacity + 1) * sizeof(wchar_t));
    memcpy(tip.text, text, kept * sizeof(wchar_t));
}

// Size of the text with its frame.
SIZE MeasureTip(HWND hwnd, const wchar_t* text) {
    WindowDC dc(hwnd);
    const SIZE measured = DrawnSize(dc.get(), text, static_cast<int>(wcslen(text)));
    return {measured.cx + 2 * kInset, measured.cy + 2 * kInset};
}

// Clamps a position to the range of a coordinate.
int Coordinate(int64_t pixels) {
    return static_cast<int>(std::clamp<int64_t>(pixels, INT32_MIN, INT32_MAX));
}

LRESULT OnShow(ToolTipRecord& tip, const ToolTipRequest* request) {
    if (!request || !request->text || !tip.text) return 0;
    TakeText(tip, request->text);
    const SIZE size = MeasureTip(tip.window, request->text);
    tip.frame = {0, 0, size.cx, size.cy};
    const int64_t x = request->x;
    const bool fits = x + size.cx <= request->limit;
    const int64_t left = fits ? x : static_cast<int64_t>(request->limit) - size.cx - 1;
    const int64_t top = static_cast<int64_t>(request->y) - size.cy;
    // To the top, or the chart would cover it.
    SetWindowPos(tip.window, HWND_TOP, Coordinate(left), Coordinate(top), size.cx, size.cy, 0);
    ShowWindow(tip.window, SW_SHOW);
    return 0;
}

LRESULT Hide(const ToolTipRecord& tip) {
    if (tip.window) ShowWindow(tip.window, SW_HIDE);
    return 0;
}

void DrawTip(const ToolTipRecord& tip, HDC dc) {
    {
        SelectScope pen(dc, GetStockObject(BLACK_PEN));
        Rectangle(dc, tip.frame.left, tip.frame.top, tip.frame.right, tip.frame.bottom);
    }
    RECT inside = {tip.frame.left + kInset, tip.frame.top + kInset, tip.frame.right - kInset,
                   tip.frame.bottom - kInset};
    DrawTextW(dc, tip.text, -1, &inside, 0);
}

// A pending erase is done first; otherwise default processing would erase what has been drawn.
// Painting into a caller's DC must not discard the window's own pending update.
void OnPaint(const ToolTipRecord& tip, HDC given) {
    const bool pending = GetUpdateRect(tip.window, nullptr, FALSE) != 0;
    { PaintScope validate(tip.window); }
    if (given) DrawTip(tip, given);
    if (given && !pending) return;
    WindowDC dc(tip.window);
    DrawTip(tip, dc.get());
}

LRESULT OnCreate(HWND hwnd, const CREATESTRUCTW* creation) {
    auto* tip = NewRecord<ToolTipRecord>();
    if (!tip) return 1;
    const RecordUse use(tip);
    SetUserData(hwnd, tip);
    if (!creation || !creation->hInstance || !creation->hwndParent) return 1;
    tip->instance = creation->hInstance;
    tip->window = hwnd;
    tip->capacity = kCapacity;
    tip->text = AllocateLocal<wchar_t>(kCapacity + 1);
    ShowWindow(hwnd, SW_HIDE);
    return 0;
}

void OnDestroy(HWND hwnd, ToolTipRecord& tip) {
    SetUserData(hwnd, nullptr);
    RetireRecord(tip);
}

LRESULT CALLBACK ToolTipProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    auto* tip = UserDataOf<ToolTipRecord>(hwnd);
    if (message == WM_CREATE && !tip) {
        return OnCreate(hwnd, reinterpret_cast<CREATESTRUCTW*>(lParam));
    }
    if (!tip) return DefWindowProcW(hwnd, message, wParam, lParam);
    const RecordUse use(tip);
    switch (message) {
    case TIPM_SHOW: return OnShow(*tip, reinterpret_cast<const ToolTipRequest*>(lParam));
    case TIPM_HIDE:
    case WM_LBUTTONUP: return Hide(*tip);
    case WM_PAINT:
        if (tip->text) OnPaint(*tip, reinterpret_cast<HDC>(wParam));
        break;
    case WM_DESTROY: OnDestroy(hwnd, *tip); break;
    default: break;
    }
    return DefWindowProcW(hwnd, message, wParam, lParam);
}

}  // namespace

bool RegisterToolTipClass(HINSTANCE instance) {
    if (registered) return true;
    registered = true;
    WNDCLASSW windowClass = {};
    windowClass.style = CS_VREDRAW | CS_HREDRAW;
    windowClass.lpfnWndProc = ToolTipProc;
    windowClass.hInstance = instance;
    windowClass.hbrBackground = SystemStockBrush(COLOR_WINDOW | kSystemColourFlag);
    windowClass.lpszClassName = className;
    return RegisterClassW(&windowClass) != 0;
}

}  // namespace kor
