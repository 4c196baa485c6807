// Which slice of a pie lies under a pixel.
#include "graph/number_graph.h"

#include <korcontrols/graph.h>

namespace kortest {
namespace {

// An image of 200 by 200 pixels without titles and percentages: the pie's centre is (100, 100), its
// radius 96.
class GraphPieHit : public NumberGraph {
protected:
    GraphPieHit() {
        graph.chartType = kor::kPie;
        graph.rcPlot = {0, 0, 200, 200};
        graph.options = 0;
    }

    // The largest distance above the centre that hits.
    int reach() const {
        int distance = 0;
        for (int y = 1; y < 300; ++y)
            if (hit(centreX(), centreY() - y) != L"-") distance = y;
        return distance;
    }

    int centreX() const { return (graph.rcPlot.left + graph.rcPlot.right) >> 1; }
    int centreY() const { return (graph.rcPlot.top + graph.rcPlot.bottom) >> 1; }
};

TEST_F(GraphPieHit, SlicesGoRoundCounterClockwiseFromTheTop) {
    add({1, 1, 2});
    EXPECT_EQ(hit(100, 50), L"25%\r\nValue:1") << "straight above";
    EXPECT_EQ(hit(50, 50), L"25%\r\nValue:1") << "upper left";
    EXPECT_EQ(hit(50, 101), L"25%\r\nValue:1") << "lower left, the second slice";
    EXPECT_EQ(hit(100, 150), L"50%\r\nValue:2") << "straight below";
    EXPECT_EQ(hit(150, 100), L"50%\r\nValue:2") << "right";
    EXPECT_EQ(hit(101, 50), L"50%\r\nValue:2") << "just right of the top";
}

TEST_F(GraphPieHit, TellsTheSlicesApart) {
    add({10, 20, 30, 40});  // to 36, 108, 216 and 360 degrees
    EXPECT_EQ(hit(80, 20), L"10%\r\nValue:10");
    EXPECT_EQ(hit(30, 100), L"20%\r\nValue:20");
    EXPECT_EQ(hit(100, 180), L"30%\r\nValue:30");
    EXPECT_EQ(hit(180, 100), L"40%\r\nValue:40");
}

TEST_F(GraphPieHit, BoundaryBelongsToTheLaterSlice) {
    add({1, 1, 2});
    EXPECT_EQ(hit(100, 189), L"50%\r\nValue:2") << "exactly 180 degrees";
    replace(0, {3, 9, 4});  // to 67.5, 270 and 360 degrees
    EXPECT_EQ(hit(160, 100), L"25%\r\nValue:4") << "exactly 270 degrees";
}

TEST_F(GraphPieHit, SharesHaveTwoDigits) {
    add({1, 2});
    EXPECT_EQ(hit(50, 100), L"33%\r\nValue:1");
    EXPECT_EQ(hit(150, 100), L"67%\r\nValue:2");
}

TEST_F(GraphPieHit, SmallSharesHaveTwoDigitsToo) {
    add({1, 199});
    EXPECT_EQ(hit(100, 50), L"0.5%\r\nValue:1");
}

// Two digits of 100 make a power of ten.
TEST_F(GraphPieHit, WholePieIsWrittenAsAPower) {
    add({7});
    EXPECT_EQ(hit(150, 120), L"1E+02%\r\nValue:7");
}

TEST_F(GraphPieHit, NegativeValuesCountByTheirMagnitude) {
    add({-2, 2});
    EXPECT_EQ(hit(50, 100), L"50%\r\nValue:-2");
    EXPECT_EQ(hit(150, 100), L"50%\r\nValue:2");
}

TEST_F(GraphPieHit, EndsAtTheRadius) {
    add({1});
    EXPECT_EQ(reach(), 96);
}

TEST_F(GraphPieHit, CutsTheDistanceToWholePixels) {
    add({1});
    EXPECT_EQ(hit(100 - 68, 100 - 68), L"1E+02%\r\nValue:1") << "96.2 pixels";
    EXPECT_EQ(hit(100 - 60, 100 - 76), L"1E+02%\r\nValue:1") << "96.8 pixels";
    EXPECT_EQ(hit(100 - 59, 100 - 77), L"-") << "97.01 pixels";
}

TEST_F(GraphPieHit, CentreIsNoHit) {
    add({1, 2});
    EXPECT_EQ(hit(100, 100), L"-");
}

TEST_F(GraphPieHit, PercentagesTakeRoomAtTheSides) {
    add({1});
    graph.tipWidth = 30;
    graph.tipHeight = 10;
    EXPECT_EQ(reach(), 66);
    graph.tipWidth = 10;
    graph.tipHeight = 24;
    EXPECT_EQ(reach(), 72);
}

TEST_F(GraphPieHit, ShownTitleTakesRoomAtTheTop) {
    add({1});
    static wchar_t title[] = L"title";
    graph.title = title;
    graph.marginTop = 40;
    EXPECT_EQ(reach(), 96) << "the option is off";
    graph.options = KORGRAPH_TITLE;
    EXPECT_EQ(reach(), 76);
    graph.title = nullptr;
    EXPECT_EQ(reach(), 96) << "there is no title";
}

TEST_F(GraphPieHit, IsAsWideAsTheShorterSide) {
    add({1});
    graph.rcPlot = {0, 0, 300, 120};
    EXPECT_EQ(reach(), 56);
    graph.rcPlot = {0, 0, 120, 300};
    EXPECT_EQ(reach(), 56);
}

TEST_F(GraphPieHit, OnlyTheFirstSeriesIsShown) {
    add({1, 1});
    add({5, 15});
    EXPECT_EQ(hit(50, 100), L"50%\r\nValue:1");
}

TEST_F(GraphPieHit, NothingToShowIsNoHit) {
    EXPECT_EQ(hit(100, 50), L"-") << "no series";
    add({0, 0});
    EXPECT_EQ(hit(100, 50), L"-") << "all values zero";
}

// The sum is that of before the change: 1 + 5 + 9.
TEST_F(GraphPieHit, StaleSumGivesStaleShares) {
    add({1, 5, 9});
    set(0, 1, 6);
    EXPECT_EQ(hit(30, 110), L"40%\r\nValue:6");
}

// The slices end before the circle does: what is left belongs to none.
TEST_F(GraphPieHit, GapOfAStaleSumIsNoHit) {
    add({1, 5, 9});
    set(0, 1, 2);
    EXPECT_EQ(hit(100, 40), L"6.7%\r\nValue:1");
    EXPECT_EQ(hit(110, 40), L"-") << "the last fifth";
}

TEST_F(GraphPieHit, TinyImageIsSurvived) {
    add({1, 2});
    for (const int size : {0, 1, 7, 8, 9}) {
        graph.rcPlot = {0, 0, size, size};
        for (int x = -2; x < 12; ++x) hit(x, x / 2);
        EXPECT_EQ(hit(500, 500), L"-");
    }
}

}  // namespace
}  // namespace kortest
