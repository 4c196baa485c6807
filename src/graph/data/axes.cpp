#include "graph/data/axes.h"

#include <korcontrols/graph.h>

#include <algorithm>
#include <cmath>

#include "numbers/truncate.h"

namespace kor {

namespace {

constexpr double kXTickPixels = 50.0;
constexpr double kYTickPixels = 25.0;

// To be called after any change of an axis' centre or units.
void UpdateScale(PixelScale& scale, double centre, double unitsPerPixel) {
    if constexpr (!kHasFloatingPoint) scale = MakePixelScale(centre, unitsPerPixel);
}

}  // namespace

Axis XAxis(const GraphRecord& graph) {
    return {graph.xCentre, graph.xUnitsPerPixel, graph.xCentrePixel, 1, &graph.xScale};
}

Axis YAxis(const GraphRecord& graph) {
    return {graph.yCentre, graph.yUnitsPerPixel, graph.yCentrePixel, -1, &graph.yScale};
}

int xPixel(const GraphRecord& graph, double x) { return PixelAt(XAxis(graph), x); }

int yPixel(const GraphRecord& graph, double y) { return PixelAt(YAxis(graph), y); }

void MoveXCentre(GraphRecord& graph, double by) {
    graph.xCentre += by;
    UpdateScale(graph.xScale, graph.xCentre, graph.xUnitsPerPixel);
}

void MoveYCentre(GraphRecord& graph, double by) {
    graph.yCentre += by;
    UpdateScale(graph.yScale, graph.yCentre, graph.yUnitsPerPixel);
}

void RescaleX(GraphRecord& graph) {
    if (!graph.hwnd) return;
    const RECT plot = PlotArea(graph);
    const int width = plot.right - plot.left;
    const AxisScale scale =
        ScaleAxis(graph.xMin, graph.xMax, width, graph.zoom, graph.seriesCount, kXTickPixels);
    graph.barWidth = scale.barSize;
    graph.xCentre = scale.centre;
    graph.xUnitsPerPixelBase = scale.unitsPerPixelBase;
    graph.xUnitsPerPixel = scale.unitsPerPixel;
    UpdateScale(graph.xScale, graph.xCentre, graph.xUnitsPerPixel);
    graph.xCentrePixel = graph.marginLeft + (width >> 1);
    graph.xTickStep = scale.tickStep;
    graph.xTickHalfSpacing = ((xPixel(graph, graph.xTickStep) - xPixel(graph, 0)) >> 1) - 2;
    if (graph.xTickStep == 0) graph.xTickStep = 1.0;
    graph.xTickStepCopy = graph.xTickStep;
}

void RescaleY(GraphRecord& graph) {
    if (!graph.hwnd) return;
    const RECT plot = PlotArea(graph);
    const int height = plot.bottom - plot.top;
    const AxisScale scale =
        ScaleAxis(graph.yMin, graph.yMax, height, graph.zoom, graph.seriesCount, kYTickPixels);
    graph.barHeight = scale.barSize;
    graph.yCentre = scale.centre;
    graph.yUnitsPerPixelBase = scale.unitsPerPixelBase;
    graph.yUnitsPerPixel = scale.unitsPerPixel;
    UpdateScale(graph.yScale, graph.yCentre, graph.yUnitsPerPixel);
    graph.yCentrePixel = graph.marginTop + (height >> 1);
    graph.yTickStep = scale.tickStep == 0 ? 1.0 : scale.tickStep;
    graph.yTickStepCopy = graph.yTickStep;
}

void Rescale(GraphRecord& graph) {
    RescaleX(graph);
    RescaleY(graph);
}

void AutoRange(GraphRecord& graph, int axis) {
    const bool isBar = graph.chartType == kBar;
    const bool ofPoints = (axis == KORGRAPH_X) != isBar;  // the category axis
    const double low = ofPoints ? graph.xDataMin : graph.yDataMin;
    const double high = ofPoints ? graph.xDataMax : graph.yDataMax;
    if (axis == KORGRAPH_X) {
        graph.xAutoRange = 1;
        graph.xMin = low;
        graph.xMax = high;
        RescaleX(graph);
    } else if (axis == KORGRAPH_Y) {
        graph.yAutoRange = 1;
        graph.yMin = low;
        graph.yMax = high;
        RescaleY(graph);
    }
}

namespace {

// Compatibility: the category axis of a bar chart ignores the requested range and follows the
// largest series (GraphBarCategoryRange.IgnoresTheEndsAndFollowsThePoints), of which only every
// second one counts (GraphBarCategoryRange.LooksAtEverySecondSeriesOnly).
void SetBarCategoryRange(GraphRecord& graph) {
    int largest = 0;
    for (int i = 0; i < graph.seriesCount; i += 2) {
        if (graph.series[i]) largest = std::max(largest, graph.series[i]->pointCount);
    }
    graph.yAutoRange = 1;
    graph.yMax = std::max(graph.yMax, largest + 1.0);
    RescaleY(graph);
}

}  // namespace

void SetRange(GraphRecord& graph, int axis, double low, double high) {
    const double shownHigh = high == low ? low + 1.0 : high;
    if (axis == KORGRAPH_X) {
        graph.xAutoRange = 0;
        graph.xMin = low;
        graph.xMax = shownHigh;
        RescaleX(graph);
    } else if (axis == KORGRAPH_Y && graph.chartType == kBar) {
        SetBarCategoryRange(graph);
    } else if (axis == KORGRAPH_Y) {
        graph.yAutoRange = 0;
        graph.yMin = low;
        graph.yMax = shownHigh;
        RescaleY(graph);
    }
}

void SetZoomFactor(GraphRecord& graph, double factor) {
    graph.zoom = std::fabs(factor);
    Rescale(graph);
}

int ZoomedThickness(const GraphRecord& graph, int thickness) {
    return graph.zoom >= 1.0 ? thickness : TruncateToInt(thickness * graph.zoom);
}

PieLayout LayoutPie(const GraphRecord& graph) {
    const bool titled = HasOption(graph, KORGRAPH_TITLE) && graph.title;
    return LayoutPie(SurfaceOf(graph), {graph.tipWidth, graph.tipHeight},
                     titled ? graph.marginTop : 0);
}

}  // namespace kor
