// A column is a polygon from the zero line to its value; a bar is the same rotated by 90 degrees.
// Where they are so thin that several share a pixel position, one line from the lowest end to the
// highest has the pixels of them all.
#include "graph/drawing/bars.h"

#include <algorithm>

#include "base/gdi_scopes.h"
#include "base/windows_helpers.h"
#include "graph/data/axes.h"
#include "graph/drawing/frame.h"
#include "graph/shapes/bar_layout.h"
#include "numbers/comparable.h"

namespace kor {

namespace {

// Pixels outside the view, enough that no part of a pen is visible.
constexpr LONG kBeyond = 2;

// The bars of a chart on its surface.
struct BarLayout {
    BarAxes axes;
    RECT view;
    int lowPixel;  // the view along the category axis
    int highPixel;
    int thickness;
};

// A bar from one pixel of the value axis to another, starting at a position on the category axis.
// Sides out of view are clamped to just outside it, because Polygon's time grows with each row that
// it spans, visible or not.
void DrawOneBar(HDC dc, const BarLayout& layout, int position, int from, int to) {
    const RECT& view = layout.view;
    const auto corner = [&](int along, int value) -> POINT {
        const Point place = PlaceOf(layout.axes, along, value);
        return {std::clamp<LONG>(place.x, view.left - kBeyond, view.right + kBeyond),
                std::clamp<LONG>(place.y, view.top - kBeyond, view.bottom + kBeyond)};
    };
    const int past = position + layout.thickness;
    const POINT corners[] = {corner(position, from), corner(position, to), corner(past, to),
                             corner(past, from)};
    Polygon(dc, corners, 4);
}

// The bars of the points [number, end), which share a position and have no thickness.
void DrawThinBarsTogether(HDC dc, const GraphSeries& series, const BarLayout& layout, int position,
                          int number, int end) {
    const PositionSummary found = Summarise(series.values, number, end);
    if (found.first < 0) return;
    const double least = series.values[found.lowest];
    const double most = series.values[found.highest];
    const int lowEnd = PixelAt(layout.axes.value, std::min(least, 0.0));
    const int highEnd = PixelAt(layout.axes.value, std::max(most, 0.0));
    if (lowEnd == highEnd) {  // a single point: the platform decides how it looks
        DrawOneBar(dc, layout, position, lowEnd, highEnd);
        return;
    }
    Point ends[] = {PlaceOf(layout.axes, position, lowEnd),
                    PlaceOf(layout.axes, position, highEnd + 1)};
    Polyline(dc, PlatformPoints(ends), 2);  // omits its last pixel
}

void DrawThinBars(HDC dc, const GraphSeries& series, const BarLayout& layout, PointRange range,
                  int offset) {
    for (PositionWalk walk(layout.axes.along, range); !walk.IsAtEnd(); walk.Next()) {
        DrawThinBarsTogether(dc, series, layout, walk.pixel() + offset, walk.number(), walk.end());
    }
}

void DrawThickBars(HDC dc, const GraphSeries& series, const BarLayout& layout, PointRange range,
                   int offset) {
    const int zero = PixelAt(layout.axes.value, 0);
    for (int number = range.first; number <= range.last; ++number) {
        const double value = series.values[number - 1];
        if (!IsFinite(value)) continue;
        DrawOneBar(dc, layout, PixelAt(layout.axes.along, number) + offset, zero,
                   PixelAt(layout.axes.value, value));
    }
}

void DrawBarSeries(HDC dc, const GraphSeries& series, const BarLayout& layout, int offset) {
    LocalGdiObject<HBRUSH> brush(CreateSolidBrush(series.colour));
    SelectScope selected(dc, brush.get());
    // A bar extends from its offset by its thickness, so the view is widened by both.
    const int reach = (offset < 0 ? -offset : offset) +
                      (layout.thickness < 0 ? -layout.thickness : layout.thickness) + 1;
    const PointRange range = PointsBetween(layout.axes.along, series.pointCount,
                                           layout.lowPixel - reach, layout.highPixel + reach);
    if (layout.thickness == 0) {
        DrawThinBars(dc, series, layout, range, offset);
    } else {
        DrawThickBars(dc, series, layout, range, offset);
    }
}

// A series without values keeps its position in the groups.
void DrawBarsInFrame(GraphRecord& graph, HDC dc, const BarAxes& axes, int thickness) {
    BeginFrame(graph, dc);
    const RECT view = PlotClip(graph);
    const BarLayout layout = {axes, view, axes.upright ? view.left : -view.bottom,
                              axes.upright ? view.right : -view.top,
                              ZoomedThickness(graph, thickness)};
    for (int i = 0; i < graph.seriesCount; ++i) {
        const GraphSeries* series = graph.series[i];
        if (!series || !series->values) continue;
        DrawBarSeries(dc, *series, layout, OffsetInGroup(i, graph.seriesCount, layout.thickness));
    }
    EndFrame(graph, dc);
}

}  // namespace

void DrawColumnChart(GraphRecord& graph, HDC dc) {
    DrawBarsInFrame(graph, dc, AxesOfColumns(XAxis(graph), YAxis(graph)), graph.barWidth);
}

void DrawBarChart(GraphRecord& graph, HDC dc) {
    DrawBarsInFrame(graph, dc, AxesOfBars(XAxis(graph), YAxis(graph)), graph.barHeight);
}

}  // namespace kor
