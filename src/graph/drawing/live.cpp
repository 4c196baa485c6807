#include "graph/drawing/live.h"

#include <algorithm>

#include "base/gdi_scopes.h"
#include "base/windows_helpers.h"
#include "graph/data/axes.h"
#include "graph/data/series.h"
#include "graph/drawing/frame.h"
#include "graph/scale/number_format.h"

namespace kor {

namespace {

constexpr int kSweepPoints = 3;
enum SweepPoint { kPrevious, kCurrent, kNewest };

// How far the traces reached in the last step of replace mode, one for all charts of the process.
// `known` is false until the first step.
struct LastReach {
    bool known;
    LONG top;
    LONG right;
    LONG bottom;
};

constinit LastReach lastReach = {};

// A sweep can start on an empty chart, to which this adds a series.
bool EnsureSeries(GraphRecord& graph) {
    if (graph.seriesCount > 0) return true;
    const double zeros[kSweepPoints] = {};
    return AddSeries(graph, {kSweepPoints, nullptr, zeros, 0});
}

void Sweep(GraphRecord& graph) {
    if (graph.liveIndex > graph.xMax) graph.liveIndex = 0;
    if (!EnsureSeries(graph)) return;
    GraphSeries& series = *graph.series[0];
    if (!series.liveBuffer || !series.values) return;
    POINT* points = series.liveBuffer;
    if (graph.liveIndex < 2) {
        points[kPrevious] = points[kCurrent] = {xPixel(graph, 0), yPixel(graph, 0)};
    } else {
        points[kPrevious] = points[kCurrent];
        points[kCurrent] = points[kNewest];
    }
    points[kNewest] = {xPixel(graph, graph.liveIndex), yPixel(graph, series.values[0])};
    series.livePointCount = kSweepPoints;
    InvalidateArea(graph.hwnd, {points[kCurrent].x - 1, graph.rcPlot.top, points[kNewest].x + 1,
                                graph.rcPlot.bottom});
    ++graph.liveIndex;
}

// The extent of the traces of all series: largest x and y, smallest y.
struct Reach {
    LONG right = -1000000;
    LONG bottom = -1000000;
    LONG top = 10000000;
};

void TraceSeries(const GraphRecord& graph, GraphSeries& series, Reach& reach) {
    series.livePointCount = series.pointCount;  // liveBuffer has room for at least this many
    for (int i = 1; i <= series.pointCount; ++i) {
        const POINT point = {xPixel(graph, i), yPixel(graph, series.values[i - 1])};
        series.liveBuffer[i - 1] = point;
        reach.right = std::max(reach.right, point.x);
        reach.bottom = std::max(reach.bottom, point.y);
        reach.top = std::min(reach.top, point.y);
    }
}

void Replace(GraphRecord& graph) {
    if (!lastReach.known) {
        lastReach = {true, graph.rcPlot.top, graph.rcPlot.right, graph.rcPlot.bottom};
    }
    Reach reach;
    for (int i = 0; i < graph.seriesCount; ++i) {
        GraphSeries* series = graph.series[i];
        if (series && series->values && series->liveBuffer) TraceSeries(graph, *series, reach);
    }
    InvalidateArea(graph.hwnd, {xPixel(graph, 1) - 1, std::min(lastReach.top, reach.top),
                                std::max(lastReach.right, reach.right),
                                std::max(lastReach.bottom, reach.bottom)});
    lastReach = {true, reach.top, reach.right, reach.bottom};
}

void DrawTrace(HDC dc, const GraphSeries& series) {
    const int count = std::min(series.livePointCount, std::max(series.pointCount, kSweepPoints));
    if (!series.liveBuffer || count < 2) return;
    LocalGdiObject<HPEN> pen(CreatePen(PS_SOLID, 1, series.colour));
    SelectScope selected(dc, pen.get());
    Polyline(dc, series.liveBuffer, count);
}

}  // namespace

void AdvanceLiveTrace(GraphRecord& graph) {
    if (!HasOption(graph, KORGRAPH_LIVE)) return;
    if (graph.dataMode == KORGRAPH_SWEEP) {
        Sweep(graph);
    } else if (graph.dataMode == KORGRAPH_REPLACE) {
        Replace(graph);
    }
}

void OnLiveUpdate(GraphRecord& graph, LPARAM argument) {
    if (!HasOption(graph, KORGRAPH_LIVE)) return;
    if (graph.dataMode == KORGRAPH_SWEEP) {
        const auto sample = static_cast<float>(static_cast<int32_t>(argument));
        SetSeriesValue(graph, {0, 0, static_cast<double>(sample)});
    } else if (graph.dataMode == KORGRAPH_REPLACE) {
        const auto* data = reinterpret_cast<const GraphSeriesData*>(argument);
        if (!data) return;
        ReplaceSeriesValues(graph, *data);
    }
    AdvanceLiveTrace(graph);
}

void PaintLiveRect(GraphRecord& graph, HDC dc, RECT area) {
    FillRect(dc, &area, graph.hbrBack);
    area = {area.left - 1, area.top - 1, area.right + 1, area.bottom + 1};
    ClipToPlot(graph, dc);
    DrawGridLines(graph, dc, &area);
    for (int i = 0; i < graph.seriesCount; ++i) {
        if (graph.series[i]) DrawTrace(dc, *graph.series[i]);
    }
    ClipToSurface(graph, dc);
    DrawXAxis(graph, dc);
}

}  // namespace kor
