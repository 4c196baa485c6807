// Which multiples of a step an axis shows.
#include "graph/scale/ticks.h"

#include <gtest/gtest.h>

#include <limits>

namespace kortest {
namespace {

bool IsEmpty(const kor::TickRange& range) { return range.first > range.last; }

TEST(GraphTickNumbers, ReachOneStepBeyondBothEnds) {
    const kor::TickRange range = kor::TicksBetween(-1.5, 4.5, 1.0);
    EXPECT_EQ(range.first, -3);
    EXPECT_EQ(range.last, 6);
    const kor::TickRange turned = kor::TicksBetween(4.5, -1.5, 1.0);
    EXPECT_EQ(turned.first, -3);
    EXPECT_EQ(turned.last, 6);
}

TEST(GraphTickNumbers, AreNoneWithoutAStepForward) {
    const double infinity = std::numeric_limits<double>::infinity();
    for (const double step :
         {0.0, -1.0, -infinity, infinity, std::numeric_limits<double>::quiet_NaN()}) {
        EXPECT_TRUE(IsEmpty(kor::TicksBetween(0, 10, step))) << step;
    }
}

TEST(GraphTickNumbers, AreAtMostAHundredThousand) {
    EXPECT_FALSE(IsEmpty(kor::TicksBetween(0, 99998, 1.0)));
    EXPECT_TRUE(IsEmpty(kor::TicksBetween(0, 99999, 1.0)));
}

TEST(GraphTickNumbers, AreNoneWhereNeighboursAreOneNumber) {
    const double last = 4503599627370496.0 - 1;
    EXPECT_FALSE(IsEmpty(kor::TicksBetween(last - 10, last, 1.0)));
    EXPECT_TRUE(IsEmpty(kor::TicksBetween(last - 10, last + 1, 1.0)));
    EXPECT_FALSE(IsEmpty(kor::TicksBetween(-last, 10 - last, 1.0)));
    EXPECT_TRUE(IsEmpty(kor::TicksBetween(-last - 1, 10 - last, 1.0)));
}

}  // namespace
}  // namespace kortest
