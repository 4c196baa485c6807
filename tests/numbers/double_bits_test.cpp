// Arithmetic by bits against the same in floating point.
#include "numbers/double_bits.h"

#include "numbers/special_doubles.h"
#include "numbers/truncate.h"

#include <gtest/gtest.h>

namespace kor {
namespace {

constexpr int kRandomDoubles = 2000000;

// As the comparisons of doubles see two numbers.
int Order(double a, double b) { return a < b ? -1 : a > b ? 1 : 0; }
int Order(int64_t a, int64_t b) { return a < b ? -1 : a > b ? 1 : 0; }

bool IsOrderedAlike(double a, double b) {
    return std::isnan(a) || std::isnan(b) || Order(a, b) == Order(OrderOf(a), OrderOf(b));
}

int TruncatedPlainly(double value) {
    if (std::isnan(value)) return 0;
    if (value >= kPixelLimit) return kPixelLimit;
    if (value <= -kPixelLimit) return -kPixelLimit;
    return static_cast<int>(value);
}

TEST(DoubleBits, OrderSpecialDoublesAsComparisonsDo) {
    const std::vector<double> values = kortest::SpecialDoubles();
    for (const double a : values) {
        for (const double b : values) EXPECT_TRUE(IsOrderedAlike(a, b)) << a << " and " << b;
    }
    EXPECT_EQ(OrderOf(-0.0), OrderOf(0.0));
}

TEST(DoubleBits, OrderRandomDoublesAsComparisonsDo) {
    kortest::RandomDoubles random(1);
    int different = 0;
    for (int i = 0; i < kRandomDoubles; ++i) {
        different += !IsOrderedAlike(random.next(), random.next());
        const double value = random.nextOrdinary();
        different += !IsOrderedAlike(value, random.nextOrdinary());
        different += !IsOrderedAlike(value, std::nextafter(value, 0));
    }
    EXPECT_EQ(different, 0);
}

TEST(DoubleBits, PutWhatIsNoNumberOutsideAllFiniteOnes) {
    constexpr double kMost = std::numeric_limits<double>::max();
    for (const double value : kortest::SpecialDoubles()) {
        const bool isBetween =
            OrderOf(-kMost) <= OrderOf(value) && OrderOf(value) <= OrderOf(kMost);
        EXPECT_EQ(isBetween, std::isfinite(value)) << value;
    }
}

TEST(DoubleBits, KnowFiniteNumbers) {
    for (const double value : kortest::SpecialDoubles()) {
        EXPECT_EQ(IsFiniteByBits(value), std::isfinite(value)) << value;
        EXPECT_EQ(IsFinite(value), std::isfinite(value)) << value;
    }
}

TEST(DoubleBits, TruncateSpecialDoublesAsConversionsDo) {
    for (const double value : kortest::SpecialDoubles()) {
        EXPECT_EQ(TruncateByBits(value, kPixelLimitBits), TruncatedPlainly(value)) << value;
        EXPECT_EQ(TruncateToInt(value), TruncatedPlainly(value)) << value;
    }
}

TEST(DoubleBits, TruncateRandomDoublesAsConversionsDo) {
    kortest::RandomDoubles random(2);
    int different = 0;
    for (int i = 0; i < kRandomDoubles; ++i) {
        for (const double value :
             {random.next(), random.nextOrdinary(), 100 * random.nextOrdinary()}) {
            different += TruncateByBits(value, kPixelLimitBits) != TruncatedPlainly(value);
        }
    }
    EXPECT_EQ(different, 0);
}

}  // namespace
}  // namespace kor
