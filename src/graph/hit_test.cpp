#include "graph/hit_test.h"

#include "base/assert.h"
#include "base/runtime.h"
#include "graph/data/axes.h"
#include "graph/data/series.h"
#include "graph/scale/number_format.h"
#include "graph/shapes/bar_layout.h"
#include "graph/shapes/points.h"
#include "numbers/comparable.h"

namespace kor {

namespace {

constexpr int kTolerance = 3;  // pixels each way
constexpr int kSharePrecision = 2;
constexpr int kNoPoint = -1;

int FindLinePoint(const ValueTrace& trace, Point at) {
    const PointRange range =
        PointsBetween(trace.x, trace.count, at.x - kTolerance, at.x + kTolerance);
    for (int i = range.first; i <= range.last; ++i) {
        const double value = trace.values[i - 1];
        if (!IsFinite(value)) continue;
        const int dx = PixelAt(trace.x, i) - at.x;
        const int dy = PixelAt(trace.y, value) - at.y;
        if (dx >= -kTolerance && dx <= kTolerance && dy >= -kTolerance && dy <= kTolerance) {
            return i - 1;
        }
    }
    return kNoPoint;
}

int FindBarPoint(const GraphRecord& graph, const ValueTrace& trace, int index, Point at) {
    const bool upright = graph.chartType == kColumn;
    const BarAxes axes = upright ? AxesOfColumns(trace.x, trace.y) : AxesOfBars(trace.x, trace.y);
    const int thickness = ZoomedThickness(graph, upright ? graph.barWidth : graph.barHeight);
    return FindBar(axes, trace.values, trace.count,
                   OffsetInGroup(index, graph.seriesCount, thickness), thickness, at);
}

int FindPoint(const GraphRecord& graph, int index, Point at) {
    const GraphSeries& series = *graph.series[index];
    const ValueTrace trace = {XAxis(graph), YAxis(graph), series.values, series.pointCount};
    switch (graph.chartType) {
    case kLine:
    case kArea: return FindLinePoint(trace, at);
    case kColumn:
    case kBar: return FindBarPoint(graph, trace, index, at);
    default: return kNoPoint;
    }
}

void AppendNumber(wchar_t* text, double value, int precision) {
    wchar_t number[kNumberTextCapacity];
    FormatGraphNumber(value, number, precision);
    wcscat(text, number);
}

void AppendValue(wchar_t* text, double value) {
    wcscat(text, L"Value:");
    AppendNumber(text, value, kGraphPrecision);
}

}  // namespace

int HitTestGraphValue(const GraphRecord& graph, int x, int y, wchar_t* text) {
    memset(text, 0, kTipTextCapacity * sizeof(wchar_t));
    if (graph.chartType == kPie) {
        const GraphSeries* series = SeriesAt(graph, 0);
        if (!HasSlices(series)) return 0;
        const Slices slices = SlicesOf(*series);
        const int slice =
            FindSlice(slices, CentreOf(SurfaceOf(graph)), LayoutPie(graph).radius, {x, y});
        if (slice == kNoPoint) return 0;
        AppendNumber(text, ShareOf(slices, slice) * 100.0, kSharePrecision);
        wcscat(text, L"%\r\n");
        AppendValue(text, series->values[slice]);
        KOR_ASSERT(wcslen(text) < kTipTextCapacity);  // two numbers and nine characters
        return 1;
    }
    for (int i = 0; i < graph.seriesCount; ++i) {
        if (!graph.series[i] || !graph.series[i]->values) continue;
        const int point = FindPoint(graph, i, {x, y});
        if (point == kNoPoint) continue;
        AppendValue(text, graph.series[i]->values[point]);
        return 1;
    }
    return 0;
}

}  // namespace kor
