// The mapping of values to pixels by whole numbers against the same in floating point.
#include "numbers/pixel_scale.h"

#include "numbers/special_doubles.h"
#include "numbers/truncate.h"

#include <gtest/gtest.h>

namespace kor {
namespace {

// Counts what the whole numbers say of many values.
class PixelScales : public testing::Test {
protected:
    void take(double centre, double units) {
        centre_ = centre;
        units_ = units;
        scale_ = MakePixelScale(centre, units);
    }

    void compare(double value) {
        ++compared_;
        const int pixels = QuickPixels(scale_, value);
        if (pixels == kUnknownPixels) {
            ++unknown_;
            return;
        }
        if (pixels == TruncateToInt((value - centre_) / units_)) return;
        ADD_FAILURE() << std::hexfloat << value << " with " << centre_ << ", " << units_;
    }

    // Values at a pixel's edge and next to it, where the roundings of the doubles decide.
    void compareAroundEdge(int pixels) {
        double value = centre_ + pixels * units_;
        for (int i = 0; i < 4; ++i) value = std::nextafter(value, -HUGE_VAL);
        for (int i = 0; i < 9; ++i) {
            compare(value);
            value = std::nextafter(value, HUGE_VAL);
        }
        for (double nearby = 1e-12; nearby < 1; nearby *= 3) {
            compare(centre_ + (pixels - nearby) * units_);
            compare(centre_ + (pixels + nearby) * units_);
        }
    }

    double centre_ = 0;
    double units_ = 1;
    PixelScale scale_ = {};
    int compared_ = 0;
    int unknown_ = 0;
};

TEST_F(PixelScales, AnswerForNearlyAllValuesOfAnOrdinaryAxis) {
    kortest::RandomDoubles random(3);
    take(37.5, 0.47);
    for (int i = 0; i < 1000000; ++i) compare(100 * (random.nextOrdinary() * 0x1p-20));
    EXPECT_LT(unknown_, compared_ / 1000);
}

TEST_F(PixelScales, AgreeOnRandomAxes) {
    kortest::RandomDoubles random(4);
    for (int i = 0; i < 20000 && !HasFailure(); ++i) {
        const double units = std::fabs(random.nextOrdinary());
        take(random.nextOrdinary() * units * 0x1p-7, units);
        for (int k = 0; k < 100; ++k) {
            compare(random.nextOrdinary());
            compare(centre_ + random.nextOrdinary() * units_ * 0x1p-10);
        }
    }
    EXPECT_LT(unknown_, compared_);
}

TEST_F(PixelScales, AgreeAtTheEdgesOfPixels) {
    kortest::RandomDoubles random(5);
    for (int i = 0; i < 400 && !HasFailure(); ++i) {
        const double units = std::fabs(random.nextOrdinary());
        take(random.nextOrdinary() * units * 0x1p-12, units);
        for (int pixels = -300; pixels <= 300; ++pixels) compareAroundEdge(pixels);
    }
    EXPECT_LT(unknown_, compared_);
}

// Numbers of points at each width: what the axis of the categories is.
TEST_F(PixelScales, AgreeOnEveryPointOfEveryCategoryAxis) {
    for (int width = 1; width <= 320; width += 7) {
        for (int points = 1; points <= 1200; points += 13) {
            take((points + 1) * 0.5, (points + 1.0) / width);
            for (int number = 0; number <= points + 1; ++number) compare(number);
        }
    }
    EXPECT_LT(unknown_, compared_ / 10);
}

TEST_F(PixelScales, AgreeOnSpecialDoublesOrDoNotAnswer) {
    const std::vector<double> values = kortest::SpecialDoubles();
    for (const double units : values) {
        if (!(units > 0) || std::isinf(units)) continue;  // no axis has others
        for (const double centre : values) {
            if (!std::isfinite(centre)) continue;
            take(centre, units);
            for (const double value : values) compare(value);
        }
    }
    EXPECT_GT(unknown_, 0);
    EXPECT_LT(unknown_, compared_);
}

TEST_F(PixelScales, AgreeOnAnyBitsOrDoNotAnswer) {
    kortest::RandomDoubles random(6);
    for (int i = 0; i < 200000 && !HasFailure(); ++i) {
        const double units = std::fabs(random.next());
        const double centre = i % 2 ? units * 0x1p3 : random.next();
        if (!std::isfinite(units) || units == 0 || !std::isfinite(centre)) continue;
        take(centre, units);
        for (const double by : {0.3, -0.7, 3.7, 1000.2, 16000.1, 17000.3}) {
            compare(units * by);
            compare(centre + units * by);
        }
        compare(random.next());
    }
}

TEST_F(PixelScales, KnowNothingAsZerosOrFarFrom0) {
    scale_ = {};
    for (const double value : kortest::SpecialDoubles()) compare(value);
    EXPECT_EQ(unknown_, compared_);
    take(1e9, 0.01);
    EXPECT_EQ(QuickPixels(scale_, 1e9), kUnknownPixels);
}

}  // namespace
}  // namespace kor
