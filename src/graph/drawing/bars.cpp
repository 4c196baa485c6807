// A column is a polygon from the zero line to its value; a bar is the same turned a quarter. Where
// they have become so thin that several share a pixel, a line from the lowest end to the highest
// has the pixels of them all.
#include "graph/drawing/bars.h"

#include <algorithm>

#include "base/gdi_scopes.h"
#include "graph/drawing/frame.h"
#include "graph/drawing/points.h"
#include "graph/scale/number_format.h"
#include "graph/scale/scale.h"

namespace kor {

namespace {

// So far outside the view that nothing of a pen is seen.
constexpr LONG kBeyond = 2;

// One way of laying out a chart's bars. A place is a pixel along the category axis and one along
// the axis of the values.
struct BarLayout {
    AlongAxis along;  // position of a point along the category axis, growing with its number
    AlongAxis value;  // pixel of a value
    int lowPixel;     // the view along the category axis
    int highPixel;
    RECT view;
    int thickness;
    POINT (*place)(int along, int value);
    POINT growth;  // the pixel after another as values grow
};

// Rows grow downwards, point numbers upwards: turned round they grow together.
int RowUpwards(const GraphRecord& graph, double pointNumber) { return -yPixel(graph, pointNumber); }

POINT PlaceInColumn(int column, int row) { return {column, row}; }

POINT PlaceInBar(int rowUpwards, int column) { return {column, -rowUpwards}; }

// A bar from one pixel of the values' axis to another, beginning at a position on the categories'.
// Sides that lie out of view are moved to just outside it: Polygon's time grows with each row that
// it spans, seen or not.
void DrawOneBar(HDC dc, const BarLayout& layout, int position, int from, int to) {
    const RECT& view = layout.view;
    const auto corner = [&](int along, int value) -> POINT {
        const POINT place = layout.place(along, value);
        return {std::clamp(place.x, view.left - kBeyond, view.right + kBeyond),
                std::clamp(place.y, view.top - kBeyond, view.bottom + kBeyond)};
    };
    const int past = position + layout.thickness;
    const POINT corners[] = {corner(position, from), corner(position, to), corner(past, to),
                             corner(past, from)};
    Polygon(dc, corners, 4);
}

// The bars of the points [number, end), which share a position and have no thickness.
void DrawThinBarsTogether(const GraphRecord& graph, HDC dc, const GraphSeries& series,
                          const BarLayout& layout, int position, int number, int end) {
    const PositionSummary found = Summarise(series.values, number, end);
    if (found.first < 0) return;
    const double least = series.values[found.lowest];
    const double most = series.values[found.highest];
    const int lowEnd = layout.value(graph, std::min(least, 0.0));
    const int highEnd = layout.value(graph, std::max(most, 0.0));
    if (lowEnd == highEnd) {  // a point; the platform says what that looks like
        DrawOneBar(dc, layout, position, lowEnd, highEnd);
        return;
    }
    const POINT high = layout.place(position, highEnd);
    const POINT ends[] = {layout.place(position, lowEnd),
                          {high.x + layout.growth.x, high.y + layout.growth.y}};
    Polyline(dc, ends, 2);  // leaves its last pixel out
}

void DrawThinBars(const GraphRecord& graph, HDC dc, const GraphSeries& series,
                  const BarLayout& layout, PointRange range, int offset) {
    for (PositionWalk walk(graph, layout.along, range); !walk.IsAtEnd(); walk.Next()) {
        DrawThinBarsTogether(graph, dc, series, layout, walk.pixel() + offset, walk.number(),
                             walk.end());
    }
}

void DrawThickBars(const GraphRecord& graph, HDC dc, const GraphSeries& series,
                   const BarLayout& layout, PointRange range, int offset) {
    const int zero = layout.value(graph, 0);
    for (int number = range.first; number <= range.last; ++number) {
        const double value = series.values[number - 1];
        if (!IsFinite(value)) continue;
        DrawOneBar(dc, layout, layout.along(graph, number) + offset, zero,
                   layout.value(graph, value));
    }
}

void DrawBarSeries(const GraphRecord& graph, HDC dc, const GraphSeries& series,
                   const BarLayout& layout, int offset) {
    LocalGdiObject<HBRUSH> brush(CreateSolidBrush(series.colour));
    SelectScope selected(dc, brush.get());
    // A bar reaches from its offset over its thickness: widen the view by both.
    const int reach = (offset < 0 ? -offset : offset) +
                      (layout.thickness < 0 ? -layout.thickness : layout.thickness) + 1;
    const PointRange range = PointsBetween(graph, layout.along, series.pointCount,
                                           layout.lowPixel - reach, layout.highPixel + reach);
    if (layout.thickness == 0) {
        DrawThinBars(graph, dc, series, layout, range, offset);
    } else {
        DrawThickBars(graph, dc, series, layout, range, offset);
    }
}

// A series without values keeps its place in the groups.
void DrawBars(const GraphRecord& graph, HDC dc, const BarLayout& layout) {
    for (int i = 0; i < graph.seriesCount; ++i) {
        const GraphSeries* series = graph.series[i];
        if (!series || !series->values) continue;
        DrawBarSeries(graph, dc, *series, layout,
                      OffsetInGroup(i, graph.seriesCount, layout.thickness));
    }
}

}  // namespace

void DrawColumnChart(GraphRecord& graph, HDC dc) {
    DrawInFrame(graph, dc, [&] {
        const RECT view = PlotClip(graph);
        const int thickness = ZoomedThickness(graph, graph.barWidth);
        DrawBars(graph, dc,
                 {xPixel, yPixel, view.left, view.right, view, thickness, PlaceInColumn, {0, -1}});
    });
}

void DrawBarChart(GraphRecord& graph, HDC dc) {
    DrawInFrame(graph, dc, [&] {
        const RECT view = PlotClip(graph);
        const int thickness = ZoomedThickness(graph, graph.barHeight);
        DrawBars(
            graph, dc,
            {RowUpwards, xPixel, -view.bottom, -view.top, view, thickness, PlaceInBar, {1, 0}});
    });
}

}  // namespace kor
