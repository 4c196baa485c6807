// The chart: a window procedure over a record in the window's user data. A window whose record
// could not be allocated passes every message to default processing. A chart that could not be set
// up completely works with what it has.
#include <korcontrols/graph.h>
#include <korcontrols/tooltip.h>

#include "base/gdi_scopes.h"
#include "base/windows_helpers.h"
#include "graph/children/legend.h"
#include "graph/children/show_legend.h"
#include "graph/children/tooltip.h"
#include "graph/data/axes.h"
#include "graph/data/palette.h"
#include "graph/data/record.h"
#include "graph/data/series.h"
#include "graph/drawing/image.h"
#include "graph/drawing/layout.h"
#include "graph/drawing/live.h"
#include "graph/drawing/redraw.h"
#include "graph/output/clipboard.h"
#include "graph/output/printing.h"
#include "graph/output/printing_calls.h"
#include "graph/pointer.h"
#include "graph/settings.h"
#include "graph/tools/command_bar.h"
#include "graph/tools/pages.h"

namespace kor {

namespace {

constinit wchar_t classNameText[] = KORGRAPH_CLASS;
constinit wchar_t* className = classNameText;
constinit bool registered = false;

constexpr int kToolTipWidth = 25;
constexpr int kToolTipHeight = 15;

HWND CreateToolTip(const GraphRecord& graph) {
    RegisterToolTipClass(graph.hInstance);
    return CreateWindowExW(
        0, KORTOOLTIP_CLASS, L"", WS_CHILD, 0, 0, kToolTipWidth, kToolTipHeight, graph.hwndParent,
        reinterpret_cast<HMENU>(static_cast<INT_PTR>(KORTOOLTIP_ID)), graph.hInstance, nullptr);
}

bool CreateImageDC(GraphRecord& graph) {
    WindowDC window(graph.hwnd);
    graph.hdcMem = CreateCompatibleDC(window.get());
    if (!graph.hdcMem) return false;
    SetBkMode(graph.hdcMem, TRANSPARENT);
    return true;
}

LRESULT OnCreate(HWND hwnd, const CREATESTRUCTW* creation) {
    GraphRecord* graph = CreateGraphRecord();
    if (!graph) return 1;
    const RecordUse use(graph);
    SetUserData(hwnd, graph);
    if (!creation || !creation->hInstance || !creation->hwndParent) return 1;
    LoadPrintModules();
    graph->hInstance = creation->hInstance;
    graph->hwnd = hwnd;
    graph->hwndParent = creation->hwndParent;
    if (!CreateImageDC(*graph)) return 1;
    ChoosePalette(graph->hdcMem);
    CreateGraphFonts(*graph, graph->hdcMem);
    LayoutGraphMargins(*graph, graph->hdcMem);
    graph->hrgnClip = CreateRectRgn(0, 0, 1, 1);
    SetBackgroundColour(*graph, PaletteEntry(1));
    graph->hwndToolTip = CreateToolTip(*graph);
    return 0;
}

// The legend is destroyed with the chart's window, the tooltip with the parent's.
LRESULT OnDestroy(HWND hwnd, GraphRecord& graph) {
    DetachLegend(graph.hwndLegend);
    SetUserData(hwnd, nullptr);
    RetireRecord(graph);
    return 0;
}

LRESULT OnSize(GraphRecord& graph, HWND hwnd, WPARAM how, LPARAM size) {
    DefWindowProcW(hwnd, WM_SIZE, how, size);
    const auto words = static_cast<WPARAM>(size);
    if (graph.hdcMem) ResizeImage(graph, LowWord(words), HighWord(words));
    return 0;
}

LRESULT OnEraseBackground(const GraphRecord& graph, HDC dc) {
    SetBkColor(dc, graph.crBack);
    return 0;
}

template <typename Value>
LRESULT Store(LPARAM destination, Value value) {
    auto* place = reinterpret_cast<Value*>(destination);
    if (place) *place = value;
    return 0;
}

LRESULT OnSetTitle(GraphRecord& graph, wchar_t*& title, LPARAM text) {
    SetTitle(graph, title, reinterpret_cast<const wchar_t*>(text));
    return 0;
}

LRESULT OnAddSeries(GraphRecord& graph, const GraphSeriesData* data) {
    return data && AddSeries(graph, *data) ? 0 : 1;
}

LRESULT OnSetRange(GraphRecord& graph, const GraphRange* range) {
    if (range) SetRange(graph, range->axis, range->min, range->max);
    return 0;
}

LRESULT OnGetRange(const GraphRecord& graph, GraphRange* range) {
    if (!range) return 0;
    const bool isX = range->axis == KORGRAPH_X;
    range->min = isX ? graph.xMin : graph.yMin;
    range->max = isX ? graph.xMax : graph.yMax;
    return 0;
}

LRESULT OnShowLegend(GraphRecord& graph, const RECT* place) {
    if (place && graph.hwnd) ShowLegend(graph, *place);
    return 0;
}

LRESULT OnReset(GraphRecord& graph, bool ranges) {
    RemoveAllSeries(graph);
    if (ranges) ResetGraphRanges(graph);
    return 0;
}

// Handles the codes that act only inside WM_NOTIFY. False if default processing is to follow.
bool OnNotify(GraphRecord& graph, WPARAM code, LPARAM argument) {
    switch (code) {
    case GN_RESET: OnReset(graph, argument != 0); return true;
    case GN_CLEAR: OnReset(graph, false); return true;
    case GN_PROPERTIES:
        if (graph.hwnd) RunGraphProperties(graph.hwnd);
        return true;
    case GN_REDRAW: RedrawGraph(graph); return true;
    case GN_PRINT: PrintGraph(graph); return true;
    case GN_LIVEUPDATE: OnLiveUpdate(graph, argument); return true;
    case GN_SETVALUE:
        if (argument) SetSeriesValue(graph, *reinterpret_cast<const GraphValue*>(argument));
        return true;
    case GN_REPLACESERIES:
        if (argument) {
            ReplaceSeriesValues(graph, *reinterpret_cast<const GraphSeriesData*>(argument));
        }
        return false;
    default: return false;
    }
}

// The record describes a page. No message reaches it, and what the window itself needs is noted for
// later.
LRESULT AnswerOnPage(GraphRecord& graph, HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    switch (message) {
    case WM_PAINT: graph.paintMissed = true; break;
    case WM_SIZE: graph.sizeMissed = true; break;
    case GM_ADDSERIES:
    case GM_SETCATEGORIES: return 1;  // nothing was stored
    default: break;
    }
    return DefWindowProcW(hwnd, message, wParam, lParam);
}

LRESULT CALLBACK GraphProc(HWND hwnd, UINT message, WPARAM wParam, LPARAM lParam) {
    GraphRecord* graph = UserDataOf<GraphRecord>(hwnd);
    if (message == WM_CREATE && !graph) {
        return OnCreate(hwnd, reinterpret_cast<CREATESTRUCTW*>(lParam));
    }
    if (!graph) return DefWindowProcW(hwnd, message, wParam, lParam);
    const RecordUse use(graph);
    if (graph->printing == PrintState::onPage && message != WM_DESTROY) {
        return AnswerOnPage(*graph, hwnd, message, wParam, lParam);
    }

    const auto number = static_cast<int32_t>(lParam);
    switch (message) {
    case WM_DESTROY: return OnDestroy(hwnd, *graph);
    case WM_SIZE: return OnSize(*graph, hwnd, wParam, lParam);
    case WM_PAINT:
        if (graph->hwnd) PaintFromImage(*graph);
        // Default processing begins and ends a paint of its own, which takes as long as drawing a
        // small chart: it is left out where there is nothing to paint any more.
        if (!GetUpdateRect(hwnd, nullptr, FALSE)) return 0;
        break;
    case WM_ERASEBKGND: return OnEraseBackground(*graph, reinterpret_cast<HDC>(wParam));
    case WM_SHOWWINDOW: ReloadShowGraphToolTip(wParam != 0); break;
    case WM_LBUTTONDOWN:
        return OnGraphButtonDown(*graph, SignedLowWord(lParam), SignedHighWord(lParam));
    case WM_LBUTTONUP: return OnGraphButtonUp(*graph);
    case WM_RBUTTONDOWN: return 0;
    case WM_NOTIFY:
        if (OnNotify(*graph, wParam, lParam)) return 0;
        break;
    case GM_ADDSERIES: return OnAddSeries(*graph, reinterpret_cast<GraphSeriesData*>(lParam));
    case GM_SETTITLE: return OnSetTitle(*graph, graph->title, lParam);
    case GM_SETXTITLE: return OnSetTitle(*graph, graph->xAxisTitle, lParam);
    case GM_SETYTITLE: return OnSetTitle(*graph, graph->yAxisTitle, lParam);
    case GM_GETTITLE: return Store(lParam, graph->title);
    case GM_GETXTITLE: return Store(lParam, graph->xAxisTitle);
    case GM_GETYTITLE: return Store(lParam, graph->yAxisTitle);
    case GM_SETCATEGORIES:
        return SetCategories(*graph, static_cast<int>(wParam),
                             reinterpret_cast<const wchar_t* const*>(lParam))
                   ? 0
                   : 1;
    case GM_SETTYPE: SetChartType(*graph, number); return 0;
    case GM_GETTYPE: return Store<LONG>(lParam, graph->chartType);
    case GM_SETRANGE: return OnSetRange(*graph, reinterpret_cast<GraphRange*>(lParam));
    case GM_AUTORANGE: AutoRange(*graph, number); return 0;
    case GM_SETZOOM: SetZoomIndex(*graph, number); return 0;
    case GM_TOGGLEOPTIONS: ToggleOptions(*graph, static_cast<uint32_t>(number)); return 0;
    case GM_GETOPTIONS: return Store<DWORD>(lParam, graph->options);
    case GM_SETDATAMODE: graph->dataMode = number; return 0;
    case GM_SHOWLEGEND: return OnShowLegend(*graph, reinterpret_cast<const RECT*>(lParam));
    case GM_GETSERIESCOLOR:
        return Store<COLORREF>(lParam, SeriesColour(*graph, static_cast<int>(wParam)));
    case GM_SETBKCOLOR: SetBackgroundColour(*graph, static_cast<COLORREF>(number)); return 0;
    case GM_GETZOOM: return Store<LONG>(lParam, ZoomIndex(*graph));
    case GM_GETRANGE: return OnGetRange(*graph, reinterpret_cast<GraphRange*>(lParam));
    case GM_COPY: CopyGraphToClipboard(*graph); return 0;
    default: break;
    }
    return DefWindowProcW(hwnd, message, wParam, lParam);
}

}  // namespace

}  // namespace kor

using namespace kor;

extern "C" DWORD KORCONTROLS_API RegisterGraphControl(HINSTANCE instance) {
    if (registered) return 1;
    registered = true;
    WNDCLASSW windowClass = {};
    windowClass.style = CS_VREDRAW | CS_HREDRAW;
    windowClass.lpfnWndProc = GraphProc;
    windowClass.hInstance = instance;
    windowClass.lpszClassName = className;
    return RegisterClassW(&windowClass) != 0;
}

extern "C" LPCWSTR KORCONTROLS_API GetGraphControlClassName(void) { return className; }
