#include "graph/settings.h"

#include <utility>

#include "base/local_text.h"
#include "graph/data/axes.h"
#include "graph/data/choices.h"
#include "graph/drawing/layout.h"
#include "graph/drawing/redraw.h"

namespace kor {

namespace {

void LayOutAndRescale(GraphRecord& graph) {
    LayoutGraphMargins(graph, graph.hdcMem);
    Rescale(graph);
}

// Categories run along y in a bar chart, along x in all others.
void SwapAxes(GraphRecord& graph) {
    std::swap(graph.xMin, graph.yMin);
    std::swap(graph.xMax, graph.yMax);
    std::swap(graph.xAxisTitle, graph.yAxisTitle);
    LayOutAndRescale(graph);
}

void RefreshLegend(const GraphRecord& graph) {
    if (!graph.hwndLegend) return;
    SetScrollPos(graph.hwndLegend, SB_VERT, 0, TRUE);
    InvalidateRect(graph.hwndLegend, nullptr, FALSE);
    UpdateWindow(graph.hwndLegend);
}

}  // namespace

void SetTitle(GraphRecord& graph, wchar_t*& title, const wchar_t* text) {
    wchar_t* const copy = CopyText(text);  // copied first: it may be the title itself
    FreeLocal(title);
    title = copy;
    LayOutAndRescale(graph);
}

void SetChartType(GraphRecord& graph, int type) {
    if ((graph.chartType == kBar) != (type == kBar)) SwapAxes(graph);
    graph.chartType = type;
    RefreshLegend(graph);
    RedrawGraph(graph);
}

void ToggleOptions(GraphRecord& graph, uint32_t options) {
    graph.options ^= options;
    LayOutAndRescale(graph);
}

void SetZoomIndex(GraphRecord& graph, int index) {
    if (index < 0 || index >= kZoomCount) return;
    SetZoomFactor(graph, kZoomFactors[index]);
    RedrawGraph(graph);
}

int ZoomIndex(const GraphRecord& graph) { return PlaceOfZoom(graph.zoom); }

void SetBackgroundColour(GraphRecord& graph, COLORREF colour) {
    graph.crBack = colour;
    HBRUSH brush = CreateSolidBrush(colour);
    if (!brush) return;
    if (graph.hbrBack) DeleteObject(graph.hbrBack);
    graph.hbrBack = brush;
}

}  // namespace kor
