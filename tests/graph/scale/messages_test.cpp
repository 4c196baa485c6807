// Ranges by messages.
#include "graph/graph_fixture.h"

namespace kortest {
namespace {

class GraphRangeMessages : public GraphTest {};

TEST_F(GraphRangeMessages, AreReadAsTheyWereSet) {
    create();
    KorGraph_SetRange(graph, KORGRAPH_X, 2, 20);
    KorGraph_SetRange(graph, KORGRAPH_Y, -5, 55);
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{2.0, 20.0}));
    EXPECT_EQ(range(KORGRAPH_Y), (std::pair{-5.0, 55.0}));
}

TEST_F(GraphRangeMessages, AnyOtherAxisReadsY) {
    create();
    KorGraph_SetRange(graph, KORGRAPH_Y, -5, 55);
    for (const LONG axis : {2L, -1L, 1000L}) EXPECT_EQ(range(axis), (std::pair{-5.0, 55.0}));
}

TEST_F(GraphRangeMessages, ReadingLeavesTheAxisAsItWas) {
    create();
    GraphRange read = {7, 99, 0, 0};
    send(GM_GETRANGE, 0, reinterpret_cast<LPARAM>(&read));
    EXPECT_EQ(read.axis, 7);
    EXPECT_EQ(read.reserved, 99);
}

TEST_F(GraphRangeMessages, EqualEndsShowOneUnit) {
    create();
    KorGraph_SetRange(graph, KORGRAPH_X, 3, 3);
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{3.0, 4.0}));
}

TEST_F(GraphRangeMessages, OfAxis2ChangesNothing) {
    create();
    KorGraph_SetRange(graph, 2, 3, 8);
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.0, 1.0}));
    EXPECT_EQ(range(KORGRAPH_Y), (std::pair{0.0, 1.0}));
}

TEST_F(GraphRangeMessages, FixedStaysFixedUntilItIsAutomaticAgain) {
    create();
    KorGraph_SetRange(graph, KORGRAPH_X, 2, 20);
    add({1, 2, 3});
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{2.0, 20.0}));
    EXPECT_EQ(range(KORGRAPH_Y), (std::pair{0.0, 3.0}));
    KorGraph_AutoRange(graph, KORGRAPH_X);
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.0, 4.0}));
    add({1, 2, 3, 4});
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.0, 5.0}));
}

TEST_F(GraphRangeMessages, DoNotFollowTheZoom) {
    create();
    KorGraph_SetRange(graph, KORGRAPH_X, 2, 20);
    KorGraph_SetZoom(graph, KORGRAPH_ZOOM200);
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{2.0, 20.0}));
}

// The category axis of bars looks at every second series, and only grows.
TEST_F(GraphRangeMessages, OfBarCategoriesStrideByTwo) {
    create();
    KorGraph_SetType(graph, KORGRAPH_BAR);
    KorGraph_SetRange(graph, KORGRAPH_Y, 0, 5);
    KorGraph_AutoRange(graph, KORGRAPH_Y);
    add(std::vector<double>(3, 1.0));
    add(std::vector<double>(30, 1.0));
    KorGraph_SetType(graph, KORGRAPH_LINE);
    KorGraph_SetRange(graph, KORGRAPH_X, 0, 2);  // becomes y of the bars
    KorGraph_SetType(graph, KORGRAPH_BAR);
    EXPECT_EQ(range(KORGRAPH_Y), (std::pair{0.0, 2.0}));
    KorGraph_SetRange(graph, KORGRAPH_Y, 100, 200);
    EXPECT_EQ(range(KORGRAPH_Y), (std::pair{0.0, 4.0})) << "the series of 30 is passed over";
    add(std::vector<double>(9, 1.0));
    KorGraph_SetRange(graph, KORGRAPH_Y, 100, 200);
    EXPECT_EQ(range(KORGRAPH_Y).second, 31.0) << "automatic, and it only grows";
}

TEST_F(GraphRangeMessages, OfBarsTakeTheValuesAlongX) {
    create();
    KorGraph_SetType(graph, KORGRAPH_BAR);
    add({-4, 40, 7});
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{-4.0, 40.0}));
    EXPECT_EQ(range(KORGRAPH_Y), (std::pair{0.0, 4.0}));
}

// The point at x 4 moves with the range: 0 to 10 puts it in column 95, 0 to 8 in 115.
TEST_F(GraphRangeMessages, MovePointsAtOnceThoughNothingIsDrawn) {
    createRegular();
    const Picture before = image();
    KorGraph_SetRange(graph, KORGRAPH_X, 0, 8);
    EXPECT_EQ(tap(95, 75), L"-");
    EXPECT_EQ(tap(115, 75), L"Value:4");
    EXPECT_TRUE(SamePicture(before, image()));
}

}  // namespace
}  // namespace kortest
