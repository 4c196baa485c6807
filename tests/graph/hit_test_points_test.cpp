// Which point lies under a pixel: lines, areas, columns and bars.
#include "graph/number_graph.h"

#include <limits>

namespace kortest {
namespace {

// Point 0 of every series stands at x 1, in column 35.
class GraphLineHit : public NumberGraph, public ::testing::WithParamInterface<int> {
protected:
    GraphLineHit() { graph.chartType = GetParam(); }
};

TEST_P(GraphLineHit, ReachesThreePixelsEachWay) {
    add({5});
    for (int dx = -5; dx <= 5; ++dx)
        for (int dy = -5; dy <= 5; ++dy) {
            const bool within = dx >= -3 && dx <= 3 && dy >= -3 && dy <= 3;
            EXPECT_EQ(hit(35 + dx, 65 + dy), within ? L"Value:5" : L"-") << dx << ", " << dy;
        }
}

TEST_P(GraphLineHit, FindsEveryPoint) {
    add({1, 2.5, -3});
    EXPECT_EQ(hit(35, 105), L"Value:1");
    EXPECT_EQ(hit(55, 90), L"Value:2.5");
    EXPECT_EQ(hit(75, 145), L"Value:-3");
    EXPECT_EQ(hit(95, 115), L"-") << "there is no fourth point";
    EXPECT_EQ(hit(15, 115), L"-") << "nor one at 0";
}

TEST_P(GraphLineHit, SeriesAddedFirstWins) {
    add({5});
    add({5.01});
    EXPECT_EQ(hit(35, 65), L"Value:5");
}

TEST_P(GraphLineHit, FirstPointWinsWhereTwoAreClose) {
    showX(0, 100);  // 2 pixels a unit
    add({5, 5.01});
    EXPECT_EQ(hit(18, 65), L"Value:5");
    EXPECT_EQ(hit(22, 65), L"Value:5.01");
}

TEST_P(GraphLineHit, FollowsZoomAndPan) {
    add({5, 6});
    kor::SetZoomFactor(graph, 2.0);
    graph.xCentre = 2;
    EXPECT_EQ(hit(115, 45), L"Value:6");
    EXPECT_EQ(hit(75, 65), L"Value:5");
    EXPECT_EQ(hit(35, 65), L"-");
}

TEST_P(GraphLineHit, NumbersAreWrittenWithFiveDigits) {
    add({5.123456, 123456789});
    EXPECT_EQ(hit(35, kor::yPixel(graph, 5.123456)), L"Value:5.1235");
    showY(0, 200000000);
    EXPECT_EQ(hit(55, kor::yPixel(graph, 123456789)), L"Value:1.2346E+08");
}

TEST_P(GraphLineHit, NoSeriesGivesNoHit) { EXPECT_EQ(hit(35, 65), L"-"); }

TEST_P(GraphLineHit, NumbersThatAreNoneAreSurvived) {
    const double infinity = std::numeric_limits<double>::infinity();
    add({infinity, -infinity, std::numeric_limits<double>::quiet_NaN(), 5});
    hit(35, 65);
    EXPECT_EQ(hit(95, 65), L"Value:5");
}

INSTANTIATE_TEST_SUITE_P(Types, GraphLineHit, ::testing::Values(kor::kLine, kor::kArea));

// ---- Columns ----------------------------------------------------------------------------------

class GraphColumnHit : public NumberGraph {
protected:
    GraphColumnHit() { graph.chartType = kor::kColumn; }

    // Columns hit from left to right in a row of pixels, as "from-to".
    std::string span(int y, const std::wstring& text) const {
        int from = -1, to = -1;
        for (int x = 0; x < 230; ++x)
            if (hit(x, y) == text) {
                if (from < 0) from = x;
                to = x;
            }
        return std::to_string(from) + "-" + std::to_string(to);
    }
};

TEST_F(GraphColumnHit, OfOneSeriesIsCentred) {
    add({4});
    ASSERT_EQ(graph.barWidth, 20);
    EXPECT_EQ(span(100, L"Value:4"), "25-45");
}

TEST_F(GraphColumnHit, ReachesFromTheValueToZero) {
    add({4});
    EXPECT_EQ(hit(35, 74), L"-");
    EXPECT_EQ(hit(35, 75), L"Value:4");
    EXPECT_EQ(hit(35, 115), L"Value:4");
    EXPECT_EQ(hit(35, 116), L"-");
}

TEST_F(GraphColumnHit, OfANegativeValueHangsDown) {
    showY(-5, 5);
    add({-2});
    EXPECT_EQ(hit(35, 64), L"-");
    EXPECT_EQ(hit(35, 65), L"Value:-2");
    EXPECT_EQ(hit(35, 85), L"Value:-2");
    EXPECT_EQ(hit(35, 86), L"-");
}

TEST_F(GraphColumnHit, OfZeroIsOneRow) {
    showY(-5, 5);
    add({0});
    EXPECT_EQ(hit(35, 64), L"-");
    EXPECT_EQ(hit(35, 65), L"Value:0");
    EXPECT_EQ(hit(35, 66), L"-");
}

TEST_F(GraphColumnHit, OfTwoSeriesStandSideBySideAndTheFirstWins) {
    add({4});
    add({6});
    ASSERT_EQ(graph.barWidth, 10);
    EXPECT_EQ(span(100, L"Value:4"), "25-35");
    EXPECT_EQ(span(100, L"Value:6"), "36-45");
    EXPECT_EQ(span(60, L"Value:6"), "35-45") << "above the first series";
}

TEST_F(GraphColumnHit, OfThreeSeriesAreCentredRoundingTowardZero) {
    for (const double value : {4, 5, 6}) add({value});
    graph.barWidth = 5;
    EXPECT_EQ(span(100, L"Value:4"), "28-33");
    EXPECT_EQ(span(100, L"Value:5"), "34-38");
    EXPECT_EQ(span(100, L"Value:6"), "39-43");
}

TEST_F(GraphColumnHit, NarrowsWhenZoomedOut) {
    add({4});
    kor::SetZoomFactor(graph, 0.5);
    const int x = kor::xPixel(graph, 1);
    EXPECT_EQ(span(kor::yPixel(graph, 2), L"Value:4"),
              std::to_string(x - 5) + "-" + std::to_string(x + 5));
}

TEST_F(GraphColumnHit, DoesNotWidenWhenZoomedIn) {
    add({4, 4, 4, 4, 4, 4});
    kor::SetZoomFactor(graph, 2.0);
    graph.xCentre = 4;  // column 115
    for (int x = 105; x <= 125; ++x) EXPECT_EQ(hit(x, 100), L"Value:4") << x;
    EXPECT_EQ(hit(104, 100), L"-");
    EXPECT_EQ(hit(126, 100), L"-");
}

TEST_F(GraphColumnHit, FindsEveryPoint) {
    add({4, 0.5, 3});
    EXPECT_EQ(hit(55, 112), L"Value:0.5");
    EXPECT_EQ(hit(75, 100), L"Value:3");
    EXPECT_EQ(hit(95, 112), L"-");
}

// ---- Bars -------------------------------------------------------------------------------------

// Point 0 stands at y 1, in row 105; zero in column 15.
class GraphBarHit : public NumberGraph {
protected:
    GraphBarHit() { graph.chartType = kor::kBar; }

    std::string span(int x, const std::wstring& text) const {
        int from = -1, to = -1;
        for (int y = 0; y < 130; ++y)
            if (hit(x, y) == text) {
                if (from < 0) from = y;
                to = y;
            }
        return std::to_string(from) + "-" + std::to_string(to);
    }
};

TEST_F(GraphBarHit, OfOneSeriesIsCentred) {
    add({4});
    ASSERT_EQ(graph.barHeight, 10);
    EXPECT_EQ(span(50, L"Value:4"), "100-110");
}

TEST_F(GraphBarHit, ReachesFromZeroToTheValue) {
    add({4});
    EXPECT_EQ(hit(14, 105), L"-");
    EXPECT_EQ(hit(15, 105), L"Value:4");
    EXPECT_EQ(hit(95, 105), L"Value:4");
    EXPECT_EQ(hit(96, 105), L"-");
}

TEST_F(GraphBarHit, OfANegativeValueReachesLeft) {
    showX(-5, 5);
    add({-2});
    EXPECT_EQ(hit(74, 105), L"-");
    EXPECT_EQ(hit(75, 105), L"Value:-2");
    EXPECT_EQ(hit(115, 105), L"Value:-2");
    EXPECT_EQ(hit(116, 105), L"-");
}

TEST_F(GraphBarHit, OfZeroIsOneColumn) {
    showX(-5, 5);
    add({0});
    EXPECT_EQ(hit(114, 105), L"-");
    EXPECT_EQ(hit(115, 105), L"Value:0");
    EXPECT_EQ(hit(116, 105), L"-");
}

TEST_F(GraphBarHit, OfLaterSeriesStandHigher) {
    add({4});
    add({6});
    ASSERT_EQ(graph.barHeight, 5);
    EXPECT_EQ(span(50, L"Value:4"), "105-110");
    EXPECT_EQ(span(50, L"Value:6"), "100-104");
    EXPECT_EQ(span(120, L"Value:6"), "100-105") << "right of the first series";
}

TEST_F(GraphBarHit, OfThreeSeriesAreCentredRoundingTowardZero) {
    for (const double value : {4, 5, 6}) add({value});
    graph.barHeight = 5;  // the first offset is -7
    EXPECT_EQ(span(50, L"Value:4"), "107-112");
    EXPECT_EQ(span(50, L"Value:5"), "102-106");
    EXPECT_EQ(span(50, L"Value:6"), "97-101");
}

TEST_F(GraphBarHit, NarrowsWhenZoomedOut) {
    add({4});
    kor::SetZoomFactor(graph, 0.5);
    const int y = kor::yPixel(graph, 1);
    EXPECT_EQ(span(kor::xPixel(graph, 2), L"Value:4"),
              std::to_string(y - 3) + "-" + std::to_string(y + 2))
        << "five pixels, of which half rounds to two";
}

TEST_F(GraphBarHit, FindsEveryPoint) {
    add({4, 0.5, 3});
    EXPECT_EQ(hit(20, 95), L"Value:0.5");
    EXPECT_EQ(hit(50, 85), L"Value:3");
    EXPECT_EQ(hit(20, 70), L"-");
}

TEST_F(GraphBarHit, OtherTypesHaveNoHits) {
    add({5});
    for (const int type : {5, -1, 1000}) {
        graph.chartType = type;
        EXPECT_EQ(hit(35, 65), L"-") << type;
    }
}

}  // namespace
}  // namespace kortest
