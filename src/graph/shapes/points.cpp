#include "graph/drawing/points.h"

#include <algorithm>

#include "base/assert.h"
#include "base/local_text.h"
#include "graph/scale/number_format.h"
#include "graph/scale/scale.h"

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

// Values that are no numbers have no point: the line goes on to the next value that is one, even
// far outside the view, and ends at the last.
PointRange WithNumbersAtEnds(const GraphSeries& series, PointRange range) {
    const double* values = series.values;
    while (range.first > 1 && !IsFinite(values[range.first - 1])) --range.first;
    while (range.last < series.pointCount && !IsFinite(values[range.last - 1])) ++range.last;
    while (range.last >= range.first && !IsFinite(values[range.last - 1])) --range.last;
    return range;
}

}  // namespace

PointRange PointsBetween(const GraphRecord& graph, AlongAxis along, int count, int lowPixel,
                         int highPixel) {
    const int first = FirstAtOrPast(graph, along, 1, count + 1, lowPixel);
    const int past = FirstAtOrPast(graph, along, first, count + 1, highPixel + 1);
    return {std::max(first - 1, 1), std::min(past, count)};
}

PositionWalk::PositionWalk(const GraphRecord& graph, AlongAxis along, PointRange range)
    : graph_(graph), along_(along), range_(range), number_(range.first), end_(range.first) {
    if (IsAtEnd()) return;
    pixel_ = along(graph, number_);
    FindEnd(number_ + 1);
}

void PositionWalk::Next() {
    const int length = end_ - number_;
    number_ = end_;
    pixel_ = endPixel_;
    if (!IsAtEnd()) FindEnd(number_ + length);
}

// Positions are evenly spread, so each has as many points as the one before, or one more or less.
void PositionWalk::FindEnd(int expected) {
    low_ = number_;
    end_ = range_.last + 1;
    if (expected < end_) Try(expected);
    if (low_ == expected) {
        for (int step = 1; step < end_ - low_; step *= 2) Try(low_ + step);
    } else if (end_ - low_ > 1) {
        Try(end_ - 1);
    }
    while (end_ - low_ > 1) Try(low_ + (end_ - low_) / 2);
}

// Narrows the place of the end by a point between the two that are known.
void PositionWalk::Try(int number) {
    const int pixel = along_(graph_, number);
    if (pixel == pixel_) {
        low_ = number;
    } else {
        end_ = number;
        endPixel_ = pixel;
    }
}

PositionSummary Summarise(const double* values, int number, int end) {
    int i = number - 1;
    while (i < end - 1 && !IsFinite(values[i])) ++i;
    if (i == end - 1) return {-1, -1, -1, -1};
    Comparable least = ComparableOf(values[i]);
    Comparable most = least;
    PositionSummary found = {i, i, i, end - 2};
    for (++i; i < end - 1; ++i) {
        const Comparable value = ComparableOf(values[i]);
        if (least <= value && value <= most) continue;  // nearly always, so nothing else is asked
        if (!IsFinite(values[i])) continue;
        if (value < least) {
            least = value;
            found.lowest = i;
        } else {
            most = value;
            found.highest = i;
        }
    }
    while (!IsFinite(values[found.last])) --found.last;
    return found;
}

SeriesPoints::~SeriesPoints() { FreeLocal(points_); }

void SeriesPoints::Append(const GraphRecord& graph, const GraphSeries& series, int column,
                          int index) {
    KOR_ASSERT(count_ < capacity_);
    points_[spare_ + count_++] = {column, yPixel(graph, series.values[index])};
}

// The first and the last point, and between them each extreme that lies beyond both. Those are all
// different points, even where values tie: so at most four, and never more than there are.
void SeriesPoints::AppendPosition(const GraphRecord& graph, const GraphSeries& series, int column,
                                  int number, int end) {
    const PositionSummary found = Summarise(series.values, number, end);
    if (found.first < 0) return;
    const auto valueOf = [&](int index) { return ComparableOf(series.values[index]); };
    const Comparable first = valueOf(found.first);
    const Comparable last = valueOf(found.last);
    const bool reachesLower = valueOf(found.lowest) < std::min(first, last);
    const bool reachesHigher = valueOf(found.highest) > std::max(first, last);
    // Either way over both extremes has the same pixels; this is the shorter one.
    const bool highestFirst = first > last;
    Append(graph, series, column, found.first);
    if (reachesHigher && highestFirst) Append(graph, series, column, found.highest);
    if (reachesLower) Append(graph, series, column, found.lowest);
    if (reachesHigher && !highestFirst) Append(graph, series, column, found.highest);
    if (found.last != found.first) Append(graph, series, column, found.last);
}

// Point end - 1 is there. The polyline's last pixel is that of its last points, as many as share
// it: a line that ends there leaves it out, but one that has gone over it before has drawn it. So
// what comes before them is summarised by itself.
void SeriesPoints::AppendLastPosition(const GraphRecord& graph, const GraphSeries& series,
                                      int column, int number, int end) {
    const double* values = series.values;
    const int last = end - 1;
    const int row = yPixel(graph, values[last - 1]);
    int first = last;
    for (int i = last - 1; i >= number; --i) {
        if (!IsFinite(values[i - 1])) continue;
        if (yPixel(graph, values[i - 1]) != row) break;
        first = i;
    }
    AppendPosition(graph, series, column, number, first);
    if (first != last) Append(graph, series, column, first - 1);
    Append(graph, series, column, last - 1);
}

bool SeriesPoints::Make(const GraphRecord& graph, const GraphSeries& series, int left, int right,
                        PointsOf shape, int spare) {
    constexpr int kPointsPerPosition = 4;  // see AppendPosition
    constexpr int kPointsAtTheEnd = 2;     // those that AppendLastPosition appends itself
    const PointRange range =
        WithNumbersAtEnds(series, PointsBetween(graph, xPixel, series.pointCount, left, right));
    const int all = std::max(range.last - range.first + 1, 0);
    // Positions with values: those from `left` to `right`, and one on either side.
    const int positions = std::max(right - left, 0) + 1 + 2;
    capacity_ = std::min(all, positions * kPointsPerPosition + kPointsAtTheEnd);
    points_ = static_cast<POINT*>(
        LocalAlloc(LMEM_FIXED, static_cast<SIZE_T>(capacity_ + 2 * spare) * sizeof(POINT)));
    if (!points_) return false;
    spare_ = spare;
    for (PositionWalk walk(graph, xPixel, range); !walk.IsAtEnd(); walk.Next()) {
        if (shape == PointsOf::polyline && walk.end() > range.last) {
            AppendLastPosition(graph, series, walk.pixel(), walk.number(), walk.end());
        } else {
            AppendPosition(graph, series, walk.pixel(), walk.number(), walk.end());
        }
    }
    return true;
}

}  // namespace kor
