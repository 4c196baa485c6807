// Counter-clockwise from 12 o'clock, a row above the centre is crossed twice: its left half before
// 90 degrees, its right half after 270, both from right to left. A row below is crossed once,
// between 90 and 270 degrees, from left to right. So on each row an angle has one position, a
// column edge, and a slice is what lies between the positions of its two angles. The column of a
// boundary belongs to the slice on its right. The circle's own point on the right belongs to no
// slice, because spans omit their last pixel.
#include "graph/shapes/disc.h"

#include <algorithm>
#include <cmath>

#include "numbers/double_bits.h"

namespace kor {

namespace {

constexpr double kRadiansPerDegree = 0.017453292519943295;
constexpr int kSteepExponent = 15;  // so steep that an edge leaves any disc on about the first row

int RoundHalfAway(double value) {
    if (value >= kBeyondDisc) return kBeyondDisc;
    if (value <= -kBeyondDisc) return -kBeyondDisc;
    return static_cast<int>(value >= 0 ? value + 0.5 : value - 0.5);
}

// Left half of a row above the centre, angles 0 to 90: the column of the edge, which is the
// exclusive right bound of the run to its left.
int LeftBoundAbove(const SliceEdge& edge, int dy) {
    if (edge.degrees <= 0) return 0;
    if (edge.degrees >= kQuarterTurn) return -kBeyondDisc;
    return CrossingOf(edge, dy);
}

// Right half of a row above, angles 270 to 360.
int RightBoundAbove(const SliceEdge& edge, int dy) {
    if (edge.degrees <= kThreeQuarterTurns) return kBeyondDisc;
    if (edge.degrees >= 360.0) return 0;
    return std::max(CrossingOf(edge, dy), 0);
}

// A row below, angles 90 to 270: the first column at or after the edge.
int BoundBelow(const SliceEdge& edge, int dy) {
    if (edge.degrees <= kQuarterTurn) return -kBeyondDisc;
    if (edge.degrees >= kThreeQuarterTurns) return kBeyondDisc;
    return CrossingOf(edge, dy);
}

// The centre's own row: its left half lies at 90 degrees, the rest at 270.
SliceRow SliceOnCentreRow(const SliceEdge& start, const SliceEdge& end, int halfWidth) {
    const auto holds = [&](double degrees) {
        return start.degrees <= degrees && degrees < end.degrees;
    };
    SliceRow row = {};
    if (holds(kQuarterTurn)) row.runs[0] = {-halfWidth, 0};
    if (holds(kThreeQuarterTurns)) row.runs[1] = {0, halfWidth};
    return row;
}

DiscRun Within(DiscRun run, int from, int to) {
    return {std::max(run.from, from), std::min(run.to, to)};
}

}  // namespace

void WalkCircle(int radius, int32_t* halfWidths) {
    std::fill_n(halfWidths, radius + 1, 0);
    int x = 0;
    int y = radius;
    int d = 3 - 2 * radius;
    while (x <= y) {
        halfWidths[y] = std::max<int32_t>(halfWidths[y], x);
        halfWidths[x] = std::max<int32_t>(halfWidths[x], y);
        if (d < 0) {
            d += 4 * x + 6;
        } else {
            d += 4 * (x - y) + 10;
            --y;
        }
        ++x;
    }
}

SliceEdge MakeSliceEdge(double degrees) {
    const double angle = degrees * kRadiansPerDegree;
    const double slope = std::tan(angle);  // dx = -r sin a, dy = -r cos a
    const bool isSteep = BiasedExponentOf(slope) - kExponentBias >= kSteepExponent;
    return {degrees, slope, isSteep ? kTooSteep : static_cast<int64_t>(slope * 0x1p32)};
}

int CrossingOf(const SliceEdge& edge, int dy) { return RoundHalfAway(dy * edge.columnsPerRow); }

SliceRow SliceOnRow(const SliceEdge& start, const SliceEdge& end, int dy, int halfWidth) {
    if (dy == 0) return SliceOnCentreRow(start, end, halfWidth);
    SliceRow row = {};
    if (dy > 0) {
        row.runs[0] = Within({BoundBelow(start, dy), BoundBelow(end, dy)}, -halfWidth, halfWidth);
        return row;
    }
    if (start.degrees < kQuarterTurn) {
        row.runs[0] = Within({LeftBoundAbove(end, dy), LeftBoundAbove(start, dy)}, -halfWidth, 0);
    }
    if (end.degrees > kThreeQuarterTurns) {
        row.runs[1] = Within({RightBoundAbove(end, dy), RightBoundAbove(start, dy)}, 0, halfWidth);
    }
    return row;
}

}  // namespace kor
