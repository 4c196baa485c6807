// Fixed and automatic ranges.
#include "graph/number_graph.h"

#include <limits>

namespace kortest {
namespace {

class GraphRanges : public NumberGraph {
protected:
    GraphRanges() {
        graph.xDataMin = -1;
        graph.xDataMax = 21;
        graph.yDataMin = -2;
        graph.yDataMax = 42;
    }

    void expectX(double low, double high) {
        EXPECT_EQ(graph.xMin, low);
        EXPECT_EQ(graph.xMax, high);
        EXPECT_DOUBLE_EQ(graph.xCentre, low + (high - low) / 2) << "scaled again";
    }

    void expectY(double low, double high) {
        EXPECT_EQ(graph.yMin, low);
        EXPECT_EQ(graph.yMax, high);
        EXPECT_DOUBLE_EQ(graph.yCentre, low + (high - low) / 2) << "scaled again";
    }
};

TEST_F(GraphRanges, FixedXIsShown) {
    kor::SetRange(graph, 0, 2, 8);
    expectX(2, 8);
    EXPECT_EQ(graph.xAutoRange, 0);
    expectY(0, 10);
    EXPECT_EQ(graph.yAutoRange, 1);
}

TEST_F(GraphRanges, FixedYIsShown) {
    kor::SetRange(graph, 1, -5, 55);
    expectY(-5, 55);
    EXPECT_EQ(graph.yAutoRange, 0);
    expectX(0, 10);
    EXPECT_EQ(graph.xAutoRange, 1);
}

TEST_F(GraphRanges, EqualEndsShowOneUnit) {
    kor::SetRange(graph, 0, 3, 3);
    expectX(3, 4);
    kor::SetRange(graph, 1, -3, -3);
    expectY(-3, -2);
}

TEST_F(GraphRanges, ExchangedEndsAreKept) {
    kor::SetRange(graph, 0, 8, 2);
    expectX(8, 2);
    kor::SetRange(graph, 1, 8, 2);
    expectY(8, 2);
}

TEST_F(GraphRanges, OtherAxesChangeNothing) {
    for (const int axis : {2, -1, 100}) {
        kor::SetRange(graph, axis, 3, 4);
        kor::AutoRange(graph, axis);
    }
    expectX(0, 10);
    expectY(0, 10);
    EXPECT_EQ(graph.xAutoRange, 1);
    EXPECT_EQ(graph.yAutoRange, 1);
}

TEST_F(GraphRanges, AutomaticOnesFollowTheData) {
    for (const int type : {kor::kLine, kor::kArea, kor::kColumn, kor::kPie}) {
        graph.chartType = type;
        kor::SetRange(graph, 0, 2, 8);
        kor::SetRange(graph, 1, 2, 8);
        kor::AutoRange(graph, 0);
        expectX(-1, 21);
        EXPECT_EQ(graph.xAutoRange, 1);
        expectY(2, 8);
        EXPECT_EQ(graph.yAutoRange, 0);
        kor::AutoRange(graph, 1);
        expectY(-2, 42);
        EXPECT_EQ(graph.yAutoRange, 1);
    }
}

TEST_F(GraphRanges, OfBarsTakeValuesAlongX) {
    graph.chartType = kor::kBar;
    kor::AutoRange(graph, 0);
    expectX(-2, 42);
    expectY(0, 10);
    kor::AutoRange(graph, 1);
    expectY(-1, 21);
}

TEST_F(GraphRanges, OfBarsAreFixedAlongX) {
    graph.chartType = kor::kBar;
    kor::SetRange(graph, 0, 2, 8);
    expectX(2, 8);
    EXPECT_EQ(graph.xAutoRange, 0);
    kor::SetRange(graph, 0, 2, 2);
    expectX(2, 3);
}

class GraphBarCategoryRange : public GraphRanges {
protected:
    GraphBarCategoryRange() { graph.chartType = kor::kBar; }

    void addOfCounts(const std::vector<size_t>& counts) {
        for (const size_t count : counts) add(std::vector<double>(count, 1.0));
        graph.yAutoRange = 0;
    }
};

TEST_F(GraphBarCategoryRange, IgnoresTheEndsAndFollowsThePoints) {
    addOfCounts({14});
    kor::SetRange(graph, 1, 100, 200);
    expectY(0, 15);
    EXPECT_EQ(graph.yAutoRange, 1);
}

TEST_F(GraphBarCategoryRange, LooksAtEverySecondSeriesOnly) {
    addOfCounts({12, 40, 17, 50});
    kor::SetRange(graph, 1, 0, 5);
    expectY(0, 18);
}

TEST_F(GraphBarCategoryRange, LooksAtTheLastOfAnOddNumber) {
    addOfCounts({12, 13, 14, 15, 30});
    kor::SetRange(graph, 1, 0, 5);
    expectY(0, 31);
}

TEST_F(GraphBarCategoryRange, OnlyGrows) {
    addOfCounts({4, 40});
    kor::SetRange(graph, 1, 0, 5);
    expectY(0, 10);
    EXPECT_EQ(graph.yAutoRange, 1);
}

TEST_F(GraphBarCategoryRange, OfNoSeriesIsSurvived) {
    kor::SetRange(graph, 1, 3, 5);
    expectY(0, 10);
}

TEST_F(GraphRanges, NumbersThatAreNoneAreKeptAsGiven) {
    const double infinity = std::numeric_limits<double>::infinity();
    kor::SetRange(graph, 0, -infinity, infinity);
    EXPECT_EQ(graph.xMin, -infinity);
    EXPECT_EQ(graph.xMax, infinity);
    kor::SetRange(graph, 1, std::numeric_limits<double>::quiet_NaN(), 4);
    EXPECT_NE(graph.yMin, graph.yMin);
    EXPECT_EQ(graph.yMax, 4);
}

}  // namespace
}  // namespace kortest
