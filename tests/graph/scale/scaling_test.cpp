// The scaling of an axis: units per pixel, tick step, bar size.
#include "graph/number_graph.h"

#include <limits>

#include <ostream>

namespace kortest {
namespace {

class GraphScaling : public NumberGraph {};

TEST_F(GraphScaling, OfTenUnitsOver200Pixels) {
    EXPECT_DOUBLE_EQ(graph.xUnitsPerPixelBase, 0.05);
    EXPECT_DOUBLE_EQ(graph.xUnitsPerPixel, 0.05);
    EXPECT_EQ(graph.xTickStep, 3.0);
    EXPECT_EQ(graph.xTickStepCopy, 3.0);
    EXPECT_EQ(graph.xCentre, 5.0);
}

TEST_F(GraphScaling, OfTenUnitsOver100Pixels) {
    EXPECT_DOUBLE_EQ(graph.yUnitsPerPixelBase, 0.1);
    EXPECT_DOUBLE_EQ(graph.yUnitsPerPixel, 0.1);
    EXPECT_EQ(graph.yTickStep, 3.0);
    EXPECT_EQ(graph.yTickStepCopy, 3.0);
    EXPECT_EQ(graph.yCentre, 5.0);
}

TEST_F(GraphScaling, ZoomKeepsTheBaseAndChangesTheRest) {
    kor::SetZoomFactor(graph, 2.0);
    EXPECT_DOUBLE_EQ(graph.xUnitsPerPixelBase, 0.05);
    EXPECT_DOUBLE_EQ(graph.xUnitsPerPixel, 0.025);
    EXPECT_EQ(graph.xTickStep, 2.0);
    EXPECT_EQ(graph.yTickStep, 2.0);
    kor::SetZoomFactor(graph, 0.25);
    EXPECT_DOUBLE_EQ(graph.xUnitsPerPixel, 0.2);
    EXPECT_EQ(graph.xTickStep, 10.0);
    EXPECT_EQ(graph.yTickStep, 10.0);
    EXPECT_EQ(graph.yTickStepCopy, 10.0);
}

TEST_F(GraphScaling, ZoomFactorLosesItsSign) {
    kor::SetZoomFactor(graph, -0.5);
    EXPECT_EQ(graph.zoom, 0.5);
    EXPECT_DOUBLE_EQ(graph.xUnitsPerPixel, 0.1);
}

// About 50 pixels on x, 25 on y, rounded up to whole units.
TEST_F(GraphScaling, StepTakesTheNextWholeUnit) {
    showX(0, 200);
    EXPECT_EQ(graph.xTickStep, 50.0);
    showX(0, 201);
    EXPECT_EQ(graph.xTickStep, 51.0);
    showX(0, 1);
    EXPECT_EQ(graph.xTickStep, 1.0);
    showY(0, 100);
    EXPECT_EQ(graph.yTickStep, 25.0);
    showY(0, 101);
    EXPECT_EQ(graph.yTickStep, 26.0);
}

// A range of exactly one unit is no short one.
TEST_F(GraphScaling, OneUnitOverFewPixelsHasAWholeStepOfMore) {
    resizePlot(20, 10);
    showX(0, 1);
    showY(0, 1);
    EXPECT_EQ(graph.xTickStep, 3.0);
    EXPECT_EQ(graph.yTickStep, 3.0);
}

struct ShortRange {
    double low;
    double high;
    double step;
};

void PrintTo(const ShortRange& range, std::ostream* stream) {
    *stream << range.low << " to " << range.high;
}

class GraphShortRange : public NumberGraph, public ::testing::WithParamInterface<ShortRange> {};

TEST_P(GraphShortRange, HasADecimalPowerAsItsStep) {
    showX(GetParam().low, GetParam().high);
    showY(GetParam().low, GetParam().high);
    EXPECT_NEAR(graph.xTickStep, GetParam().step, GetParam().step * 1e-12);
    EXPECT_NEAR(graph.yTickStep, GetParam().step, GetParam().step * 1e-12);
    EXPECT_EQ(graph.xTickStepCopy, graph.xTickStep);
    EXPECT_EQ(graph.yTickStepCopy, graph.yTickStep);
}

TEST_P(GraphShortRange, IsIndependentOfTheZoom) {
    for (const double zoom : {0.25, 2.0}) {
        kor::SetZoomFactor(graph, zoom);
        showX(GetParam().low, GetParam().high);
        showY(GetParam().low, GetParam().high);
        EXPECT_NEAR(graph.xTickStep, GetParam().step, GetParam().step * 1e-12);
        EXPECT_NEAR(graph.yTickStep, GetParam().step, GetParam().step * 1e-12);
    }
}

INSTANTIATE_TEST_SUITE_P(Below1, GraphShortRange,
                         ::testing::Values(ShortRange{0, 0.5, 0.1}, ShortRange{0, 0.37, 0.1},
                                           ShortRange{0, 0.05, 0.01}, ShortRange{0, 0.99, 0.1},
                                           ShortRange{3, 3.25, 0.1}, ShortRange{0, 0.002, 0.001}));

// A range below 1 is also one whose ends are exchanged.
INSTANTIATE_TEST_SUITE_P(Exchanged, GraphShortRange,
                         ::testing::Values(ShortRange{0.5, 0, 0.1}, ShortRange{3, 0, 1},
                                           ShortRange{10, 0, 10}, ShortRange{99, 0, 10},
                                           ShortRange{400, 0, 100}));

TEST_F(GraphScaling, ExchangedEndsKeepUnitsPerPixelAboveZero) {
    showX(10, 0);
    EXPECT_DOUBLE_EQ(graph.xUnitsPerPixel, 0.05);
    EXPECT_EQ(graph.xCentre, 5.0);
    showY(10, 0);
    EXPECT_DOUBLE_EQ(graph.yUnitsPerPixel, 0.1);
    EXPECT_EQ(graph.yCentre, 5.0);
}

TEST_F(GraphScaling, StepOfZeroBecomesOne) {
    showX(1e300, 1e300);
    EXPECT_EQ(graph.xTickStep, 1.0);
    EXPECT_EQ(graph.xTickStepCopy, 1.0);
    showY(1e300, 1e300);
    EXPECT_EQ(graph.yTickStep, 1.0);
    EXPECT_EQ(graph.yTickStepCopy, 1.0);
}

TEST_F(GraphScaling, HalfSpacingIsHalfAStepLessTwo) {
    EXPECT_EQ(graph.xTickHalfSpacing, 28);  // 60 pixels
    kor::SetZoomFactor(graph, 2.0);
    EXPECT_EQ(graph.xTickHalfSpacing, 38);  // 80 pixels
    showX(0, 1);
    kor::SetZoomFactor(graph, 1.0);
    EXPECT_EQ(graph.xTickHalfSpacing, 98);
}

TEST_F(GraphScaling, HalfSpacingRoundsDown) {
    resizePlot(101, 100);
    showX(0, 1);
    EXPECT_EQ(kor::xPixel(graph, 1) - kor::xPixel(graph, 0), 100);
    EXPECT_EQ(graph.xTickHalfSpacing, 48);
    resizePlot(210, 100);
    showX(0, 10);  // 3 units are 63 pixels
    EXPECT_EQ(graph.xTickHalfSpacing, 29);
}

TEST_F(GraphScaling, MiddleOfAnOddPlotIsRoundedDown) {
    resizePlot(201, 101);
    EXPECT_EQ(graph.xCentrePixel, 115);
    EXPECT_EQ(graph.yCentrePixel, 65);
}

TEST_F(GraphScaling, UsesEachMarginOnItsOwnSide) {
    graph.marginLeft = 40;
    graph.marginTop = 35;
    graph.marginBottom = 25;
    graph.rcPlot = {0, 0, 255, 160};
    rescale();
    EXPECT_EQ(graph.xCentrePixel, 140);
    EXPECT_EQ(graph.yCentrePixel, 85);
    EXPECT_DOUBLE_EQ(graph.xUnitsPerPixel, 0.05);
    EXPECT_DOUBLE_EQ(graph.yUnitsPerPixel, 0.1);
}

// On a page the area begins elsewhere; the middle is counted from the margin alone.
TEST_F(GraphScaling, LeftAndTopOfTheAreaDoNotMoveTheMiddle) {
    graph.rcPlot = {50, 60, 280, 190};
    rescale();
    EXPECT_EQ(graph.xCentrePixel, 115);
    EXPECT_EQ(graph.yCentrePixel, 65);
    EXPECT_DOUBLE_EQ(graph.xUnitsPerPixel, 0.05);
    EXPECT_DOUBLE_EQ(graph.yUnitsPerPixel, 0.1);
}

TEST_F(GraphScaling, BarsShareOneUnit) {
    add({1});
    EXPECT_EQ(graph.barWidth, 20);
    EXPECT_EQ(graph.barHeight, 10);
    add({1});
    add({1});
    EXPECT_EQ(graph.barWidth, 6);
    EXPECT_EQ(graph.barHeight, 3);
}

TEST_F(GraphScaling, BarsDoNotFollowTheZoom) {
    add({1});
    kor::SetZoomFactor(graph, 2.0);
    EXPECT_EQ(graph.barWidth, 20);
    EXPECT_EQ(graph.barHeight, 10);
}

TEST_F(GraphScaling, BarsOfABroadRangeHaveNoWidth) {
    add({1});
    showX(0, 201);
    EXPECT_EQ(graph.barWidth, 0);
}

TEST_F(GraphScaling, ZoomingOutNarrowsBarsAndZoomingInDoesNotWiden) {
    graph.zoom = 1.0;
    EXPECT_EQ(kor::ZoomedThickness(graph, 7), 7);
    graph.zoom = 2.0;
    EXPECT_EQ(kor::ZoomedThickness(graph, 7), 7);
    graph.zoom = 0.5;
    EXPECT_EQ(kor::ZoomedThickness(graph, 7), 3);
    graph.zoom = 0.25;
    EXPECT_EQ(kor::ZoomedThickness(graph, 7), 1);
    EXPECT_EQ(kor::ZoomedThickness(graph, 3), 0);
}

// 0.95e308 / 4 * 2 units a pixel would be four times as many at a zoom of 25%, more than a double
// holds.
TEST_F(GraphScaling, ZoomedOutBeyondTheNumbersStaysFinite) {
    graph.zoom = 0.25;
    resizePlot(4, 100);
    showX(-0.95e308, 0.95e308);
    EXPECT_EQ(graph.xUnitsPerPixel, std::numeric_limits<double>::max());
    EXPECT_EQ(kor::xPixel(graph, 0), 17);
}

TEST_F(GraphScaling, WaitsForAWindow) {
    graph.hwnd = nullptr;
    graph.xMax = 20;
    graph.yMax = 20;
    rescale();
    EXPECT_DOUBLE_EQ(graph.xUnitsPerPixel, 0.05);
    EXPECT_DOUBLE_EQ(graph.yUnitsPerPixel, 0.1);
    EXPECT_EQ(graph.xCentre, 5.0);
    EXPECT_EQ(graph.yCentre, 5.0);
}

}  // namespace
}  // namespace kortest
