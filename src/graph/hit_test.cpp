#include "graph/hit_test.h"

#include <cmath>

#include "base/assert.h"
#include "base/runtime.h"
#include "graph/data/series.h"
#include "graph/drawing/bars.h"
#include "graph/drawing/pie.h"
#include "graph/drawing/points.h"
#include "graph/scale/number_format.h"
#include "graph/scale/scale.h"

namespace kor {

namespace {

constexpr int kTolerance = 3;  // pixels each way
constexpr int kSharePrecision = 2;
constexpr double kDegreesPerRadian = 57.29577951308232;
constexpr int kNoPoint = -1;

// The angle is rounded to a double before it is compared, whatever the processor computes with.
double Rounded(double value) {
    volatile double stored = value;
    return stored;
}

int FindLinePoint(const GraphRecord& graph, const GraphSeries& series, int x, int y) {
    const PointRange range =
        PointsBetween(graph, xPixel, series.pointCount, x - kTolerance, x + kTolerance);
    for (int i = range.first; i <= range.last; ++i) {
        const double value = series.values[i - 1];
        if (!IsFinite(value)) continue;
        const int dx = xPixel(graph, i) - x;
        const int dy = yPixel(graph, value) - y;
        if (dx >= -kTolerance && dx <= kTolerance && dy >= -kTolerance && dy <= kTolerance) {
            return i - 1;
        }
    }
    return kNoPoint;
}

int FindColumn(const GraphRecord& graph, const GraphSeries& series, int offset, int width, int x,
               int y) {
    const int zero = yPixel(graph, 0);
    const PointRange range =
        PointsBetween(graph, xPixel, series.pointCount, x - offset - width, x - offset);
    for (int i = range.first; i <= range.last; ++i) {
        const double value = series.values[i - 1];
        const int left = xPixel(graph, i) + offset;
        if (!IsFinite(value) || x < left || x > left + width) continue;
        const int end = yPixel(graph, value);
        const bool hit = value >= 0 ? end <= y && y <= zero : zero <= y && y <= end;
        if (hit) return i - 1;
    }
    return kNoPoint;
}

int RowUpwards(const GraphRecord& graph, double pointNumber) { return -yPixel(graph, pointNumber); }

int FindBar(const GraphRecord& graph, const GraphSeries& series, int offset, int height, int x,
            int y) {
    const int zero = xPixel(graph, 0);
    const PointRange range =
        PointsBetween(graph, RowUpwards, series.pointCount, -(y + offset + height), -(y + offset));
    for (int i = range.first; i <= range.last; ++i) {
        const double value = series.values[i - 1];
        if (!IsFinite(value)) continue;
        const int end = xPixel(graph, value);
        const bool across = value > 0 ? zero <= x && x <= end : end <= x && x <= zero;
        const int row = yPixel(graph, i);
        if (across && row - offset - height <= y && y <= row - offset) return i - 1;
    }
    return kNoPoint;
}

int FindPoint(const GraphRecord& graph, int index, int x, int y) {
    const GraphSeries& series = *graph.series[index];
    switch (graph.chartType) {
    case kLine:
    case kArea: return FindLinePoint(graph, series, x, y);
    case kColumn: {
        const int width = ZoomedThickness(graph, graph.barWidth);
        const int offset = OffsetInGroup(index, graph.seriesCount, width);
        return FindColumn(graph, series, offset, width, x, y);
    }
    case kBar: {
        const int height = ZoomedThickness(graph, graph.barHeight);
        const int offset = OffsetInGroup(index, graph.seriesCount, height);
        return FindBar(graph, series, offset, height, x, y);
    }
    default: return kNoPoint;
    }
}

int FindSlice(const GraphRecord& graph, const GraphSeries& series, int x, int y) {
    const POINT centre = SurfaceCentre(graph);
    const double dx = x - centre.x;
    const double dy = centre.y - y;
    const double distance = std::sqrt(dx * dx + dy * dy);
    if (distance == 0 || TruncateToInt(distance) > LayoutPie(graph).radius) return kNoPoint;
    double angle = Rounded(std::acos(dy / distance) * kDegreesPerRadian);
    if (x > centre.x) angle = Rounded(360.0 - angle);
    double end = 0;
    for (int k = 0; k < series.pointCount; ++k) {
        const double start = end;
        end = Rounded(end + SliceShare(series, k) * 360.0);
        if (start <= angle && angle < end) return k;
    }
    return kNoPoint;
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
        const int slice = HasSlices(series) ? FindSlice(graph, *series, x, y) : kNoPoint;
        if (slice == kNoPoint) return 0;
        AppendNumber(text, SliceShare(*series, slice) * 100.0, kSharePrecision);
        wcscat(text, L"%\r\n");
        AppendValue(text, series->values[slice]);
        KOR_ASSERT(wcslen(text) < kTipTextCapacity);  // two numbers and nine characters
        return 1;
    }
    for (int i = 0; i < graph.seriesCount; ++i) {
        if (!graph.series[i] || !graph.series[i]->values) continue;
        const int point = FindPoint(graph, i, x, y);
        if (point == kNoPoint) continue;
        AppendValue(text, graph.series[i]->values[point]);
        return 1;
    }
    return 0;
}

}  // namespace kor
