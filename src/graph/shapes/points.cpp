#include "graph/shapes/points.h"

#include <algorithm>

#include "base/assert.h"
#include "numbers/comparable.h"

namespace kor {

namespace {

// The first point number in [low, high) whose position is at least `pixel`, or high.
int FirstAtOrPast(const Axis& along, int low, int high, int pixel) {
    while (low < high) {
        const int middle = low + (high - low) / 2;
        if (PixelAt(along, middle) >= pixel) {
            high = middle;
        } else {
            low = middle + 1;
        }
    }
    return low;
}

// NaNs and infinities have no point. A line runs on to the next finite value, even far outside the
// view, and ends at the last one.
PointRange WithNumbersAtEnds(const ValueTrace& trace, PointRange range) {
    const double* values = trace.values;
    while (range.first > 1 && !IsFinite(values[range.first - 1])) --range.first;
    while (range.last < trace.count && !IsFinite(values[range.last - 1])) ++range.last;
    while (range.last >= range.first && !IsFinite(values[range.last - 1])) --range.last;
    return range;
}

}  // namespace

PointRange PointsBetween(const Axis& along, int count, int lowPixel, int highPixel) {
    const int first = FirstAtOrPast(along, 1, count + 1, lowPixel);
    const int past = FirstAtOrPast(along, first, count + 1, highPixel + 1);
    return {std::max(first - 1, 1), std::min(past, count)};
}

PositionWalk::PositionWalk(const Axis& along, PointRange range)
    : along_(along), range_(range), number_(range.first), end_(range.first) {
    if (IsAtEnd()) return;
    pixel_ = PixelAt(along_, number_);
    FindEnd(number_ + 1);
}

void PositionWalk::Next() {
    const int length = end_ - number_;
    number_ = end_;
    pixel_ = endPixel_;
    if (!IsAtEnd()) FindEnd(number_ + length);
}

// Points are evenly spaced, so each position has as many points as the one before it, or one more
// or less.
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

// Narrows the search for the end by a point between the two known ones.
void PositionWalk::Try(int number) {
    const int pixel = PixelAt(along_, number);
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
        if (least <= value && value <= most) continue;  // nearly always, so it comes first
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

namespace {

// Appends points to an array that has room for all of them.
class PointWriter {
public:
    PointWriter(const ValueTrace& trace, Point* points, int capacity)
        : trace_(trace), points_(points), capacity_(capacity) {}

    int count() const { return count_; }

    void AppendPosition(int column, int number, int end);
    void AppendLastPosition(int column, int number, int end);

private:
    void Append(int column, int index) {
        KOR_ASSERT(count_ < capacity_);
        points_[count_++] = {column, PixelAt(trace_.y, trace_.values[index])};
    }

    const ValueTrace& trace_;
    Point* points_;
    int capacity_;
    int count_ = 0;
};

// The first and the last point, and between them each extreme that lies beyond both. These are
// distinct points even where values tie, so there are at most four, and never more than the
// position has.
void PointWriter::AppendPosition(int column, int number, int end) {
    const PositionSummary found = Summarise(trace_.values, number, end);
    if (found.first < 0) return;
    const auto valueOf = [&](int index) { return ComparableOf(trace_.values[index]); };
    const Comparable first = valueOf(found.first);
    const Comparable last = valueOf(found.last);
    const bool reachesLower = valueOf(found.lowest) < std::min(first, last);
    const bool reachesHigher = valueOf(found.highest) > std::max(first, last);
    // Both orders of the extremes give the same pixels; this one is the shorter path.
    const bool highestFirst = first > last;
    Append(column, found.first);
    if (reachesHigher && highestFirst) Append(column, found.highest);
    if (reachesLower) Append(column, found.lowest);
    if (reachesHigher && !highestFirst) Append(column, found.highest);
    if (found.last != found.first) Append(column, found.last);
}

// Requires that point end - 1 is finite. Polyline omits its final pixel unless an earlier segment
// has drawn it, so the run of points that share that pixel is appended separately from the rest of
// the column.
void PointWriter::AppendLastPosition(int column, int number, int end) {
    const double* values = trace_.values;
    const int last = end - 1;
    const int row = PixelAt(trace_.y, values[last - 1]);
    int first = last;
    for (int i = last - 1; i >= number; --i) {
        if (!IsFinite(values[i - 1])) continue;
        if (PixelAt(trace_.y, values[i - 1]) != row) break;
        first = i;
    }
    AppendPosition(column, number, first);
    if (first != last) Append(column, first - 1);
    Append(column, last - 1);
}

}  // namespace

PointRange RangeInView(const ValueTrace& trace, int left, int right) {
    return WithNumbersAtEnds(trace, PointsBetween(trace.x, trace.count, left, right));
}

int PointCapacity(PointRange range, int left, int right) {
    constexpr int kPointsPerPosition = 4;  // see AppendPosition
    constexpr int kPointsAtTheEnd = 2;     // appended by AppendLastPosition itself
    const int all = std::max(range.last - range.first + 1, 0);
    // Positions with points: those from `left` to `right`, and one on either side.
    const int positions = std::max(right - left, 0) + 1 + 2;
    return std::min(all, positions * kPointsPerPosition + kPointsAtTheEnd);
}

int FillPoints(const ValueTrace& trace, PointRange range, PointsOf shape, Point* points,
               int capacity) {
    PointWriter writer(trace, points, capacity);
    for (PositionWalk walk(trace.x, range); !walk.IsAtEnd(); walk.Next()) {
        if (shape == PointsOf::polyline && walk.end() > range.last) {
            writer.AppendLastPosition(walk.pixel(), walk.number(), walk.end());
        } else {
            writer.AppendPosition(walk.pixel(), walk.number(), walk.end());
        }
    }
    return writer.count();
}

}  // namespace kor
