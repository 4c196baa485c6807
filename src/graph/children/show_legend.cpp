#include "graph/children/show_legend.h"

#include <korcontrols/legend.h>

#include <cmath>

#include "base/gdi_scopes.h"
#include "base/module.h"
#include "base/resources.h"
#include "base/windows_helpers.h"
#include "graph/children/legend.h"
#include "numbers/truncate.h"

namespace kor {

namespace {

constexpr int kLegendTitleCapacity = 50;
constexpr int kBottomGap = 2;

// Height of the legend's client area rounded up to whole lines, plus a gap below them.
int SnappedHeight(HWND legend) {
    WindowDC dc(legend);
    const int line = LegendLinePitch(dc.get());
    const double lines = std::ceil(static_cast<double>(ClientRectOf(legend).bottom) / line);
    return TruncateToInt(lines) * line + kBottomGap;
}

}  // namespace

void ShowLegend(GraphRecord& graph, const RECT& place) {
    if (graph.hwndLegend || graph.isMakingLegend) return;
    wchar_t title[kLegendTitleCapacity] = {};
    LoadStringW(moduleInstance, KOR_STRING_LEGEND, title, kLegendTitleCapacity);
    RegisterLegendClass(graph.hInstance);
    const int width = place.right - place.left;
    graph.isMakingLegend = true;  // creation sends messages in which a host may ask again
    graph.hwndLegend = CreateWindowExW(
        0, KORLEGEND_CLASS, title, WS_CHILD | WS_CAPTION | WS_VSCROLL, place.left, place.top, width,
        place.bottom - place.top, graph.hwnd,
        reinterpret_cast<HMENU>(static_cast<INT_PTR>(KORLEGEND_ID)), graph.hInstance, nullptr);
    graph.isMakingLegend = false;
    if (!graph.hwndLegend) return;
    POINT bottom = {0, SnappedHeight(graph.hwndLegend)};
    MapWindowPoints(graph.hwndLegend, graph.hwnd, &bottom, 1);
    MoveWindow(graph.hwndLegend, place.left, place.top, width, bottom.y - place.top, TRUE);
    if (graph.life.retired) return;  // a legend moved to another parent may outlive the chart
    AttachLegend(graph.hwndLegend, &graph);
    ShowWindow(graph.hwndLegend, SW_SHOW);
}

}  // namespace kor
