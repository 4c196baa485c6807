// A column is a polygon from the zero line to its value; a bar is the same turned a quarter. Where
// they have become so thin that several share a pixel, the lowest and the highest cover them all.
#include "graph/graph_bars.h"

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
    void (*draw)(const GraphRecord& graph, HDC dc, int number, double value, int offset,
                 int thickness);
};

// Rows grow downwards, point numbers upwards: turned round they grow together.
int RowUpwards(const GraphRecord& graph, double pointNumber) { return -yPixel(graph, pointNumber); }

void DrawColumn(const GraphRecord& graph, HDC dc, int number, double value, int offset,
                int thickness) {
    const int base = yPixel(graph, 0);
    const int left = xPixel(graph, number) + offset;
    const int end = yPixel(graph, value);
    const POINT corners[] = {
        {left, base}, {left, end}, {left + thickness, end}, {left + thickness, base}};
    Polygon(dc, corners, 4);
}

void DrawBar(const GraphRecord& graph, HDC dc, int number, double value, int offset,
             int thickness) {
    const int base = xPixel(graph, 0);
    const int top = yPixel(graph, number) - offset;
    const int end = xPixel(graph, value);
    const POINT corners[] = {
        {base, top}, {end, top}, {end, top - thickness}, {base, top - thickness}};
    Polygon(dc, corners, 4);
}

void DrawThinBars(const GraphRecord& graph, HDC dc, const GraphSeries& series,
                  const BarLayout& layout, PointRange range, int offset) {
    for (int number = range.first; number <= range.last;) {
        const int end = EndOfPosition(graph, layout.along, range, number);
        const PositionSummary found = Summarise(series.values, number, end);
        if (found.first >= 0) {
            layout.draw(graph, dc, number, series.values[found.lowest], offset, 0);
            if (found.highest != found.lowest) {
                layout.draw(graph, dc, number, series.values[found.highest], offset, 0);
            }
        }
        number = end;
    }
}

void DrawThickBars(const GraphRecord& graph, HDC dc, const GraphSeries& series,
                   const BarLayout& layout, PointRange range, int offset) {
    for (int number = range.first; number <= range.last; ++number) {
        const double value = series.values[number - 1];
        if (IsFinite(value)) layout.draw(graph, dc, number, value, offset, layout.thickness);
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
            {xPixel, view.left, view.right, ZoomedThickness(graph, graph.barWidth), DrawColumn});
    });
}

void DrawBarChart(GraphRecord& graph, HDC dc) {
    DrawInFrame(graph, dc, [&] {
        const RECT view = PlotClip(graph);
        DrawBars(graph, dc,
                 {RowUpwards, -view.bottom, -view.top, ZoomedThickness(graph, graph.barHeight),
                  DrawBar});
    });
}

}  // namespace kor
