// Going round counter-clockwise from 12 o'clock, a row above the centre is met twice: its left half
// on the way to 90 degrees, its right half from 270 on, both from right to left. A row below is met
// once, from 90 to 270, from left to right. So on each row an angle has one place, a column edge,
// and a slice is what lies between the places of its two angles. The column of a boundary belongs
// to the slice on its right, and the circle's own point on the right to none, as spans leave out
// their last pixel.
#include "graph/graph_disc.h"

#include <algorithm>
#include <cmath>

namespace kor {

namespace {

constexpr double kQuarter = 90.0;
constexpr double kThreeQuarters = 270.0;
constexpr double kRadiansPerDegree = 0.017453292519943295;
constexpr int kFarAway = 1 << 24;

int RoundHalfAway(double value) {
    if (value >= kFarAway) return kFarAway;
    if (value <= -kFarAway) return -kFarAway;
    return static_cast<int>(value >= 0 ? value + 0.5 : value - 0.5);
}

// Column of the last pixel on the near side of an edge where it crosses a row; the row must lie
// within the edge's half of the disc.
int Crossing(SliceEdge edge, int dy) { return RoundHalfAway(dy * edge.columnsPerRow); }

// Left half of a row above the centre, angles 0 to 90: the first column left of the edge's pixels,
// as a bound that is exclusive on the right.
int LeftBoundAbove(SliceEdge edge, int dy) {
    if (edge.degrees <= 0) return 0;
    if (edge.degrees >= kQuarter) return -kFarAway;
    return Crossing(edge, dy);
}

// Right half of a row above, angles 270 to 360.
int RightBoundAbove(SliceEdge edge, int dy) {
    if (edge.degrees <= kThreeQuarters) return kFarAway;
    if (edge.degrees >= 360.0) return 0;
    return std::max(Crossing(edge, dy), 0);
}

// A row below, angles 90 to 270: the first column that is not before the edge.
int BoundBelow(SliceEdge edge, int dy) {
    if (edge.degrees <= kQuarter) return -kFarAway;
    if (edge.degrees >= kThreeQuarters) return kFarAway;
    return Crossing(edge, dy);
}

// The centre's own row: left of the centre at 90 degrees, the rest at 270.
SliceRow SliceOnCentreRow(SliceEdge start, SliceEdge end, int halfWidth) {
    const auto holds = [&](double degrees) {
        return start.degrees <= degrees && degrees < end.degrees;
    };
    SliceRow row = {};
    if (holds(kQuarter)) row.runs[0] = {-halfWidth, 0};
    if (holds(kThreeQuarters)) row.runs[1] = {0, halfWidth};
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
    return {degrees, std::tan(angle)};  // dx = -r sin a, dy = -r cos a
}

SliceRow SliceOnRow(SliceEdge start, SliceEdge end, int dy, int halfWidth) {
    if (dy == 0) return SliceOnCentreRow(start, end, halfWidth);
    SliceRow row = {};
    if (dy > 0) {
        row.runs[0] = Within({BoundBelow(start, dy), BoundBelow(end, dy)}, -halfWidth, halfWidth);
        return row;
    }
    if (start.degrees < kQuarter) {
        row.runs[0] = Within({LeftBoundAbove(end, dy), LeftBoundAbove(start, dy)}, -halfWidth, 0);
    }
    if (end.degrees > kThreeQuarters) {
        row.runs[1] = Within({RightBoundAbove(end, dy), RightBoundAbove(start, dy)}, 0, halfWidth);
    }
    return row;
}

}  // namespace kor
