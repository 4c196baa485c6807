// Data values to pixels.
#include "graph/number_graph.h"

#include "graph/data/axes.h"
#include "numbers/truncate.h"

#include <cfloat>
#include <limits>

namespace kortest {
namespace {

constexpr double kInfinity = std::numeric_limits<double>::infinity();

class GraphMapping : public NumberGraph {};

TEST_F(GraphMapping, PutsTheCentreOfTheRangeInTheMiddleOfThePlot) {
    EXPECT_EQ(graph.xCentre, 5.0);
    EXPECT_EQ(graph.xCentrePixel, 115);
    EXPECT_EQ(kor::xPixel(graph, 5), 115);
    EXPECT_EQ(graph.yCentre, 5.0);
    EXPECT_EQ(graph.yCentrePixel, 65);
    EXPECT_EQ(kor::yPixel(graph, 5), 65);
}

TEST_F(GraphMapping, ReachesBothEdgesOfThePlot) {
    EXPECT_EQ(kor::xPixel(graph, 0), 15);
    EXPECT_EQ(kor::xPixel(graph, 10), 215);
    EXPECT_EQ(kor::yPixel(graph, 0), 115);
    EXPECT_EQ(kor::yPixel(graph, 10), 15);
}

TEST_F(GraphMapping, TruncatesTowardTheCentre) {
    EXPECT_EQ(kor::xPixel(graph, 5.04), 115);
    EXPECT_EQ(kor::xPixel(graph, 4.96), 115);
    EXPECT_EQ(kor::xPixel(graph, 5.09), 116);
    EXPECT_EQ(kor::xPixel(graph, 4.91), 114);
    EXPECT_EQ(kor::yPixel(graph, 5.09), 65);
    EXPECT_EQ(kor::yPixel(graph, 4.91), 65);
    EXPECT_EQ(kor::yPixel(graph, 5.19), 64);
    EXPECT_EQ(kor::yPixel(graph, 4.81), 66);
}

TEST_F(GraphMapping, ZoomsAroundTheCentre) {
    kor::SetZoomFactor(graph, 2.0);
    EXPECT_DOUBLE_EQ(graph.xUnitsPerPixel, 0.025);
    EXPECT_DOUBLE_EQ(graph.yUnitsPerPixel, 0.05);
    EXPECT_EQ(kor::xPixel(graph, 5), 115);
    EXPECT_EQ(kor::xPixel(graph, 6), 155);
    EXPECT_EQ(kor::yPixel(graph, 5), 65);
    EXPECT_EQ(kor::yPixel(graph, 6), 45);
}

TEST_F(GraphMapping, FollowsAMovedCentre) {
    graph.xCentre = 3;
    graph.yCentre = 7;
    EXPECT_EQ(kor::xPixel(graph, 3), 115);
    EXPECT_EQ(kor::xPixel(graph, 5), 155);
    EXPECT_EQ(kor::yPixel(graph, 7), 65);
    EXPECT_EQ(kor::yPixel(graph, 5), 85);
}

TEST_F(GraphMapping, StaysWithinWhatDrawingCanTake) {
    for (const double value : {DBL_MAX, -DBL_MAX, 1e20, kInfinity, -kInfinity,
                               std::numeric_limits<double>::quiet_NaN()}) {
        EXPECT_LE(std::abs(kor::xPixel(graph, value)), 2 * kor::kPixelLimit) << value;
        EXPECT_LE(std::abs(kor::yPixel(graph, value)), 2 * kor::kPixelLimit) << value;
    }
    EXPECT_GT(kor::xPixel(graph, kInfinity), 100000);
    EXPECT_LT(kor::xPixel(graph, -kInfinity), -100000);
    EXPECT_LT(kor::yPixel(graph, kInfinity), -100000);
    EXPECT_GT(kor::yPixel(graph, -kInfinity), 100000);
}

TEST_F(GraphMapping, NeverTurnsBack) {
    int lastX = kor::xPixel(graph, -kInfinity);
    int lastY = kor::yPixel(graph, -kInfinity);
    for (double value = -1e12; value < 1e13; value = value < 0 ? value / 10 : value * 10 + 1e-3) {
        EXPECT_GE(kor::xPixel(graph, value), lastX) << value;
        EXPECT_LE(kor::yPixel(graph, value), lastY) << value;
        lastX = kor::xPixel(graph, value);
        lastY = kor::yPixel(graph, value);
        if (value < 0 && value > -1e-6) value = 0;
    }
}

TEST_F(GraphMapping, RangeThatVanishesInItsDigitsIsSurvived) {
    showX(1e300, 1e300);
    showY(1e300, 1e300);
    EXPECT_LE(std::abs(kor::xPixel(graph, 0)), 2 * kor::kPixelLimit);
    EXPECT_LE(std::abs(kor::xPixel(graph, 1e300)), 2 * kor::kPixelLimit);
    EXPECT_LE(std::abs(kor::yPixel(graph, 1e301)), 2 * kor::kPixelLimit);
}

TEST_F(GraphMapping, PlotOfNoPixelsIsSurvived) {
    for (const int size : {0, -1, -14, -30}) {
        resizePlot(size, size);
        EXPECT_GT(graph.xUnitsPerPixel, 0.0) << size;
        EXPECT_GT(graph.yUnitsPerPixel, 0.0) << size;
        EXPECT_TRUE(kor::IsFinite(graph.xUnitsPerPixel)) << size;
        EXPECT_TRUE(kor::IsFinite(graph.yUnitsPerPixel)) << size;
        EXPECT_TRUE(kor::IsFinite(graph.xTickStep)) << size;
        EXPECT_TRUE(kor::IsFinite(graph.yTickStep)) << size;
        EXPECT_LE(std::abs(kor::xPixel(graph, 1)), 2 * kor::kPixelLimit) << size;
        EXPECT_LE(std::abs(kor::yPixel(graph, 1)), 2 * kor::kPixelLimit) << size;
    }
}

TEST_F(GraphMapping, RangeOfNoNumbersIsSurvived) {
    const double nan = std::numeric_limits<double>::quiet_NaN();
    const double ends[][2] = {
        {nan, nan}, {0, nan}, {-kInfinity, kInfinity}, {0, kInfinity}, {-DBL_MAX, DBL_MAX}};
    for (const auto& end : ends) {
        showX(end[0], end[1]);
        showY(end[0], end[1]);
        for (const double value : {0.0, 1.0, -1e9, kInfinity, nan}) {
            EXPECT_LE(std::abs(kor::xPixel(graph, value)), 2 * kor::kPixelLimit);
            EXPECT_LE(std::abs(kor::yPixel(graph, value)), 2 * kor::kPixelLimit);
        }
    }
}

}  // namespace
}  // namespace kortest
