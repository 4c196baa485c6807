// The points of lines and areas under the guard heap, by values that tie: the first value of a
// pixel column may be as high as its highest, the last as low as its lowest.
#include "graph/graph_fixture.h"

#include <algorithm>

namespace kortest {
namespace {

class GraphPointsMemory : public GuardedGraphTest {
protected:
    // One after another, redrawn as a line and as an area.
    void draw(const std::vector<double>& values, double xMin, double xMax) {
        send(WM_NOTIFY, GN_CLEAR);
        KorGraph_SetRange(graph, KORGRAPH_X, xMin, xMax);
        ASSERT_EQ(add(values), 0);
        for (const int type : {KORGRAPH_LINE, KORGRAPH_AREA}) {
            KorGraph_SetType(graph, type);
            redraw();
        }
        ASSERT_EQ(heap->report(), "") << values.size() << " values, " << xMin << " to " << xMax;
    }
};

TEST_F(GraphPointsMemory, OfFourThatShareAColumn) {
    createPlain();
    for (const auto& values : std::vector<std::vector<double>>{
             {5, 1, 5, 2}, {5, 1, 5}, {1, 5, 1, 5}, {1, 5, 1, 5, 1}, {3, 3, 3, 3}, {2, 5, 1, 2}}) {
        draw(values, 0, 100000);
    }
}

TEST_F(GraphPointsMemory, OfThreeToAColumn) {
    create(400, 60);
    std::vector<double> values(450);
    for (size_t i = 0; i < values.size(); ++i) values[i] = i % 3 == 1 ? 1 : 5;
    for (int plot = 310; plot < 400; ++plot) draw(values, -1.5 * plot, 1.5 * plot);
}

// However many values: what a plot's columns can hold.
TEST_F(GraphPointsMemory, FollowsThePlotsWidth) {
    createPlain();
    std::vector<double> values(100000);
    for (size_t i = 0; i < values.size(); ++i) values[i] = static_cast<double>(i % 7);
    ASSERT_EQ(add(values), 0);
    spy.watch("LocalAlloc");
    for (const int type : {KORGRAPH_LINE, KORGRAPH_AREA}) {
        KorGraph_SetType(graph, type);
        spy.clearCalls();
        redraw();
        ULONG_PTR largest = 0;
        for (const ImportCall& call : spy.callsOf("LocalAlloc")) {
            largest = std::max(largest, call.arguments[1]);
        }
        EXPECT_GT(largest, 0u);
        EXPECT_LT(largest, 10000u);  // four corners of 8 bytes for each of 200 columns, and some
    }
}

}  // namespace
}  // namespace kortest
