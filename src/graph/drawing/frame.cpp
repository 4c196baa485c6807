#include "graph/drawing/frame.h"

#include <korcontrols/graph.h>

#include <algorithm>

#include "base/gdi_scopes.h"
#include "graph/data/axes.h"
#include "graph/scale/ticks.h"

namespace kor {

namespace {

constexpr int kArrowTip = 10;  // pixels from the plot's edge
constexpr int kArrowBase = 3;
constexpr int kArrowHalf = 5;

void DrawLine(HDC dc, int fromX, int fromY, int toX, int toY) {
    const POINT ends[] = {{fromX, fromY}, {toX, toY}};
    Polyline(dc, ends, 2);
}

// Draws a pan arrow if there is something to pan to, and records it.
void DrawArrow(GraphRecord& graph, HDC dc, uint32_t bit, bool shown, Triangle& place,
               const Triangle& triangle) {
    if (!shown) {
        graph.panArrows &= ~bit;
        return;
    }
    graph.panArrows |= bit;
    place = triangle;
    Polygon(dc, place.points, 3);
}

void DrawXArrows(GraphRecord& graph, HDC dc, const RECT& plot, int y) {
    const int left = plot.left;
    const int right = plot.right;
    DrawArrow(graph, dc, kPanLeft, xPixel(graph, graph.xMin) < left, graph.arrowLeft,
              {{{left - kArrowTip, y},
                {left - kArrowBase, y - kArrowHalf},
                {left - kArrowBase, y + kArrowHalf}}});
    DrawArrow(graph, dc, kPanRight, xPixel(graph, graph.xMax) > right, graph.arrowRight,
              {{{right + kArrowTip, y},
                {right + kArrowBase, y - kArrowHalf},
                {right + kArrowBase, y + kArrowHalf}}});
}

void DrawYArrows(GraphRecord& graph, HDC dc, const RECT& plot, int x) {
    const int top = plot.top;
    const int bottom = plot.bottom;
    DrawArrow(graph, dc, kPanUp, yPixel(graph, graph.yMax) < top, graph.arrowUp,
              {{{x, top - kArrowTip},
                {x - kArrowHalf, top - kArrowBase},
                {x + kArrowHalf, top - kArrowBase}}});
    DrawArrow(graph, dc, kPanDown, yPixel(graph, graph.yMin) > bottom, graph.arrowDown,
              {{{x, bottom + kArrowTip},
                {x - kArrowHalf, bottom + kArrowBase},
                {x + kArrowHalf, bottom + kArrowBase}}});
}

}  // namespace

void FillBackground(const GraphRecord& graph, HDC dc) {
    FillRect(dc, &graph.rcPlot, graph.hbrBack);
}

void ClipToArea(const GraphRecord& graph, HDC dc, const RECT& area) {
    SetRectRgn(graph.hrgnClip, area.left, area.top, area.right, area.bottom);
    SelectObject(dc, graph.hrgnClip);
}

void ClipToPlot(const GraphRecord& graph, HDC dc) { ClipToArea(graph, dc, PlotArea(graph)); }

RECT PlotClip(const GraphRecord& graph) {
    const RECT plot = PlotArea(graph);
    return {std::min(plot.left, plot.right), std::min(plot.top, plot.bottom),
            std::max(plot.left, plot.right), std::max(plot.top, plot.bottom)};
}

void ClipToSurface(const GraphRecord& graph, HDC dc) {
    const RECT& whole = graph.rcPlot;
    ClipToArea(graph, dc, {whole.left, whole.top, whole.right + 1, whole.bottom + 1});
}

void DrawGridLines(const GraphRecord& graph, HDC dc, const RECT* bounds) {
    const RECT plot = PlotArea(graph);
    const RECT& surface = graph.rcPlot;
    const RECT area = bounds ? *bounds
                             : RECT{graph.marginLeft, plot.top,
                                    surface.right - surface.left - graph.marginRight, plot.bottom};
    SelectScope pen(dc, graph.hpenGrid);
    if (HasOption(graph, KORGRAPH_HORIZONTALGRID)) {
        TickWalk tick(YAxis(graph), graph.yTickStepCopy, area.top, area.bottom);
        while (tick.Next()) DrawLine(dc, area.left, tick.pixel(), area.right, tick.pixel());
    }
    if (HasOption(graph, KORGRAPH_VERTICALGRID)) {
        TickWalk tick(XAxis(graph), graph.xTickStepCopy, area.left, area.right);
        while (tick.Next()) DrawLine(dc, tick.pixel(), area.top, tick.pixel(), area.bottom);
    }
}

void DrawXAxis(GraphRecord& graph, HDC dc) {
    const RECT plot = PlotArea(graph);
    int y = yPixel(graph, 0);
    if (y < plot.top || y > plot.bottom) y = plot.bottom;
    {
        SelectScope pen(dc, graph.hpenThick);
        DrawLine(dc, plot.left, y, plot.right, y);
        DrawXArrows(graph, dc, plot, y);
    }
    if (!HasOption(graph, KORGRAPH_XTICKS)) return;
    SelectScope pen(dc, graph.hpenThin);
    const int half = graph.tickHalfLength;
    TickWalk tick(XAxis(graph), graph.xTickStep, plot.left, plot.right);
    while (tick.Next()) DrawLine(dc, tick.pixel(), y - half, tick.pixel(), y + half);
}

void DrawYAxis(GraphRecord& graph, HDC dc) {
    const RECT plot = PlotArea(graph);
    // Compatibility: the margin is added on the right, not subtracted, so an axis whose zero lies
    // far to the right is out of sight (GraphYAxis.IsOutOfSightBeyondTheRightMarginAddedToTheEdge).
    const int rightmost = graph.rcPlot.right + graph.marginRight;
    int x = xPixel(graph, 0);
    if (x < plot.left) x = plot.left;
    if (x > rightmost) x = rightmost;
    {
        SelectScope pen(dc, graph.hpenThick);
        DrawLine(dc, x, plot.top, x, plot.bottom);
        DrawYArrows(graph, dc, plot, x);
    }
    if (!HasOption(graph, KORGRAPH_YTICKS)) return;
    SelectScope pen(dc, graph.hpenThin);
    const int half = graph.tickHalfLength;
    TickWalk tick(YAxis(graph), graph.yTickStep, plot.top, plot.bottom);
    while (tick.Next()) DrawLine(dc, x - half, tick.pixel(), x + half, tick.pixel());
}

void BeginFrame(const GraphRecord& graph, HDC dc) {
    FillBackground(graph, dc);
    DrawGraphTitle(graph, dc);
    DrawGridLines(graph, dc, nullptr);
    ClipToPlot(graph, dc);
}

void EndFrame(GraphRecord& graph, HDC dc) {
    ClipToSurface(graph, dc);
    DrawXAxis(graph, dc);
    DrawYAxis(graph, dc);
    DrawXAxisLabels(graph, dc);
    DrawYAxisLabels(graph, dc);
    DrawXAxisTitle(graph, dc);
    DrawYAxisTitle(graph, dc);
    if (graph.hwnd) InvalidateRect(graph.hwnd, nullptr, FALSE);
}

}  // namespace kor
