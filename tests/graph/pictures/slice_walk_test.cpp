// Slices on consecutive rows, by whole numbers, against each row for itself, in floating point.
#include "graph/shapes/slice_walk.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <cstdlib>
#include <random>
#include <vector>

namespace {

constexpr double kDegreesPerRadian = 57.29577951308232;

struct PlacedRun {
    int dy;
    int from;
    int to;
    auto operator<=>(const PlacedRun&) const = default;
};

std::vector<int32_t> HalfWidths(int radius) {
    std::vector<int32_t> found(static_cast<size_t>(radius) + 1);
    kor::WalkCircle(radius, found.data());
    return found;
}

std::vector<PlacedRun> Walked(double start, double end, kor::RowRange rows,
                              const std::vector<int32_t>& halfWidths) {
    std::vector<PlacedRun> found;
    kor::WalkSlice(kor::MakeSliceEdge(start), kor::MakeSliceEdge(end), rows, halfWidths.data(),
                   [&](int dy, kor::DiscRun run) {
                       found.push_back({dy, run.from, run.to});
                   });
    std::sort(found.begin(), found.end());
    return found;
}

std::vector<PlacedRun> RowByRow(double start, double end, kor::RowRange rows,
                                const std::vector<int32_t>& halfWidths) {
    const kor::SliceEdge startEdge = kor::MakeSliceEdge(start);
    const kor::SliceEdge endEdge = kor::MakeSliceEdge(end);
    std::vector<PlacedRun> found;
    for (int dy = rows.first; dy <= rows.last; ++dy) {
        const int half = halfWidths[static_cast<size_t>(std::abs(dy))];
        for (const kor::DiscRun& run : kor::SliceOnRow(startEdge, endEdge, dy, half).runs) {
            if (run.from < run.to) found.push_back({dy, run.from, run.to});
        }
    }
    std::sort(found.begin(), found.end());
    return found;
}

// Angles where a rule changes, or whose slope meets the half of a column on some row, with their
// neighbours.
std::vector<double> SpecialAngles() {
    std::vector<double> found;
    for (int eighth = 0; eighth <= 8; ++eighth) found.push_back(45.0 * eighth);
    for (const double slope : {0.5, 1.5, 0.25, 1.0 / 3, 7.5 / 13, 12.5, 1e-9, 16384.5, 40000.0}) {
        const double angle = std::atan(slope) * kDegreesPerRadian;
        for (const double turn : {0.0, 180.0}) {
            found.push_back(turn + angle);
            found.push_back(turn + 180 - angle);
        }
    }
    for (size_t i = 0, count = found.size(); i < count; ++i) {
        if (found[i] == 0) continue;
        found.push_back(std::nextafter(found[i], 0));
        found.push_back(std::nextafter(found[i], 400));
    }
    std::sort(found.begin(), found.end());
    return found;
}

TEST(PieSliceWalk, AgreesRowByRowBetweenSpecialAngles) {
    constexpr int kRadius = 120;
    const std::vector<int32_t> halfWidths = HalfWidths(kRadius);
    const std::vector<double> angles = SpecialAngles();
    for (const double start : angles) {
        for (const double end : angles) {
            if (end <= start) continue;
            ASSERT_EQ(Walked(start, end, {-kRadius, kRadius}, halfWidths),
                      RowByRow(start, end, {-kRadius, kRadius}, halfWidths))
                << start << " to " << end;
        }
    }
}

TEST(PieSliceWalk, AgreesRowByRowOnRandomSlicesAndRows) {
    std::mt19937 random(11);
    std::uniform_real_distribution<double> angle(0, 360);
    for (int i = 0; i < 4000; ++i) {
        const int radius = 1 + static_cast<int>(random() % 300);
        const std::vector<int32_t> halfWidths = HalfWidths(radius);
        const double start = angle(random);
        const double end = random() % 2 ? start + (360 - start) * angle(random) / 360
                                        : start + angle(random) / 1000;
        const int first =
            static_cast<int>(random() % (2 * static_cast<unsigned>(radius) + 1)) - radius;
        const kor::RowRange rows = {first, radius - static_cast<int>(random() % 3) % radius};
        ASSERT_EQ(Walked(start, end, rows, halfWidths), RowByRow(start, end, rows, halfWidths))
            << start << " to " << end << ", radius " << radius;
    }
}

// Far more rows than there are on a screen, and an edge for each of many slopes. What lies beyond
// every disc is one to the doubles.
TEST(PieSliceWalk, CrossesRowsWhereTheDoublesDo) {
    std::mt19937 random(12);
    std::uniform_real_distribution<double> exponent(-25, 25);
    for (int i = 0; i < 3000; ++i) {
        const double slope = std::exp2(exponent(random)) * (random() % 2 ? 1 : -1);
        const kor::SliceEdge edge = kor::MakeSliceEdge(std::atan(slope) * kDegreesPerRadian);
        const int most = 1000 << random() % 10;
        const int first = static_cast<int>(random() % (2 * static_cast<unsigned>(most))) - most;
        const kor::RowRange rows = {first, first + 400};
        kor::EdgeWalk walk(edge, rows);
        int different = 0;
        for (int dy = rows.first; dy <= rows.last; ++dy) {
            const int column = std::clamp(walk.column(), -kor::kBeyondDisc, kor::kBeyondDisc);
            different += column != kor::CrossingOf(edge, dy);
            walk.nextRow();
        }
        ASSERT_EQ(different, 0) << edge.degrees << " from row " << first;
    }
}

// Columns that end in one half exactly on every second row.
TEST(PieSliceWalk, AsksTheDoublesAtAHalf) {
    for (const double slope : {0.5, -0.5, 2.5, -7.5}) {
        for (const double beside :
             {slope, std::nextafter(slope, 0), std::nextafter(slope, 2 * slope)}) {
            const kor::SliceEdge edge = {30, beside, static_cast<int64_t>(beside * 0x1p32)};
            kor::EdgeWalk walk(edge, {-100, 100});
            for (int dy = -100; dy <= 100; ++dy) {
                ASSERT_EQ(walk.column(), kor::CrossingOf(edge, dy)) << beside << ", row " << dy;
                walk.nextRow();
            }
        }
    }
}

TEST(PieSliceWalk, StaysInAColumn) {
    for (const int column : {0, 1, -1, kor::kBeyondDisc, -kor::kBeyondDisc}) {
        kor::EdgeWalk walk(column);
        EXPECT_EQ(walk.column(), column);
        walk.nextRow();
        EXPECT_EQ(walk.column(), column);
    }
}

}  // namespace
