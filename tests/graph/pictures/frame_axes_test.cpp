// Axes, ticks, pan arrows and grid lines, one sentence at a time.
#include "graph/pictures/chart_pair.h"

#include <cmath>
#include <cstdlib>

namespace kortest {
namespace {

constexpr COLORREF kBlack = RGB(0, 0, 0);
constexpr COLORREF kWhite = RGB(255, 255, 255);
constexpr COLORREF kGrid = RGB(0, 150, 150);

class GraphFrame : public ChartTest {
protected:
    // Leaves only these options on.
    void only(DWORD options) { chart.toggle(chart.state().options ^ options); }

    // Redraws, checks the whole picture and keeps it for single pixels.
    void show() {
        EXPECT_TRUE(chart.same());
        picture = chart.shown();
        plot = chart.state().plot();
    }
    int xOf(double x) { return chart.state().xPixel(x); }
    int yOf(double y) { return chart.state().yPixel(y); }
    bool isBlack(int x, int y) const { return picture.pixel(x, y) == kBlack; }

    Picture picture;
    RECT plot{};
};

class GraphXAxis : public GraphFrame {};
class GraphYAxis : public GraphFrame {};
class GraphTicks : public GraphFrame {};
class GraphArrows : public GraphFrame {};
class GraphGrid : public GraphFrame {};

TEST_F(GraphXAxis, StandsAtZeroAndIsTwoPixelsThick) {
    only(0);
    chart.setRange(KORGRAPH_Y, -10, 10);
    show();
    const int y = yOf(0);
    int rows = 0;
    for (int dy = -3; dy <= 3; ++dy) rows += isBlack(plot.left + 60, y + dy);
    EXPECT_EQ(rows, 2);
    EXPECT_TRUE(isBlack(plot.left, y));
    EXPECT_TRUE(isBlack(plot.right - 1, y));
    EXPECT_EQ(picture.pixel(plot.right + 2, y), kWhite);
}

TEST_F(GraphXAxis, LiesAlongThePlotBottomWhenZeroIsBelow) {
    only(0);
    chart.setRange(KORGRAPH_Y, 5, 10);
    show();
    EXPECT_TRUE(isBlack(plot.left + 60, plot.bottom));
}

TEST_F(GraphXAxis, LiesAlongThePlotBottomWhenZeroIsAbove) {
    only(0);
    chart.setRange(KORGRAPH_Y, -10, -5);
    show();
    EXPECT_TRUE(isBlack(plot.left + 60, plot.bottom));
    EXPECT_EQ(picture.pixel(plot.left + 60, plot.top), kWhite);
}

TEST_F(GraphXAxis, StaysAtThePlotTopWhenZeroIsThere) {
    only(0);
    chart.setRange(KORGRAPH_Y, -10, 0);
    show();
    EXPECT_LE(std::abs(yOf(0) - plot.top), 1);
    EXPECT_TRUE(isBlack(plot.left + 60, yOf(0)));
}

TEST_F(GraphYAxis, StandsAtZero) {
    only(0);
    chart.setRange(KORGRAPH_X, -10, 10);
    show();
    EXPECT_TRUE(isBlack(xOf(0), plot.top));
    EXPECT_TRUE(isBlack(xOf(0), plot.bottom - 1));
    EXPECT_EQ(picture.pixel(xOf(0), plot.top - 3), kWhite);
}

TEST_F(GraphYAxis, LiesAlongThePlotLeftWhenZeroIsLeft) {
    only(0);
    chart.setRange(KORGRAPH_X, 5, 10);
    show();
    EXPECT_TRUE(isBlack(plot.left, plot.top + 60));
}

TEST_F(GraphYAxis, IsDrawnInTheRightMarginWhenZeroLiesThere) {
    only(0);
    chart.setRange(KORGRAPH_X, -20, -0.4);
    show();
    EXPECT_GT(xOf(0), plot.right);
    EXPECT_LT(xOf(0), 320);
    EXPECT_TRUE(isBlack(xOf(0), plot.top + 60));
}

TEST_F(GraphYAxis, IsOutOfSightBeyondTheRightMarginAddedToTheEdge) {
    only(KORGRAPH_YTICKS);
    chart.setRange(KORGRAPH_X, -20, -10);
    show();
    for (int x = plot.left + 2; x < 320; ++x) EXPECT_EQ(picture.pixel(x, plot.top + 60), kWhite);
}

TEST_F(GraphYAxis, KeepsAPlaceJustOutsideTheSurface) {
    only(KORGRAPH_YTICKS);
    chart.setRange(KORGRAPH_X, -20, -1.1);
    show();
    ASSERT_GT(xOf(0), plot.right);
    ASSERT_LT(xOf(0), 320 + 15);
    // Whatever of its ticks reaches into the surface is drawn.
    EXPECT_EQ(picture.count(kBlack, {plot.right + 1, plot.top, 320, plot.bottom}) > 0,
              xOf(0) - 3 < 320);
}

TEST_F(GraphTicks, AreSevenRowsHighAndCountFromZero) {
    only(KORGRAPH_XTICKS);
    chart.setRange(KORGRAPH_Y, -10, 10);
    chart.setRange(KORGRAPH_X, 100, 120);
    show();
    const double step = chart.state().xTickStep;
    EXPECT_EQ(step, 4);
    for (double x = 104; x < 120; x += step) {
        EXPECT_TRUE(isBlack(xOf(x), yOf(0) - 3)) << x;
        EXPECT_TRUE(isBlack(xOf(x), yOf(0) + 2)) << x;
        EXPECT_FALSE(isBlack(xOf(x), yOf(0) + 3)) << x;
        EXPECT_FALSE(isBlack(xOf(x), yOf(0) - 4)) << x;
        EXPECT_FALSE(isBlack(xOf(x) + 5, yOf(0) - 3)) << x;
    }
}

TEST_F(GraphTicks, CountFromZeroBothWays) {
    only(KORGRAPH_XTICKS);
    chart.setRange(KORGRAPH_Y, -10, 10);
    chart.setRange(KORGRAPH_X, -7.5, 7.5);
    show();
    const double step = chart.state().xTickStep;
    for (const double k : {-2.0, -1.0, 1.0, 2.0}) EXPECT_TRUE(isBlack(xOf(k * step), yOf(0) - 3));
}

TEST_F(GraphTicks, LeaveOutThePlotsEdgeOfTheWalkThatBeginsThere) {
    only(KORGRAPH_XTICKS);
    chart.setRange(KORGRAPH_Y, -10, 10);
    chart.setRange(KORGRAPH_X, 0, 6);
    show();
    // 0 lies on the plot's left: the walk downwards draws it, the one upwards does not.
    EXPECT_EQ(xOf(0), plot.left);
    EXPECT_TRUE(isBlack(plot.left, yOf(0) - 3));
    EXPECT_EQ(xOf(6), plot.right);
    EXPECT_TRUE(isBlack(plot.right, yOf(0) - 3));
}

TEST_F(GraphTicks, LeaveOutThePlotsRightWhenItIsBelowZero) {
    only(KORGRAPH_XTICKS);
    chart.resize(321, 240);
    chart.setRange(KORGRAPH_Y, -10, 10);
    chart.setRange(KORGRAPH_X, -24, -4);
    ASSERT_EQ(chart.state().xTickStep, 4);
    chart.resize(chart.state().plot().right % 2 == chart.state().plot().left % 2 ? 321 : 322, 240);
    show();
    ASSERT_EQ(xOf(-4), plot.right);
    EXPECT_FALSE(isBlack(plot.right, yOf(0) - 3));
    EXPECT_TRUE(isBlack(xOf(-8), yOf(0) - 3));
}

TEST_F(GraphTicks, OfTheYAxisHaveAnOptionOfTheirOwn) {
    only(KORGRAPH_YTICKS);
    chart.setRange(KORGRAPH_X, -10, 10);
    chart.setRange(KORGRAPH_Y, -10, 10);
    show();
    const int y = yOf(chart.state().yTickStep);
    EXPECT_TRUE(isBlack(xOf(0) - 3, y));
    EXPECT_TRUE(isBlack(xOf(0) + 2, y));
    EXPECT_FALSE(isBlack(xOf(0) + 3, y));
    EXPECT_FALSE(isBlack(xOf(chart.state().xTickStep), yOf(0) - 3));
    only(KORGRAPH_XTICKS);
    show();
    EXPECT_FALSE(isBlack(xOf(0) - 3, yOf(chart.state().yTickStep)));
    EXPECT_TRUE(isBlack(xOf(chart.state().xTickStep), yOf(0) - 3));
}

TEST_F(GraphTicks, FarFromZeroStandOnMultiplesOfTheStep) {
    only(KORGRAPH_XTICKS);
    chart.setRange(KORGRAPH_Y, -10, 10);
    chart.setRange(KORGRAPH_X, 3e12, 3e12 + 1000);
    chart.redraw();  // the plain walk would take minutes
    picture = chart.shown();
    plot = chart.state().plot();
    const double step = chart.state().xTickStep;
    int ticks = 0;
    for (int x = plot.left + 3; x < plot.right - 3; ++x) ticks += isBlack(x, yOf(0) - 3);

    const double first = std::ceil(3e12 / step) * step;
    EXPECT_EQ(ticks, static_cast<int>((3e12 + 1000 - first) / step) + 1);
    EXPECT_TRUE(isBlack(xOf(first), yOf(0) - 3));
    EXPECT_TRUE(isBlack(xOf(first + step), yOf(0) - 3));
}

TEST_F(GraphTicks, AreLeftOutWhereAStepChangesNothing) {
    chart.setRange(KORGRAPH_X, 1e300, 1e300 * (1 + 1e-15));
    chart.setRange(KORGRAPH_Y, -1e17, -1e17 + 16);
    KorGraph_Redraw(chart.window());  // comes back
    UpdateWindow(chart.window());
}

TEST_F(GraphArrows, NoneWithoutZoom) {
    chart.addSeries({1, 2, 3});
    show();
    EXPECT_EQ(chart.state().arrowsShown, kNoArrow);
    EXPECT_FALSE(isBlack(plot.right + 3, yOf(0)));
}

TEST_F(GraphArrows, AllFourAtTwiceTheSize) {
    only(0);
    chart.addSeries({-10, 10});
    chart.setRange(KORGRAPH_X, -10, 10);
    chart.setZoom(KORGRAPH_ZOOM200);
    show();
    EXPECT_EQ(chart.state().arrowsShown, kArrowLeft | kArrowRight | kArrowUp | kArrowDown);
    const int y = yOf(0);
    const int x = xOf(0);
    EXPECT_TRUE(isBlack(plot.left - 10, y));
    EXPECT_TRUE(isBlack(plot.left - 3, y - 5));
    EXPECT_TRUE(isBlack(plot.left - 3, y + 4));
    EXPECT_TRUE(isBlack(plot.right + 10, y));
    EXPECT_TRUE(isBlack(plot.right + 3, y - 5));
    EXPECT_TRUE(isBlack(x, plot.top - 10));
    EXPECT_TRUE(isBlack(x - 5, plot.top - 3));
    EXPECT_TRUE(isBlack(x, plot.bottom + 9));
    EXPECT_TRUE(isBlack(x - 5, plot.bottom + 3));
    EXPECT_FALSE(isBlack(plot.left - 13, y));
    EXPECT_FALSE(isBlack(x, plot.top - 13));
}

TEST_F(GraphArrows, GoWithTheZoom) {
    chart.addSeries({-10, 10});
    chart.setZoom(KORGRAPH_ZOOM200);
    show();
    EXPECT_NE(chart.state().arrowsShown, kNoArrow);
    chart.setZoom(KORGRAPH_ZOOM100);
    show();
    EXPECT_EQ(chart.state().arrowsShown, kNoArrow);
    // Where an arrow was, a press pans no more.
    chart.press(plot.right + 5, yOf(0));
    show();
}

TEST_F(GraphArrows, PanByOneTickAndComeBack) {
    chart.addSeries({-10, 10, 5, 3, 1, 8});
    chart.setZoom(KORGRAPH_ZOOM200);
    show();
    const int before = xOf(3);
    chart.pan(kArrowRight);
    show();
    EXPECT_LT(xOf(3), before);
    chart.pan(kArrowLeft);
    chart.pan(kArrowUp);
    show();
    EXPECT_EQ(xOf(3), before);
}

TEST_F(GraphGrid, LinesCrossThePlotInTheirColour) {
    only(KORGRAPH_HORIZONTALGRID);
    chart.setRange(KORGRAPH_X, 0, 10);
    chart.setRange(KORGRAPH_Y, -10, 10);
    show();
    const int y = yOf(chart.state().yTickStep);
    for (int x = plot.left + 2; x < plot.right; ++x) EXPECT_EQ(picture.pixel(x, y), kGrid) << x;
    EXPECT_EQ(picture.pixel(plot.right, y), kWhite);
    EXPECT_EQ(picture.pixel(plot.left + 20, y + 1), kWhite);
    only(KORGRAPH_VERTICALGRID);
    show();
    const int x = xOf(chart.state().xTickStep);
    EXPECT_EQ(picture.pixel(x, plot.top), kGrid);
    EXPECT_EQ(picture.pixel(x, plot.bottom - 1), kGrid);
    EXPECT_EQ(picture.pixel(x, plot.bottom), kWhite);
    EXPECT_EQ(picture.pixel(plot.left + 20, y), kWhite);
}

TEST_F(GraphGrid, LieUnderTheSeries) {
    only(KORGRAPH_HORIZONTALGRID | KORGRAPH_VERTICALGRID);
    chart.setType(KORGRAPH_COLUMN);
    chart.addSeries({10});
    show();
    EXPECT_EQ(picture.pixel(xOf(1), yOf(chart.state().yTickStep)), RGB(0, 255, 0));
}

TEST_F(GraphGrid, OptionsOffLeaveAWhitePlot) {
    only(0);
    chart.addSeries({1});
    show();
    EXPECT_EQ(picture.count(kGrid), 0);
}

}  // namespace
}  // namespace kortest
