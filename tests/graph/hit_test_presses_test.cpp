// Presses in the plot area, and what the tooltip is told.
#include "graph/graph_fixture.h"

namespace kortest {
namespace {

class GraphPress : public GraphTest {};

TEST_F(GraphPress, OnAPointShowsItsValue) {
    createRegular();
    EXPECT_EQ(tap(95, 75), L"Value:4");
    EXPECT_EQ(tap(98, 78), L"Value:4");
    EXPECT_EQ(tap(99, 75), L"-");
    EXPECT_EQ(tap(95, 79), L"-");
}

TEST_F(GraphPress, TellsThePlaceInTheParent) {
    create(230, 130, 40, 55);
    send(GM_TOGGLEOPTIONS, 0, kAllOptions);
    add({1, 2, 3, 4, 5, 6, 7, 8, 10});
    ASSERT_EQ(tap(96, 74), L"Value:4");
    EXPECT_EQ(shown[0].x, 40 + 96);
    EXPECT_EQ(shown[0].y, 55 + 74);
}

// Twice the chart's right edge less the parent's, on the screen.
TEST_F(GraphPress, TellsTheLimit) {
    create(230, 130, 40, 55);
    send(GM_TOGGLEOPTIONS, 0, kAllOptions);
    add({1, 2, 3, 4, 5, 6, 7, 8, 10});
    SetWindowPos(host.window(), nullptr, 70, 20, 0, 0, SWP_NOSIZE | SWP_NOZORDER);
    RECT chart{}, parent{};
    GetWindowRect(graph, &chart);
    GetWindowRect(host.window(), &parent);
    ASSERT_EQ(parent.left, 70);
    ASSERT_EQ(tap(95, 75), L"Value:4");
    EXPECT_EQ(shown[0].limit, 2 * chart.right - parent.right);
    EXPECT_EQ(shown[0].x, 40 + 95);
}

TEST_F(GraphPress, ShowsTheTooltipAboveThePlace) {
    createRegular();
    PressAt(graph, 95, 75);
    EXPECT_TRUE(IsWindowVisible(tip));
    EXPECT_EQ(PlaceIn(host.window(), tip).bottom, 75);
    ReleaseAt(graph, 95, 75);
    EXPECT_FALSE(IsWindowVisible(tip));
}

TEST_F(GraphPress, ReleaseHidesTheTooltipAlways) {
    createRegular();
    ReleaseAt(graph, 5, 5);
    EXPECT_EQ(hidden, 1);
}

TEST_F(GraphPress, OnNothingLeavesTheTooltipAsItWas) {
    createRegular();
    PressAt(graph, 95, 75);
    settle();
    PressAt(graph, 200, 100);
    EXPECT_EQ(shown.size(), 0u);
    EXPECT_EQ(hidden, 0);
    EXPECT_TRUE(IsWindowVisible(tip)) << "until the button is released";
}

// A point on the corner of the plot can be reached from inside only.
TEST_F(GraphPress, EdgesOfThePlotBelongToIt) {
    createPlain();
    add({10, 0, 0, 0, 0, 0, 0, 0, 0, 10});
    KorGraph_SetRange(graph, KORGRAPH_X, 1, 10);
    KorGraph_SetRange(graph, KORGRAPH_Y, 0, 10);
    EXPECT_EQ(tap(15, 15), L"Value:10");
    EXPECT_EQ(tap(14, 15), L"-");
    EXPECT_EQ(tap(15, 14), L"-");
    EXPECT_EQ(tap(215, 15), L"Value:10");
    EXPECT_EQ(tap(216, 15), L"-");
    KorGraph_SetRange(graph, KORGRAPH_X, 2, 9);
    EXPECT_EQ(tap(15, 115), L"Value:0");
    EXPECT_EQ(tap(215, 115), L"Value:0");
    EXPECT_EQ(tap(15, 116), L"-");
    EXPECT_EQ(tap(215, 116), L"-");
}

TEST_F(GraphPress, SeriesAddedFirstWins) {
    createRegular();
    add({9, 9, 9, 4.01});
    KorGraph_SetRange(graph, KORGRAPH_X, 0, 10);
    KorGraph_SetRange(graph, KORGRAPH_Y, 0, 10);
    EXPECT_EQ(tap(95, 75), L"Value:4");
}

TEST_F(GraphPress, OnAColumn) {
    createRegular();
    KorGraph_SetType(graph, KORGRAPH_COLUMN);
    EXPECT_EQ(tap(95, 75), L"Value:4");
    EXPECT_EQ(tap(90, 114), L"Value:4");
    EXPECT_EQ(tap(90, 74), L"-");
}

// Bars: values along x (20 pixels a unit), categories up (10 pixels a unit).
TEST_F(GraphPress, OnABar) {
    createRegular();
    KorGraph_SetType(graph, KORGRAPH_BAR);
    EXPECT_EQ(tap(50, 75), L"Value:4");
    EXPECT_EQ(tap(95, 77), L"Value:4");
    EXPECT_EQ(tap(96, 77), L"-");
}

TEST_F(GraphPress, OnASliceHasTwoLines) {
    createPlain(200, 200);
    add({1, 1, 2});
    KorGraph_SetType(graph, KORGRAPH_PIE);
    EXPECT_EQ(tap(100, 50), L"25%\r\nValue:1");
    EXPECT_EQ(tap(100, 150), L"50%\r\nValue:2");
    EXPECT_EQ(tap(100, 100), L"-") << "the very centre";
}

TEST_F(GraphPress, OnTheRestOfTheOldTextShowsNoneOfIt) {
    createRegular();
    KorGraph_SetRange(graph, KORGRAPH_Y, 0, 200000000);
    setValue(0, 0, 123456789);
    EXPECT_EQ(tap(35, 115 - 61), L"Value:1.2346E+08");
    KorGraph_SetRange(graph, KORGRAPH_Y, 0, 10);
    EXPECT_EQ(tap(95, 75), L"Value:4");
}

// A position left of or above the chart is outside the plot.
TEST_F(GraphPress, NegativePositionsAreOutside) {
    createRegular();
    EXPECT_EQ(tap(-30, 60), L"-");
    EXPECT_EQ(tap(60, -30), L"-");
    EXPECT_EQ(tap(-1, -1), L"-");
}

TEST_F(GraphPress, DestroyedTooltipIsSurvived) {
    createRegular();
    DestroyWindow(tip);
    PressAt(graph, 95, 75);
    ReleaseAt(graph, 95, 75);
    EXPECT_EQ(KorGraph_GetOptions(graph), 0u);
}

}  // namespace
}  // namespace kortest
