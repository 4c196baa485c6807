#include "graph/children/legend.h"

#include <korcontrols/legend.h>

#include <algorithm>
#include <iterator>

#include "base/gdi_scopes.h"
#include "base/records.h"
#include "base/windows_helpers.h"
#include "graph/data/entries.h"
#include "text/text_run.h"

namespace kor {

namespace {

constexpr int kLineGap = 5;
constexpr int kTextLeft = 16;
constexpr int kTextTop = 5;
constexpr int kTextRightGap = 3;
constexpr int kSwatchLeft = 3;
constexpr int kSwatchSide = 10;
constexpr int kNeverPainted = -1;

constinit wchar_t className[] = KORLEGEND_CLASS;
constinit bool registered = false;

struct LegendRecord {
    HINSTANCE instance;
    HWND window;
    const GraphRecord* graph;  // not owned; null before attachment and after the chart's end
    int32_t firstEntry;
    int32_t entryCount;  // at the last paint
    RecordLife life;
};

void FreeRecord(LegendRecord* legend) { DeleteRecord(legend); }

int LineHeight(HDC dc) { return DrawnSize(dc, L"M").cy; }

void DrawSwatch(HDC dc, int top, COLORREF colour) {
    LocalGdiObject<HBRUSH> brush(CreateSolidBrush(colour));
    SelectScope selected(dc, brush.get());
    Rectangle(dc, kSwatchLeft, top, kSwatchLeft + kSwatchSide, top + kSwatchSide);
}

// Entries without a name take no line. Entries below the client area are not drawn.
void DrawEntries(const LegendRecord& legend, HDC dc, SIZE client, int lineHeight) {
    int top = kTextTop;
    for (int i = legend.firstEntry; i < legend.entryCount && top < client.cy; ++i) {
        wchar_t number[kDecimalCapacity];
        const wchar_t* name = EntryName(*legend.graph, i, number);
        if (!name) continue;
        DrawSwatch(dc, top, EntryColour(*legend.graph, i));
        RECT text = {kTextLeft, top, client.cx - kTextRightGap, top + lineHeight};
        DrawTextW(dc, name, -1, &text, 0);
        top = text.bottom + kLineGap;
    }
}

// Stores the current number of entries. True if it differs from the last paint's; the list is then
// scrolled back to its start.
bool TakeEntryCount(LegendRecord& legend) {
    const int count = EntryCount(*legend.graph);
    if (count == legend.entryCount) return false;
    legend.entryCount = count;
    legend.firstEntry = 0;
    return true;
}

// Compatibility: a pie's scroll range is one longer than that of the other types
// (LegendScroll.TooManySlicesHaveTheirNumberAsMaximum). A pie's legend is also invalidated, where
// that of the other types is only updated.
void SetUpScrollBar(const LegendRecord& legend, int clientHeight, int pitch) {
    const bool pie = IsPieChart(*legend.graph);
    if (static_cast<int64_t>(pitch) * legend.entryCount > clientHeight) {
        SCROLLINFO info = {};
        info.cbSize = sizeof info;
        info.fMask = SIF_RANGE | SIF_PAGE | SIF_POS | SIF_DISABLENOSCROLL;
        info.nMax = pie ? legend.entryCount : legend.entryCount - 1;
        info.nPage = static_cast<UINT>(std::max(clientHeight / pitch, 1));
        SetScrollInfo(legend.window, SB_VERT, &info, TRUE);
        SetScrollPos(legend.window, SB_VERT, 0, TRUE);
    } else {
        SetScrollRange(legend.window, SB_VERT, 0, 1, TRUE);
    }
    if (pie) {
        InvalidateRect(legend.window, nullptr, TRUE);
    } else {
        UpdateWindow(legend.window);
    }
}

// Default processing may erase what is invalid and then validate it, so it comes before the scroll
// bar is set up, which may invalidate again.
LRESULT OnPaint(LegendRecord& legend, WPARAM wParam, LPARAM lParam) {
    bool changed = false;
    int lineHeight = 0;
    {
        PaintScope paint(legend.window);
        const RECT& area = paint.area();
        BitBlt(paint.dc(), area.left, area.top, area.right - area.left, area.bottom - area.top,
               paint.dc(), area.left, area.top, WHITENESS);
        if (legend.graph) {
            lineHeight = LineHeight(paint.dc());
            changed = TakeEntryCount(legend);
            const RECT client = ClientRectOf(legend.window);
            DrawEntries(legend, paint.dc(), {client.right, client.bottom}, lineHeight);
        }
    }
    const LRESULT result = DefWindowProcW(legend.window, WM_PAINT, wParam, lParam);
    if (changed && legend.graph) {  // the chart may be gone by now
        SetUpScrollBar(legend, ClientRectOf(legend.window).bottom, lineHeight + kLineGap);
    }
    return result;
}

LRESULT OnScroll(LegendRecord& legend, int request) {
    switch (request) {
    case SB_LINEUP:
    case SB_PAGEUP:
        if (legend.firstEntry >= 1) --legend.firstEntry;
        break;
    case SB_LINEDOWN:
    case SB_PAGEDOWN:
        if (legend.firstEntry < legend.entryCount - 1) ++legend.firstEntry;
        break;
    // Compatibility: the thumb always leads back to the start
    // (LegendScroll.ThumbAlwaysGoesToTheStart).
    case SB_THUMBPOSITION:
    case SB_THUMBTRACK:
    case SB_TOP: legend.firstEntry = 0; break;
    default: break;
    }
    if (!legend.window) return 0;  // a null window would repaint every window on the screen
    InvalidateRect(legend.window, nullptr, TRUE);
    UpdateWindow(legend.window);
    return 0;
}

LRESULT OnCreate(HWND hwnd, const CREATESTRUCTW* creation) {
    auto* legend = NewRecord<LegendRecord>();
    if (!legend) return 1;
    const RecordUse use(legend);
    legend->entryCount = kNeverPainted;
    SetUserData(hwnd, legend);
    if (!creation || !creation->hInstance || !creation->hwndParent) return 1;
    legend->instance = creation->hInstance;
    legend->window = hwnd;
    ShowWindow(hwnd, SW_SHOW);
    return 0;
}

void OnDestroy(HWND hwnd, LegendRecord& legend) {
    SetUserData(hwnd, nullptr);
    legend.graph = nullptr;
    RetireRecord(legend);
}

LRESULT CALLBACK LegendProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    auto* legend = UserDataOf<LegendRecord>(hwnd);
    if (message == WM_CREATE && !legend) {
        return OnCreate(hwnd, reinterpret_cast<CREATESTRUCTW*>(lParam));
    }
    if (!legend) return DefWindowProcW(hwnd, message, wParam, lParam);
    const RecordUse use(legend);
    switch (message) {
    case WM_DESTROY: OnDestroy(hwnd, *legend); break;
    case WM_PAINT:
        if (legend->window) return OnPaint(*legend, wParam, lParam);
        break;
    case WM_HSCROLL: return 0;
    case WM_VSCROLL: return OnScroll(*legend, LowWord(wParam));
    default: break;
    }
    return DefWindowProcW(hwnd, message, wParam, lParam);
}

bool IsLegend(HWND hwnd) {
    constexpr int kCapacity = static_cast<int>(std::size(className)) + 1;
    wchar_t name[kCapacity] = L"";
    return IsWindow(hwnd) && GetClassNameW(hwnd, name, kCapacity) != 0 &&
           std::equal(std::begin(className), std::end(className), name);
}

}  // namespace

bool RegisterLegendClass(HINSTANCE instance) {
    if (registered) return true;
    registered = true;
    WNDCLASSW windowClass = {};
    windowClass.style = CS_VREDRAW | CS_HREDRAW;
    windowClass.lpfnWndProc = LegendProc;
    windowClass.hInstance = instance;
    windowClass.hbrBackground = SystemStockBrush(COLOR_WINDOW | kSystemColourFlag);
    windowClass.lpszClassName = className;
    return RegisterClassW(&windowClass) != 0;
}

bool AttachLegend(HWND hwnd, const GraphRecord* graph) {
    auto* legend = UserDataOf<LegendRecord>(hwnd);
    if (!legend || !graph) return false;
    legend->graph = graph;
    return true;
}

// The host may have destroyed the legend, and its handle may be another window's now.
void DetachLegend(HWND hwnd) {
    if (!IsLegend(hwnd)) return;
    auto* legend = UserDataOf<LegendRecord>(hwnd);
    if (legend) legend->graph = nullptr;
}

int LegendLinePitch(HDC dc) { return LineHeight(dc) + kLineGap; }

}  // namespace kor
