// Series by messages, seen through colours, ranges and presses.
#include "graph/graph_fixture.h"

namespace kortest {
namespace {

class GraphData : public GraphTest {};

TEST_F(GraphData, SeriesGivesTheAutomaticRanges) {
    create();
    EXPECT_EQ(add({2, 7, 4}), 0);
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.0, 4.0}));
    EXPECT_EQ(range(KORGRAPH_Y), (std::pair{0.0, 7.0}));
}

TEST_F(GraphData, ExtremesAreAsStated) {
    const struct {
        std::vector<double> values;
        double low, high;
    } rows[] = {{{5, 5}, 0, 5}, {{-3, -3}, -3, -2}, {{0, 0}, 0, 1}, {{-2, -6}, -6, -2}};
    create();
    for (const auto& row : rows) {
        notify(GN_RESET, 1);
        add(row.values);
        EXPECT_EQ(range(KORGRAPH_Y), (std::pair{row.low, row.high})) << row.values[0];
    }
}

TEST_F(GraphData, EighteenthSeriesTakesPaletteEntry20) {
    create();
    for (int i = 0; i < 18; ++i) add({1});
    EXPECT_EQ(colour(15), RGB(192, 192, 192)) << "entry 18";
    COLORREF last = 0x123456;
    send(GM_GETSERIESCOLOR, 17, reinterpret_cast<LPARAM>(&last));
    EXPECT_EQ(last, RGB(0, 0, 0)) << "entry 20";
}

TEST_F(GraphData, NineteenthSeriesTakesTheEntryThatTheFirstLeftOut) {
    create();
    for (int i = 0; i < 20; ++i) add({1});
    EXPECT_EQ(colour(0), RGB(0, 255, 0));
    EXPECT_EQ(colour(18), RGB(255, 0, 0));
    EXPECT_EQ(colour(19), RGB(0, 255, 0));
}

TEST_F(GraphData, SixteenthSliceHasTheColourOfTheFirst) {
    create();
    add(std::vector<double>(16, 1.0));
    KorGraph_SetType(graph, KORGRAPH_PIE);
    EXPECT_EQ(colour(0), RGB(255, 0, 0));
    EXPECT_EQ(colour(14), RGB(128, 128, 255));
    EXPECT_EQ(colour(15), RGB(255, 0, 0));
}

TEST_F(GraphData, ColourOfTheSeriesBehindTheLastIsZero) {
    create();
    add({1});
    COLORREF found = 0x123456;
    send(GM_GETSERIESCOLOR, 1, reinterpret_cast<LPARAM>(&found));
    EXPECT_EQ(found, 0u);
}

TEST_F(GraphData, ValuesAreCopies) {
    createPlain();
    double values[] = {4, 8, 8};
    const GraphSeriesData data = {3, nullptr, values, 0};
    send(GM_ADDSERIES, 0, reinterpret_cast<LPARAM>(&data));
    values[0] = 2;
    EXPECT_EQ(tap(65, 65), L"Value:4");
}

// 0 to 10 on both axes: point 3 stands at x 4, in column 95.
TEST_F(GraphData, SetValueMovesThePoint) {
    createRegular();
    EXPECT_EQ(tap(95, 75), L"Value:4");
    setValue(0, 3, 6.5);
    EXPECT_EQ(tap(95, 75), L"-");
    EXPECT_EQ(tap(95, 50), L"Value:6.5");
}

TEST_F(GraphData, AutomaticRangesFollowOnlyTheLastAdd) {
    createRegular();
    setValue(0, 3, 100);
    EXPECT_EQ(range(KORGRAPH_Y), (std::pair{0.0, 10.0}));
    replace(0, {50, 60, 70});
    EXPECT_EQ(range(KORGRAPH_Y), (std::pair{0.0, 10.0}));
    KorGraph_AutoRange(graph, KORGRAPH_Y);
    EXPECT_EQ(range(KORGRAPH_Y), (std::pair{0.0, 10.0})) << "not even when asked to";
    add({1});
    EXPECT_EQ(range(KORGRAPH_Y), (std::pair{0.0, 70.0}));
}

TEST_F(GraphData, ReplacedSeriesKeepsItsNumberOfPoints) {
    createRegular();
    replace(0, {2, 3});
    EXPECT_EQ(tap(35, 95), L"Value:2");
    EXPECT_EQ(tap(55, 85), L"Value:3");
    for (const int x : {75, 95, 115, 135, 155, 175, 195}) EXPECT_EQ(tap(x, 115), L"Value:0") << x;
    replace(0, std::vector<double>(20, 5.0));
    EXPECT_EQ(tap(195, 65), L"Value:5");
    EXPECT_EQ(tap(215, 65), L"-") << "there is no tenth point";
}

TEST_F(GraphData, StaleSumGivesStaleShares) {
    createPlain(200, 200);
    add({1, 5, 9});
    KorGraph_SetType(graph, KORGRAPH_PIE);
    EXPECT_EQ(tap(30, 110), L"33%\r\nValue:5");
    setValue(0, 1, 6);
    EXPECT_EQ(tap(30, 110), L"40%\r\nValue:6") << "of the sum of before";
    setValue(0, 2, 8);
    EXPECT_EQ(tap(150, 110), L"53%\r\nValue:8") << "the sum is 15 again";
}

TEST_F(GraphData, ClearedChartHasNoPoints) {
    createRegular();
    notify(GN_CLEAR);
    EXPECT_EQ(tap(95, 75), L"-");
    redraw();
    EXPECT_EQ(image().count(RGB(0, 255, 0)), 0);
    setValue(0, 0, 5);
    replace(0, {5});
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.0, 10.0}));
}

TEST_F(GraphData, SeriesAddedAfterAClearIsTheFirstAgain) {
    createRegular();
    notify(GN_CLEAR);
    add({1, 2});
    EXPECT_EQ(colour(0), RGB(0, 255, 0));
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.0, 3.0}));
}

}  // namespace
}  // namespace kortest
