// A column is a polygon from the zero line to its value; a bar is the same turned a quarter. Where
// they have become so thin that several share a pixel, a line from the lowest end to the highest
// has the pixels of them all.
#include "graph/graph_bars.h"

#include <algorithm>

#include "graph/graph_frame.h"
#include "graph/graph_numbers.h"
#include "graph/graph_points.h"
#include "graph/graph_scale.h"
#include "platform/gdi_scopes.h"

namespace kor {

namespace {

// So far outside the view that nothing of a pen is seen.
constexpr LONG kBeyond = 2;

// One way of laying out a chart's bars.
struct BarLayout {
    AlongAxis along;  // position of a point along the category axis, growing with its number
    int lowPixel;     // the view along that axis
    int highPixel;
    RECT view;
    int thickness;
    // Pixel of a value in the bar of a point, `across` pixels beside the point's own position.
    POINT (*place)(const GraphRecord& graph, int number, double value, int across);
    POINT growth;  // the pixel after another as values grow
};

// Rows grow downwards, point numbers upwards: turned round they grow together.
int RowUpwards(const GraphRecord& graph, double pointNumber) { return -yPixel(graph, pointNumber); }

POINT PlaceInColumn(const GraphRecord& graph, int number, double value, int across) {
    return {xPixel(graph, number) + across, yPixel(graph, value)};
}

POINT PlaceInBar(const GraphRecord& graph, int number, double value, int across) {
    return {xPixel(graph, value), yPixel(graph, number) - across};
}

// Sides that lie out of view are moved to just outside it: Polygon's time grows with each row that
// it spans, seen or not.
void DrawOneBar(const GraphRecord& graph, HDC dc, const BarLayout& layout, int number, double value,
                int offset) {
    const RECT& view = layout.view;
    const auto corner = [&](double at, int across) -> POINT {
        const POINT place = layout.place(graph, number, at, across);
        return {std::clamp(place.x, view.left - kBeyond, view.right + kBeyond),
                std::clamp(place.y, view.top - kBeyond, view.bottom + kBeyond)};
    };
    const int past = offset + layout.thickness;
    const POINT corners[] = {corner(0, offset), corner(value, offset), corner(value, past),
                             corner(0, past)};
    Polygon(dc, corners, 4);
}

// The bars of the points [number, end), which share a position and have no thickness.
void DrawThinBarsTogether(const GraphRecord& graph, HDC dc, const GraphSeries& series,
                          const BarLayout& layout, int number, int end, int offset) {
    const PositionSummary found = Summarise(series.values, number, end);
    if (found.first < 0) return;
    const double least = series.values[found.lowest];
    const double most = series.values[found.highest];
    const POINT low = layout.place(graph, number, std::min(least, 0.0), offset);
    const POINT high = layout.place(graph, number, std::max(most, 0.0), offset);
    if (low.x == high.x && low.y == high.y) {  // a point; the platform says what that looks like
        DrawOneBar(graph, dc, layout, number, most, offset);
        return;
    }
    const POINT ends[] = {low, {high.x + layout.growth.x, high.y + layout.growth.y}};
    Polyline(dc, ends, 2);  // leaves its last pixel out
}

void DrawThinBars(const GraphRecord& graph, HDC dc, const GraphSeries& series,
                  const BarLayout& layout, PointRange range, int offset) {
    for (int number = range.first; number <= range.last;) {
        const int end = EndOfPosition(graph, layout.along, range, number);
        DrawThinBarsTogether(graph, dc, series, layout, number, end, offset);
        number = end;
    }
}

void DrawThickBars(const GraphRecord& graph, HDC dc, const GraphSeries& series,
                   const BarLayout& layout, PointRange range, int offset) {
    for (int number = range.first; number <= range.last; ++number) {
        const double value = series.values[number - 1];
        if (IsFinite(value)) DrawOneBar(graph, dc, layout, number, value, offset);
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
                 {xPixel, view.left, view.right, view, thickness, PlaceInColumn, {0, -1}});
    });
}

void DrawBarChart(GraphRecord& graph, HDC dc) {
    DrawInFrame(graph, dc, [&] {
        const RECT view = PlotClip(graph);
        const int thickness = ZoomedThickness(graph, graph.barHeight);
        DrawBars(graph, dc,
                 {RowUpwards, -view.bottom, -view.top, view, thickness, PlaceInBar, {1, 0}});
    });
}

}  // namespace kor
