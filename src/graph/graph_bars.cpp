// A column is a polygon from the zero line to its value; a bar is the same turned a quarter. Where
// they have become so thin that several share a pixel, the lowest and the highest cover them all.
#include "graph/graph_bars.h"

#include <algorithm>

#include "graph/graph_frame.h"
#include "graph/graph_numbers.h"
#include "graph/graph_points.h"
#include "graph/graph_scale.h"
#include "platform/gdi_scopes.h"

namespace kor {

namespace {

// One way of laying out a chart's bars.
struct BarLayout {
    AlongAxis along;  // position of a point along the category axis, growing with its number
    int lowPixel;     // the view along that axis
    int highPixel;
    int thickness;
    RECT (*place)(const GraphRecord& graph, int number, double value, int offset, int thickness);
};

// Rows grow downwards, point numbers upwards: turned round they grow together.
int RowUpwards(const GraphRecord& graph, double pointNumber) { return -yPixel(graph, pointNumber); }

// Opposite corners, in any order.
RECT PlaceColumn(const GraphRecord& graph, int number, double value, int offset, int thickness) {
    const int left = xPixel(graph, number) + offset;
    return {left, yPixel(graph, 0), left + thickness, yPixel(graph, value)};
}

RECT PlaceBar(const GraphRecord& graph, int number, double value, int offset, int thickness) {
    const int bottom = yPixel(graph, number) - offset;
    return {xPixel(graph, 0), bottom, xPixel(graph, value), bottom - thickness};
}

// Sides that lie out of view are moved to just outside it: Polygon's time grows with each row that
// it spans, seen or not.
void DrawBox(HDC dc, const RECT& view, const RECT& box) {
    const auto column = [&](LONG x) { return std::clamp(x, view.left - 2, view.right + 2); };
    const auto row = [&](LONG y) { return std::clamp(y, view.top - 2, view.bottom + 2); };
    const POINT corners[] = {{column(box.left), row(box.top)},
                             {column(box.left), row(box.bottom)},
                             {column(box.right), row(box.bottom)},
                             {column(box.right), row(box.top)}};
    Polygon(dc, corners, 4);
}

void DrawThinBars(const GraphRecord& graph, HDC dc, const GraphSeries& series,
                  const BarLayout& layout, PointRange range, int offset) {
    const RECT view = PlotClip(graph);
    const auto draw = [&](int number, double value) {
        DrawBox(dc, view, layout.place(graph, number, value, offset, 0));
    };
    for (int number = range.first; number <= range.last;) {
        const int end = EndOfPosition(graph, layout.along, range, number);
        const PositionSummary found = Summarise(series.values, number, end);
        if (found.first >= 0) {
            draw(number, series.values[found.lowest]);
            if (found.highest != found.lowest) draw(number, series.values[found.highest]);
        }
        number = end;
    }
}

void DrawThickBars(const GraphRecord& graph, HDC dc, const GraphSeries& series,
                   const BarLayout& layout, PointRange range, int offset) {
    const RECT view = PlotClip(graph);
    for (int number = range.first; number <= range.last; ++number) {
        const double value = series.values[number - 1];
        if (!IsFinite(value)) continue;
        DrawBox(dc, view, layout.place(graph, number, value, offset, layout.thickness));
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
        DrawBars(
            graph, dc,
            {xPixel, view.left, view.right, ZoomedThickness(graph, graph.barWidth), PlaceColumn});
    });
}

void DrawBarChart(GraphRecord& graph, HDC dc) {
    DrawInFrame(graph, dc, [&] {
        const RECT view = PlotClip(graph);
        DrawBars(graph, dc,
                 {RowUpwards, -view.bottom, -view.top, ZoomedThickness(graph, graph.barHeight),
                  PlaceBar});
    });
}

}  // namespace kor
