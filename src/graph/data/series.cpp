#include "graph/data/series.h"

#include <algorithm>
#include <cmath>

#include "base/local_text.h"
#include "base/records.h"
#include "graph/data/axes.h"
#include "graph/data/palette.h"
#include "numbers/comparable.h"

namespace kor {

namespace {

// The bytes of more values, points or labels than this would not fit into 31 bits.
constexpr int kMostValues = 0x7FFFFFFF / static_cast<int>(sizeof(double));

constexpr int kLeastLivePoints = 3;

double* AllocateValues(int count) {
    return static_cast<double*>(
        LocalAlloc(LMEM_FIXED, static_cast<SIZE_T>(count) * sizeof(double)));
}

// What one pass over values finds. NaNs and infinities are skipped.
struct Extremes {
    double minValue = 0;
    double maxValue = 0;
    int minIndex = 0;
    int maxIndex = 0;
    double absSum = 0;
};

// Copies values and finds their extremes in the same pass, because reading the memory is what costs
// time. `to` may be `from`. Ties keep the first index. The sum is taken in index order.
Extremes CopyFindingExtremes(double* to, const double* from, int count) {
    int i = 0;
    for (; i < count && !IsFinite(from[i]); ++i) to[i] = from[i];
    if (i == count) return {};
    Comparable least = ComparableOf(from[i]);
    Comparable most = least;
    int leastIndex = i;
    int mostIndex = i;
    double sum = 0;
    for (; i < count; ++i) {
        const double value = from[i];
        const Comparable compared = ComparableOf(value);
        to[i] = value;
        if (!(least <= compared && compared <= most)) {  // few are new extremes or NaNs
            if (!IsFinite(value)) continue;
            if (compared < least) {
                least = compared;
                leastIndex = i;
            } else {
                most = compared;
                mostIndex = i;
            }
        }
        sum += std::fabs(value);
    }
    return {to[leastIndex], to[mostIndex], leastIndex, mostIndex, sum};
}

// Fills the series' array from one with as many values, and finds its extremes.
void TakeValues(GraphSeries& series, const double* from) {
    const Extremes found = CopyFindingExtremes(series.values, from, series.pointCount);
    series.minValue = found.minValue;
    series.maxValue = found.maxValue;
    series.minIndex = found.minIndex;
    series.maxIndex = found.maxIndex;
    series.absSum = found.absSum;
}

// Copies the values. In live mode it also allocates the series' second buffer.
bool InitialiseSeries(GraphSeries& series, int count, const double* values, bool live) {
    series.values = AllocateValues(count);
    if (!series.values) return false;
    series.pointCount = count;
    TakeValues(series, values);
    if (!live) return true;
    series.liveBuffer =
        AllocateLocal<POINT>(static_cast<uint32_t>(std::max(count, kLeastLivePoints)));
    return series.liveBuffer != nullptr;
}

// The series keeps its number of points; missing values become 0.
void OverwriteValues(GraphSeries& series, const GraphSeriesData& data) {
    const int copied = std::clamp<int>(data.pointCount, 0, series.pointCount);
    std::copy_n(data.values, copied, series.values);
    std::fill(series.values + copied, series.values + series.pointCount, 0.0);
    TakeValues(series, series.values);
}

void FreeSeries(GraphSeries* series) {
    if (!series) return;
    FreeLocal(series->values);
    FreeLocal(series->name);
    FreeLocal(series->liveBuffer);
    DeleteRecord(series);
}

GraphSeries* CreateSeries(const GraphSeriesData& data, bool live) {
    auto* series = NewRecord<GraphSeries>();
    if (!series) return nullptr;
    const bool named = data.name && *data.name;
    const bool made = InitialiseSeries(*series, data.pointCount, data.values, live) &&
                      (!named || (series->name = CopyText(data.name)) != nullptr);
    if (made) return series;
    FreeSeries(series);
    return nullptr;
}

bool AppendSeries(GraphRecord& graph, GraphSeries* series) {
    auto* grown = AllocateLocal<GraphSeries*>(static_cast<uint32_t>(graph.seriesCount) + 1);
    if (!grown) return false;
    std::copy_n(graph.series, graph.seriesCount, grown);
    grown[graph.seriesCount] = series;
    FreeLocal(graph.series);
    graph.series = grown;
    ++graph.seriesCount;
    return true;
}

// Finds the extremes of all series together. The x extent never shrinks here; the least y is never
// above 0.
void FindDataExtremes(GraphRecord& graph) {
    graph.yDataMax = graph.series[0]->maxValue;
    graph.yDataMin = std::min(graph.series[0]->minValue, 0.0);
    for (int i = 0; i < graph.seriesCount; ++i) {
        const GraphSeries& series = *graph.series[i];
        graph.yDataMax = std::max(graph.yDataMax, series.maxValue);
        graph.yDataMin = std::min(graph.yDataMin, series.minValue);
        graph.xDataMax = std::max(graph.xDataMax, series.pointCount + 1.0);
    }
    if (graph.yDataMax == graph.yDataMin) graph.yDataMax = graph.yDataMin + 1.0;
}

void FollowData(GraphRecord& graph) {
    if (graph.xAutoRange) AutoRange(graph, KORGRAPH_X);
    if (graph.yAutoRange) AutoRange(graph, KORGRAPH_Y);
}

// The value that a rescan begins with; 0 if no value is finite.
double FirstFiniteValue(const GraphSeries& series) {
    const double* begin = series.values;
    const double* end = begin + series.pointCount;
    const double* first = std::find_if(begin, end, IsFinite);
    return first == end ? 0.0 : *first;
}

// Finds the largest value again. Compatibility: its index changes only for a value larger than the
// first one (GraphSetValue.IndexOfAFirstMaximumIsNotSetByTheScan).
void RescanMaximum(GraphSeries& series) {
    series.maxValue = FirstFiniteValue(series);
    series.absSum = 0;
    for (int i = 0; i < series.pointCount; ++i) {
        const double value = series.values[i];
        if (!IsFinite(value)) continue;
        if (value > series.maxValue) {
            series.maxValue = value;
            series.maxIndex = i;
        }
        series.absSum += value < 0 ? -value : value;
    }
}

void RescanMinimum(GraphSeries& series) {
    series.minValue = FirstFiniteValue(series);
    series.absSum = 0;
    for (int i = 0; i < series.pointCount; ++i) {
        const double value = series.values[i];
        if (!IsFinite(value)) continue;
        if (value < series.minValue) {
            series.minValue = value;
            series.minIndex = i;
        }
        series.absSum += value < 0 ? -value : value;
    }
}

void StoreValue(GraphSeries& series, int index, double value) {
    series.values[index] = value;
    if (value < series.minValue && IsFinite(value)) {
        series.minValue = value;
        series.minIndex = index;
    }
    if (value > series.maxValue && IsFinite(value)) {
        series.maxValue = value;
        series.maxIndex = index;
    }
    // Compatibility: a value that is neither extreme leaves the sum stale
    // (GraphSetValue.SumStaysStaleWhenNeitherExtremeChanges).
    if (index == series.maxIndex) {
        RescanMaximum(series);
    } else if (index == series.minIndex) {
        RescanMinimum(series);
    }
}

void RemoveCategories(GraphRecord& graph) {
    if (graph.categoryLabels) {
        for (int i = 0; i < graph.categoryCount; ++i) FreeLocal(graph.categoryLabels[i]);
    }
    FreeLocal(graph.categoryLabels);
}

}  // namespace

bool AddSeries(GraphRecord& graph, const GraphSeriesData& data) {
    if (!data.values || data.pointCount < 1 || data.pointCount > kMostValues) return false;
    GraphSeries* series = CreateSeries(data, HasOption(graph, KORGRAPH_LIVE));
    if (!series) return false;
    if (!AppendSeries(graph, series)) {
        FreeSeries(series);
        return false;
    }
    FindDataExtremes(graph);
    series->colour = ColourOfSeriesNumber(graph.seriesCount);
    FollowData(graph);
    return true;
}

void SetSeriesValue(GraphRecord& graph, const GraphValue& point) {
    GraphSeries* series = SeriesAt(graph, point.seriesIndex);
    if (!series) return;
    if (series->values && point.pointIndex >= 0 && point.pointIndex < series->pointCount) {
        StoreValue(*series, point.pointIndex, point.value);
    }
    FollowData(graph);
}

void ReplaceSeriesValues(GraphRecord& graph, const GraphSeriesData& data) {
    GraphSeries* series = SeriesAt(graph, data.seriesIndex);
    if (!series) return;
    if (data.values && series->values) {
        OverwriteValues(*series, data);
    } else if (data.values && data.pointCount >= 1) {
        InitialiseSeries(*series, data.pointCount, data.values, HasOption(graph, KORGRAPH_LIVE));
    }
    FollowData(graph);
}

void RemoveAllSeries(GraphRecord& graph) {
    for (int i = 0; i < graph.seriesCount; ++i) FreeSeries(graph.series[i]);
    FreeLocal(graph.series);
    graph.seriesCount = 0;
    graph.xDataMax = graph.yDataMax = 1.0;
    graph.xDataMin = graph.yDataMin = 0.0;
    RemoveCategories(graph);
}

bool SetCategories(GraphRecord& graph, int count, const wchar_t* const* labels) {
    RemoveCategories(graph);
    graph.categoryCount = 0;
    if (count < 1) return true;
    if (count > kMostValues) return false;
    graph.categoryLabels = AllocateLocal<wchar_t*>(static_cast<uint32_t>(count));
    if (!graph.categoryLabels) return false;
    graph.categoryCount = count;
    if (!labels) return true;
    for (int i = 0; i < count; ++i) {
        if (!labels[i]) continue;
        const size_t length = wcslen(labels[i]);
        auto* label = AllocateLocal<wchar_t>(static_cast<uint32_t>(length) + 1);
        if (!label) return false;
        memcpy(label, labels[i], length * sizeof(wchar_t));
        graph.categoryLabels[i] = label;
    }
    return true;
}

GraphSeries* SeriesAt(const GraphRecord& graph, int index) {
    return index >= 0 && index < graph.seriesCount ? graph.series[index] : nullptr;
}

COLORREF SeriesColour(const GraphRecord& graph, int index) {
    if (graph.chartType == kPie) return SliceColour(index);
    const GraphSeries* series = SeriesAt(graph, index);
    return series ? series->colour : 0;
}

const wchar_t* SeriesName(const GraphRecord& graph, int index) {
    const GraphSeries* series = SeriesAt(graph, index);
    return series ? series->name : nullptr;
}

bool HasSlices(const GraphSeries* series) {
    return series && series->values && series->absSum > 0 && IsFinite(series->absSum);
}

Slices SlicesOf(const GraphSeries& series) {
    return {series.values, series.pointCount, series.absSum};
}

}  // namespace kor
