// What all series together span.
#include "graph/number_graph.h"

namespace kortest {
namespace {

class GraphDataExtremes : public NumberGraph {
protected:
    void expectExtremes(double xHigh, double yLow, double yHigh) {
        EXPECT_EQ(graph.xDataMin, 0.0);
        EXPECT_EQ(graph.xDataMax, xHigh);
        EXPECT_EQ(graph.yDataMin, yLow);
        EXPECT_EQ(graph.yDataMax, yHigh);
    }
};

TEST_F(GraphDataExtremes, OfEqualPositiveValuesBeginAtZero) {
    addAutomatic({5, 5, 5});
    expectExtremes(4, 0, 5);
}

TEST_F(GraphDataExtremes, OfEqualNegativeValuesAreRaisedByOne) {
    addAutomatic({-3, -3});
    expectExtremes(3, -3, -2);
}

TEST_F(GraphDataExtremes, OfZerosShowOneUnit) {
    addAutomatic({0, 0});
    expectExtremes(3, 0, 1);
}

TEST_F(GraphDataExtremes, OfNegativeValuesDoNotReachZero) {
    addAutomatic({-3, -8});
    expectExtremes(3, -8, -3);
}

TEST_F(GraphDataExtremes, TakeEverySeriesIn) {
    addAutomatic({2, 7});
    addAutomatic({-4, 1, 3});
    addAutomatic({9});
    expectExtremes(4, -4, 9);
}

TEST_F(GraphDataExtremes, OfPositiveSeriesStayAtZero) {
    addAutomatic({2, 7});
    addAutomatic({4});
    expectExtremes(3, 0, 7);
}

TEST_F(GraphDataExtremes, NeverShrinkAlongX) {
    graph.xDataMax = 50;
    addAutomatic({1, 2});
    EXPECT_EQ(graph.xDataMax, 50);
}

// A value does not change them: an automatic range follows the last added series only.
TEST_F(GraphDataExtremes, FollowOnlyTheLastAddedSeries) {
    addAutomatic({2, 7});
    set(0, 1, 100);
    expectExtremes(3, 0, 7);
    EXPECT_EQ(graph.yMax, 7.0);
    replace(0, {200, -50});
    expectExtremes(3, 0, 7);
    EXPECT_EQ(graph.yMin, 0.0);
    EXPECT_EQ(graph.yMax, 7.0);
    addAutomatic({1});
    expectExtremes(3, -50, 200);
    EXPECT_EQ(graph.yMin, -50.0);
    EXPECT_EQ(graph.yMax, 200.0);
}

TEST_F(GraphDataExtremes, FeedTheAutomaticRanges) {
    addAutomatic({2, 7, 4});
    EXPECT_EQ(graph.xMin, 0.0);
    EXPECT_EQ(graph.xMax, 4.0);
    EXPECT_EQ(graph.yMin, 0.0);
    EXPECT_EQ(graph.yMax, 7.0);
    EXPECT_EQ(graph.xCentre, 2.0) << "scaled again";
    EXPECT_EQ(graph.yCentre, 3.5) << "scaled again";
}

TEST_F(GraphDataExtremes, LeaveFixedRangesAlone) {
    graph.xAutoRange = 0;
    addAutomatic({2, 7, 4});
    EXPECT_EQ(graph.xMax, 10.0);
    EXPECT_EQ(graph.yMax, 7.0);
    graph.xAutoRange = 1;
    graph.yAutoRange = 0;
    addAutomatic({20});
    EXPECT_EQ(graph.xMax, 4.0);
    EXPECT_EQ(graph.yMax, 7.0);
}

TEST_F(GraphDataExtremes, AreBackAtTheirStartWhenAllSeriesAreRemoved) {
    addAutomatic({-2, 7, 4});
    kor::RemoveAllSeries(graph);
    expectExtremes(1, 0, 1);
    EXPECT_EQ(graph.xMax, 4.0) << "ranges stay";
    EXPECT_EQ(graph.yMin, -2.0) << "ranges stay";
    EXPECT_EQ(graph.yMax, 7.0) << "ranges stay";
}

}  // namespace
}  // namespace kortest
