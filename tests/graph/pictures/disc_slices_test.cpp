// The pixels of a pie's slices, by number alone.
#include "graph/shapes/disc.h"

#include "graph/shapes/pie_layout.h"

#include <gtest/gtest.h>

#include <cmath>
#include <cstdlib>
#include <random>
#include <vector>

namespace {

constexpr double kDegreesPerRadian = 57.29577951308232;

// Which slice each pixel of a disc belongs to, and how often it was given.
class SlicedDisc {
public:
    SlicedDisc(int radius, const std::vector<double>& boundaries)
        : radius_(radius), side_(2 * radius + 1), owner_(side_ * side_, -1), times_(side_ * side_) {
        std::vector<int32_t> halfWidths(static_cast<size_t>(radius) + 1);
        kor::WalkCircle(radius, halfWidths.data());
        for (size_t k = 0; k + 1 < boundaries.size(); ++k) {
            const auto start = kor::MakeSliceEdge(boundaries[k]);
            const auto end = kor::MakeSliceEdge(boundaries[k + 1]);
            for (int dy = -radius; dy <= radius; ++dy) {
                const int half = halfWidths[static_cast<size_t>(std::abs(dy))];
                const kor::SliceRow row = kor::SliceOnRow(start, end, dy, half);
                for (const kor::DiscRun& run : row.runs) take(run, dy, static_cast<int>(k));
            }
        }
        for (int dy = -radius; dy <= radius; ++dy) {
            const int half = halfWidths[static_cast<size_t>(std::abs(dy))];
            for (int dx = -radius; dx <= radius; ++dx) {
                const bool inDisc = -half <= dx && dx < half;
                missing_ += inDisc && times_[place(dx, dy)] == 0;
                outside_ += !inDisc && times_[place(dx, dy)] != 0;
                shared_ += times_[place(dx, dy)] > 1;
                pixels_ += inDisc;
            }
        }
    }

    int owner(int dx, int dy) const { return owner_[place(dx, dy)]; }
    int missing() const { return missing_; }
    int outside() const { return outside_; }
    int shared() const { return shared_; }
    int pixels() const { return pixels_; }

private:
    size_t place(int dx, int dy) const {
        return static_cast<size_t>(dy + radius_) * side_ + static_cast<size_t>(dx + radius_);
    }
    void take(const kor::DiscRun& run, int dy, int slice) {
        for (int dx = run.from; dx < run.to; ++dx) {
            ASSERT_LE(std::abs(dx), radius_);
            owner_[place(dx, dy)] = slice;
            ++times_[place(dx, dy)];
        }
    }

    int radius_;
    size_t side_;
    std::vector<int> owner_;
    std::vector<int> times_;
    int missing_ = 0;
    int outside_ = 0;
    int shared_ = 0;
    int pixels_ = 0;
};

double AngleOfPixel(int dx, int dy) {
    const double degrees = std::atan2(-dx, -dy) * kDegreesPerRadian;
    return degrees < 0 ? degrees + 360 : degrees;
}

// Distance in pixels from a pixel to the boundary at an angle; large on the other side of the disc.
double DistanceToBoundary(int dx, int dy, double degrees) {
    const double angle = degrees / kDegreesPerRadian;
    const double ux = -std::sin(angle);
    const double uy = -std::cos(angle);
    if (dx * ux + dy * uy < -1.5) return 1e9;
    return std::fabs(dx * uy - dy * ux);
}

// Pixels whose slice is not the one that holds their angle, those beside a boundary left out.
int WronglyOwned(const SlicedDisc& disc, int radius, const std::vector<double>& boundaries) {
    int wrong = 0;
    for (int dy = -radius; dy <= radius; ++dy) {
        for (int dx = -radius; dx <= radius; ++dx) {
            if (disc.owner(dx, dy) < 0) continue;
            bool beside = false;
            for (const double each : boundaries) {
                beside |= DistanceToBoundary(dx, dy, each) < 1.5;
            }
            if (beside) continue;
            const double angle = AngleOfPixel(dx, dy);
            const auto k = static_cast<size_t>(disc.owner(dx, dy));
            wrong += !(boundaries[k] <= angle && angle < boundaries[k + 1]);
        }
    }
    return wrong;
}

std::vector<double> RandomBoundaries(std::mt19937& random, int slices) {
    std::vector<double> sizes;
    double sum = 0;
    for (int i = 0; i < slices; ++i) {
        sizes.push_back(random() % 5 == 0 ? 0.001 + random() % 10 : 1 + random() % 100);
        sum += sizes.back();
    }
    std::vector<double> boundaries{0};
    double end = 0;
    for (const double size : sizes) boundaries.push_back(end += size / sum * 360);
    return boundaries;
}

TEST(PieDisc, SlicesOfRandomPiesCoverEachPixelOnceAndByItsAngle) {
    std::mt19937 random(7);
    for (int i = 0; i < 400; ++i) {
        const int radius = 1 + static_cast<int>(random() % 90);
        const auto boundaries = RandomBoundaries(random, 1 + static_cast<int>(random() % 12));
        const SlicedDisc disc(radius, boundaries);
        ASSERT_EQ(disc.missing(), 0) << "pie " << i << ", radius " << radius;
        ASSERT_EQ(disc.outside(), 0) << "pie " << i << ", radius " << radius;
        ASSERT_EQ(disc.shared(), 0) << "pie " << i << ", radius " << radius;
        ASSERT_EQ(WronglyOwned(disc, radius, boundaries), 0) << "pie " << i;
    }
}

TEST(PieDisc, BoundariesOnTheQuartersLeaveNoGap) {
    for (int radius = 1; radius < 60; radius += radius < 8 ? 1 : 13) {
        for (int mask = 0; mask < 128; ++mask) {
            std::vector<double> boundaries{0};
            for (int i = 0; i < 7; ++i) {
                if (mask & 1 << i) boundaries.push_back(45.0 * (i + 1));
            }
            boundaries.push_back(360);
            const SlicedDisc disc(radius, boundaries);
            ASSERT_EQ(disc.missing() + disc.outside() + disc.shared(), 0) << radius << ' ' << mask;
            ASSERT_EQ(WronglyOwned(disc, radius, boundaries), 0) << radius << ' ' << mask;
        }
    }
}

TEST(PieDisc, ManyThinSlicesCoverEachPixelOnce) {
    for (const int slices : {360, 1000, 5000}) {
        std::vector<double> boundaries;
        for (int k = 0; k <= slices; ++k) boundaries.push_back(k * 360.0 / slices);
        const SlicedDisc disc(50, boundaries);
        EXPECT_EQ(disc.missing() + disc.outside() + disc.shared(), 0) << slices;
    }
}

TEST(PieDisc, ASumThatEndsBesideAFullTurnLeavesNoGap) {
    for (const double end : {359.99999999999994, 360.00000000000006, 360.0}) {
        const SlicedDisc disc(40, {0, 100, 200, end});
        EXPECT_EQ(disc.missing() + disc.outside() + disc.shared(), 0) << end;
    }
}

TEST(PieDisc, OneSliceIsTheWholeDisc) {
    const SlicedDisc disc(10, {0, 360});
    EXPECT_EQ(disc.missing() + disc.outside() + disc.shared(), 0);
    EXPECT_NEAR(disc.pixels(), 314, 20);
}

TEST(PieDisc, HalvesLieLeftAndRight) {
    const SlicedDisc disc(20, {0, 180, 360});
    for (int dy = -18; dy <= 18; ++dy) {
        EXPECT_EQ(disc.owner(-3, dy), 0) << dy;
        EXPECT_EQ(disc.owner(3, dy), 1) << dy;
    }
}

TEST(PieDisc, ALittleMoreThanHalfFillsBothSides) {
    const SlicedDisc disc(20, {0, 200, 360});
    EXPECT_EQ(disc.owner(-10, 0), 0);
    EXPECT_EQ(disc.owner(-1, 15), 0);
    EXPECT_EQ(disc.owner(2, 15), 0);  // past 180 degrees
    EXPECT_EQ(disc.owner(12, 5), 1);
    EXPECT_EQ(disc.owner(5, -10), 1);
}

TEST(PieDisc, ThreeQuartersLeaveTheUpperRight) {
    const SlicedDisc disc(20, {0, 270, 360});
    EXPECT_EQ(disc.owner(-8, -8), 0);
    EXPECT_EQ(disc.owner(-8, 8), 0);
    EXPECT_EQ(disc.owner(8, 8), 0);
    EXPECT_EQ(disc.owner(8, -8), 1);
}

TEST(PieDisc, CrossingsAreRoundedHalfAwayFromZero) {
    // Seven rows off the centre a boundary at 20 degrees to the vertical is 2.55 columns off.
    EXPECT_EQ(SlicedDisc(20, {0, 20, 360}).owner(-3, -7), 0);
    EXPECT_EQ(SlicedDisc(20, {0, 20, 360}).owner(-4, -7), 1);
    EXPECT_EQ(SlicedDisc(20, {0, 160, 360}).owner(-4, 7), 0);
    EXPECT_EQ(SlicedDisc(20, {0, 160, 360}).owner(-3, 7), 1);
    EXPECT_EQ(SlicedDisc(20, {0, 200, 360}).owner(2, 7), 0);
    EXPECT_EQ(SlicedDisc(20, {0, 200, 360}).owner(3, 7), 1);
    EXPECT_EQ(SlicedDisc(20, {0, 340, 360}).owner(2, -7), 1);
    EXPECT_EQ(SlicedDisc(20, {0, 340, 360}).owner(3, -7), 0);
}

TEST(PieDisc, RadiusOneAndTwo) {
    EXPECT_EQ(SlicedDisc(1, {0, 360}).pixels(), 2);
    EXPECT_EQ(SlicedDisc(2, {0, 360}).pixels(), 16);
}

TEST(PieDisc, RowsFollowTheMidpointCircle) {
    std::vector<int32_t> halfWidths(5);
    kor::WalkCircle(4, halfWidths.data());
    EXPECT_EQ(halfWidths, (std::vector<int32_t>{4, 4, 3, 3, 1}));
    halfWidths.resize(1);
    kor::WalkCircle(0, halfWidths.data());
    EXPECT_EQ(halfWidths, (std::vector<int32_t>{0}));
}

TEST(PieVector, TurnsCounterClockwiseFromTheTop) {
    const auto turned = [](double degrees) {
        double dx = 0;
        double dy = -100;
        kor::RotateVector(dx, dy, degrees);
        return std::pair{std::lround(dx), std::lround(dy)};
    };
    EXPECT_EQ(turned(0), (std::pair{0L, -100L}));
    EXPECT_EQ(turned(90), (std::pair{-100L, 0L}));
    EXPECT_EQ(turned(180), (std::pair{0L, 100L}));
    EXPECT_EQ(turned(270), (std::pair{100L, 0L}));
    EXPECT_EQ(turned(30), (std::pair{-50L, -87L}));
    double dx = 3;
    double dy = 4;
    kor::RotateVector(dx, dy, 90);
    EXPECT_NEAR(dx, 4, 1e-12);
    EXPECT_NEAR(dy, -3, 1e-12);
}

}  // namespace
