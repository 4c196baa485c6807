#include "graph/drawing/lines.h"

#include "base/gdi_scopes.h"
#include "graph/data/axes.h"
#include "graph/drawing/area.h"
#include "graph/drawing/frame.h"
#include "graph/drawing/series_points.h"

namespace kor {

namespace {

bool HasValues(const GraphSeries* series) { return series && series->values; }

void DrawLineSeries(const GraphRecord& graph, HDC dc, const GraphSeries& series) {
    LocalGdiObject<HPEN> pen(CreatePen(PS_SOLID, 1, series.colour));
    SelectScope selected(dc, pen.get());
    const RECT view = PlotClip(graph);
    SeriesPoints points;
    if (!points.Make(TraceOf(graph, series), view.left - 1, view.right + 1, PointsOf::polyline, 0))
        return;
    if (points.count() > 1) Polyline(dc, points.begin(), points.count());
    if (graph.chartType == kLine) DrawSeriesMarkers(graph, dc, series);
}

// The polygon begins and ends on the zero line, at the first and the last point.
void DrawAreaSeries(const GraphRecord& graph, HDC dc, const GraphSeries& series) {
    LocalGdiObject<HBRUSH> brush(CreateSolidBrush(series.colour));
    SelectScope selected(dc, brush.get());
    const RECT view = PlotClip(graph);
    constexpr int kBasePoint = 1;
    constexpr int kClosingPoint = 1;
    SeriesPoints points;
    if (!points.Make(TraceOf(graph, series), view.left - 1, view.right + 1, PointsOf::polygon,
                     kBasePoint + kClosingPoint)) {
        return;
    }
    const int base = yPixel(graph, 0);
    POINT* corners = points.begin() - kBasePoint;
    const int count = points.count() + 2 * kBasePoint;
    corners[0] = {xPixel(graph, 1), base};
    corners[count - 1] = {xPixel(graph, series.pointCount), base};
    // DrawArea closes the outline after its last corner, in the second spare element there.
    DrawArea(dc, view, {corners, count});
}

}  // namespace

void DrawLineChart(GraphRecord& graph, HDC dc) {
    BeginFrame(graph, dc);
    for (int i = 0; i < graph.seriesCount; ++i) {
        if (HasValues(graph.series[i])) DrawLineSeries(graph, dc, *graph.series[i]);
    }
    EndFrame(graph, dc);
}

// The first series lies on top, so it is drawn last.
void DrawAreaChart(GraphRecord& graph, HDC dc) {
    BeginFrame(graph, dc);
    for (int i = graph.seriesCount - 1; i >= 0; --i) {
        if (HasValues(graph.series[i])) DrawAreaSeries(graph, dc, *graph.series[i]);
    }
    EndFrame(graph, dc);
}

}  // namespace kor
