#include "graph/data/record.h"

#include <korcontrols/graph.h>

#include "base/local_text.h"
#include "graph/data/palette.h"
#include "graph/data/series.h"

namespace kor {

namespace {

constexpr COLORREF kBlack = RGB(0, 0, 0);
constexpr COLORREF kGridColour = RGB(0, 150, 150);
constexpr uint32_t kInitialOptions = 0x3FF;

void Delete(HGDIOBJ object) {
    if (object) DeleteObject(object);
}

}  // namespace

GraphRecord* CreateGraphRecord() {
    auto* graph = NewRecord<GraphRecord>();
    if (!graph) return nullptr;
    graph->hpenThick = CreatePen(PS_SOLID, 2, kBlack);
    graph->hpenThin = CreatePen(PS_SOLID, 1, kBlack);
    graph->hpenGrid = CreatePen(PS_SOLID, 1, kGridColour);
    graph->crBack = PaletteEntry(1);
    graph->labelHalfHeight = 10;
    graph->xTickHalfSpacing = 10;
    graph->labelMaxWidth = 10;
    graph->rcPlot = {0, 0, 1, 1};
    graph->options = kInitialOptions;
    graph->xAutoRange = 1;
    graph->yAutoRange = 1;
    graph->xDataMax = graph->yDataMax = 1.0;
    graph->zoom = 1.0;
    graph->marginBottom = graph->marginLeft = graph->marginRight = graph->marginTop = 15;
    graph->xLabelHeight = 1;
    graph->tickHalfLength = 3;
    ResetGraphRanges(*graph);
    return graph;
}

void FreeRecord(GraphRecord* graph) {
    if (graph->hbmMem) {
        SelectObject(graph->hdcMem, graph->blankBitmap);
        DeleteObject(graph->hbmMem);
    }
    if (graph->hdcMem) DeleteDC(graph->hdcMem);
    RemoveAllSeries(*graph);
    Delete(graph->hpenThick);
    Delete(graph->hpenThin);
    Delete(graph->hpenGrid);
    Delete(graph->hrgnClip);
    Delete(graph->hbrBack);
    Delete(graph->hfontTitle);
    Delete(graph->hfontYTitle);
    FreeLocal(graph->title);
    FreeLocal(graph->xAxisTitle);
    FreeLocal(graph->yAxisTitle);
    DeleteRecord(graph);
}

void ResetGraphRanges(GraphRecord& graph) {
    graph.xMax = graph.yMax = 1.0;
    graph.xMin = graph.yMin = 0.0;
    graph.xTickStep = graph.yTickStep = graph.xTickStepCopy = graph.yTickStepCopy = 1.0;
    graph.xCentre = graph.yCentre = 0.0;
    graph.xUnitsPerPixelBase = graph.yUnitsPerPixelBase = 1.0;
    graph.xUnitsPerPixel = graph.yUnitsPerPixel = 1.0;
    graph.xScale = graph.yScale = {};
    graph.barWidth = graph.barHeight = 1;
    graph.xAutoRange = graph.yAutoRange = 1;
}

RECT PlotArea(const GraphRecord& graph) {
    return {graph.rcPlot.left + graph.marginLeft, graph.rcPlot.top + graph.marginTop,
            graph.rcPlot.right - graph.marginRight, graph.rcPlot.bottom - graph.marginBottom};
}

Rect SurfaceOf(const GraphRecord& graph) {
    return {graph.rcPlot.left, graph.rcPlot.top, graph.rcPlot.right, graph.rcPlot.bottom};
}

bool HasOption(const GraphRecord& graph, uint32_t option) { return (graph.options & option) != 0; }

}  // namespace kor
