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

// Half the width of each row of a disc, by the midpoint circle algorithm. The row `dy` from the
// centre covers the columns from -halfWidths[|dy|], inclusive, to +halfWidths[|dy|], exclusive. The
// array has radius + 1 elements.
void WalkCircle(int radius, int32_t* halfWidths);

// The runs of one slice on one row: at most two, if the slice lies on both sides of the centre.
struct SliceRow {
    DiscRun runs[2];
};

// One edge of a slice: an angle in degrees, counter-clockwise from 12 o'clock, with its slope.
struct SliceEdge {
    double degrees;
    double columnsPerRow;  // dx / dy of the radius at that angle
    int64_t step;          // the same in units of 2^-32 columns, truncated, or kTooSteep
};

constexpr int64_t kTooSteep = INT64_MIN;

SliceEdge MakeSliceEdge(double degrees);

// The runs of a slice on row `dy`, from one edge to the other, within the half width. If slices
// follow one another from 0 to 360 degrees, every pixel of the disc belongs to exactly one of them.
SliceRow SliceOnRow(const SliceEdge& start, const SliceEdge& end, int dy, int halfWidth);

// Column in which an edge crosses the row `dy`, which must lie within the edge's half of the disc:
// the slope times the row, rounded half away from zero.
int CrossingOf(const SliceEdge& edge, int dy);

}  // namespace kor
