// A slice of a disc on consecutive rows, with the results of SliceOnRow, by integer additions.
#pragma once

#include <algorithm>

#include "graph/shapes/disc.h"

namespace kor {

// Rows counted from the disc's centre, both ends included.
struct RowRange {
    int first;
    int last;
};

// The columns in which an edge crosses one row after another, downwards.
//
// CrossingOf multiplies doubles. Adding up the slope in integers gives the same results except next
// to a half, where the rounding of the doubles decides. There, once in 30,000 rows, CrossingOf is
// called. The sum is off by at most one unit of 2^-32 columns per row, and the double by less than
// 2^10 units.
class EdgeWalk {
public:
    EdgeWalk(const SliceEdge& edge, RowRange rows) : edge_(&edge), row_(rows.first) {
        if (edge.step == kTooSteep || rows.first < -kMostRows || rows.last > kMostRows) return;
        step_ = edge.step;
        position_ = step_ * row_ + kHalf;
    }

    // Stays in one column.
    explicit EdgeWalk(int column) : position_(column * kColumn + kHalf) {}

    int column() const {
        const auto fraction = static_cast<uint32_t>(position_);
        if (fraction + kMargin < 2 * kMargin) return CrossingOf(*edge_, row_);
        return static_cast<int>(position_ >> 32);
    }

    void nextRow() {
        position_ += step_;
        ++row_;
    }

private:
    static constexpr int kMostRows = 1 << 14;
    static constexpr int64_t kColumn = static_cast<int64_t>(1) << 32;
    static constexpr int64_t kHalf = kColumn / 2;
    static constexpr uint32_t kMargin = 1 << 16;

    const SliceEdge* edge_ = nullptr;
    int row_ = 0;
    int64_t step_ = 0;
    int64_t position_ = 0;  // fixed point, 32.32, plus one half; 0 forces the floating-point path
};

// Which part of a row: all of it, or one side of the centre.
enum class RowPart { whole, left, right };

// Calls take(dy, run) for what lies between two edges on one part of each row, within the half
// widths.
template <typename Take>
void WalkBetween(EdgeWalk from, EdgeWalk to, RowRange rows, const int32_t* halfWidths, RowPart part,
                 Take take) {
    for (int dy = rows.first; dy <= rows.last; ++dy) {
        // `halfWidths` covers all rows, because RowsOfSlice keeps them within the radius.
        const int halfWidth = halfWidths[dy < 0 ? -dy : dy];
        const DiscRun run = {std::max(from.column(), part == RowPart::right ? 0 : -halfWidth),
                             std::min(to.column(), part == RowPart::left ? 0 : halfWidth)};
        if (run.from < run.to) take(dy, run);
        from.nextRow();
        to.nextRow();
    }
}

// Calls take(dy, run) for each run of the slice on these rows that is not empty.
template <typename Take>
void WalkSlice(const SliceEdge& start, const SliceEdge& end, RowRange rows,
               const int32_t* halfWidths, Take take) {
    const RowRange above = {rows.first, std::min(rows.last, -1)};
    const RowRange below = {std::max(rows.first, 1), rows.last};
    const auto edgeOr = [](bool isWithin, const SliceEdge& edge, RowRange of, int column) {
        return isWithin ? EdgeWalk(edge, of) : EdgeWalk(column);
    };
    if (start.degrees < kQuarterTurn) {
        WalkBetween(edgeOr(end.degrees < kQuarterTurn, end, above, -kBeyondDisc),
                    EdgeWalk(start, above), above, halfWidths, RowPart::left, take);
    }
    if (rows.first <= 0 && rows.last >= 0) {
        for (const DiscRun& run : SliceOnRow(start, end, 0, halfWidths[0]).runs) {
            if (run.from < run.to) take(0, run);
        }
    }
    if (start.degrees < kThreeQuarterTurns && end.degrees > kQuarterTurn) {
        WalkBetween(edgeOr(start.degrees > kQuarterTurn, start, below, -kBeyondDisc),
                    edgeOr(end.degrees < kThreeQuarterTurns, end, below, kBeyondDisc), below,
                    halfWidths, RowPart::whole, take);
    }
    if (end.degrees > kThreeQuarterTurns) {
        WalkBetween(edgeOr(end.degrees < 360.0, end, above, 0),
                    edgeOr(start.degrees > kThreeQuarterTurns, start, above, kBeyondDisc), above,
                    halfWidths, RowPart::right, take);
    }
}

}  // namespace kor
