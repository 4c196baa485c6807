#include "graph/graph_points.h"

#include <algorithm>

#include "graph/graph_numbers.h"
#include "graph/graph_scale.h"
#include "platform/local_text.h"

namespace kor {

namespace {

// The first number in [low, high) whose position is at least `pixel`; high when there is none.
int FirstAtOrPast(const GraphRecord& graph, AlongAxis along, int low, int high, int pixel) {
    while (low < high) {
        const int middle = low + (high - low) / 2;
        if (along(graph, middle) >= pixel) {
            high = middle;
        } else {
            low = middle + 1;
        }
    }
    return low;
}

}  // namespace

PointRange PointsBetween(const GraphRecord& graph, AlongAxis along, int count, int lowPixel,
                         int highPixel) {
    const int first = FirstAtOrPast(graph, along, 1, count + 1, lowPixel);
    const int past = FirstAtOrPast(graph, along, first, count + 1, highPixel + 1);
    return {std::max(first - 1, 1), std::min(past, count)};
}

int EndOfPosition(const GraphRecord& graph, AlongAxis along, PointRange range, int number) {
    const int position = along(graph, number);
    // Positions are evenly spread: widen the steps until one is past, then look closer.
    int step = 1;
    int low = number;
    while (low + step <= range.last && along(graph, low + step) == position) {
        low += step;
        step *= 2;
    }
    const int high = std::min(low + step, range.last + 1);
    return FirstAtOrPast(graph, along, low + 1, high, position + 1);
}

PositionSummary Summarise(const double* values, int number, int end) {
    PositionSummary found = {-1, -1, -1, -1};
    for (int i = number - 1; i < end - 1; ++i) {
        const double value = values[i];
        if (!IsFinite(value)) continue;
        if (found.first < 0) found = {i, i, i, i};
        if (value < values[found.lowest]) found.lowest = i;
        if (value > values[found.highest]) found.highest = i;
        found.last = i;
    }
    return found;
}

SeriesPoints::~SeriesPoints() { FreeLocal(points_); }

void SeriesPoints::Append(const GraphRecord& graph, const GraphSeries& series, int column,
                          int index) {
    points_[spare_ + count_++] = {column, yPixel(graph, series.values[index])};
}

void SeriesPoints::AppendPosition(const GraphRecord& graph, const GraphSeries& series, int number,
                                  int end) {
    const PositionSummary found = Summarise(series.values, number, end);
    if (found.first < 0) return;
    const int column = xPixel(graph, number);
    int order[] = {found.first, found.lowest, found.highest, found.last};
    if (order[1] > order[2]) std::swap(order[1], order[2]);
    int previous = -1;
    for (const int index : order) {
        if (index != previous) Append(graph, series, column, index);
        previous = index;
    }
}

void SeriesPoints::AppendWhole(const GraphRecord& graph, const GraphSeries& series, int number,
                               int end) {
    for (int i = number; i < end; ++i) {
        if (IsFinite(series.values[i - 1])) Append(graph, series, xPixel(graph, i), i - 1);
    }
}

bool SeriesPoints::Make(const GraphRecord& graph, const GraphSeries& series, int left, int right,
                        LastPosition lastPosition, int spare) {
    constexpr int kPointsPerPosition = 4;
    const PointRange range = PointsBetween(graph, xPixel, series.pointCount, left, right);
    const int all = std::max(range.last - range.first + 1, 0);
    int lastPositionStart = range.last + 1;
    if (lastPosition == LastPosition::whole && all > 0) {
        const int column = xPixel(graph, range.last);
        lastPositionStart = FirstAtOrPast(graph, xPixel, range.first, range.last, column);
    }
    // Positions in view, one on each side of it, and what is kept whole.
    const int positions = std::max(right - left, 0) + 4;
    const int most =
        std::min(all, positions * kPointsPerPosition + range.last + 1 - lastPositionStart);
    points_ = static_cast<POINT*>(
        LocalAlloc(LMEM_FIXED, static_cast<SIZE_T>(most + 2 * spare) * sizeof(POINT)));
    if (!points_) return false;
    spare_ = spare;
    const PointRange summarised = {range.first, lastPositionStart - 1};
    for (int number = summarised.first; number <= summarised.last;) {
        const int end = EndOfPosition(graph, xPixel, summarised, number);
        AppendPosition(graph, series, number, end);
        number = end;
    }
    AppendWhole(graph, series, lastPositionStart, range.last + 1);
    return true;
}

}  // namespace kor
