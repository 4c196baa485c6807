// The pixels of a disc and of its slices, row by row. No DC.
#pragma once

#include <cstdint>

namespace kor {

constexpr double kQuarterTurn = 90.0;
constexpr double kThreeQuarterTurns = 270.0;
constexpr int kBeyondDisc = 1 << 24;  // a column outside every disc

// Columns [from, to) of a row, counted from the disc's centre; empty when to <= from.
struct DiscRun {
    int from;
    int to;
};

// Half the width of each row of a disc, by a midpoint circle walk: the row `dy` from the centre
// covers the columns from -halfWidths[|dy|] up to, not including, +halfWidths[|dy|]. The array has
// room for radius + 1 numbers.
void WalkCircle(int radius, int32_t* halfWidths);

// The runs of one slice on one row: two at the most, when a slice lies on both sides of the centre.
struct SliceRow {
    DiscRun runs[2];
};

// One edge of a slice: an angle in degrees, from 12 o'clock counter-clockwise, with its slope.
struct SliceEdge {
    double degrees;
    double columnsPerRow;  // dx / dy of the radius at that angle
    int64_t step;          // the same in 2^-32 columns, cut off, or kTooSteep
};

constexpr int64_t kTooSteep = INT64_MIN;

SliceEdge MakeSliceEdge(double degrees);

// The row `dy` of the slice from one edge to the other within the half width. Every pixel of a disc
// belongs to exactly one of several slices that follow one another from 0 to 360 degrees.
SliceRow SliceOnRow(const SliceEdge& start, const SliceEdge& end, int dy, int halfWidth);

// Column of the last pixel on the near side of an edge where it crosses the row `dy`, which must
// lie within the edge's half of the disc: the slope times the row, rounded half away from zero.
int CrossingOf(const SliceEdge& edge, int dy);

}  // namespace kor
