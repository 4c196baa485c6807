// What bars cost that are too thin to be seen one by one.
#include "graph/graph_fixture.h"

namespace kortest {
namespace {

class ManyBars : public GraphTest, public ::testing::WithParamInterface<int> {
protected:
    int calls(const char* function) {
        spy.watch(function);
        spy.clearCalls();
        redraw();
        return spy.count(function);
    }
};

TEST_P(ManyBars, AreDrawnOncePerPixel) {
    createPlain();
    std::vector<double> values(20000);
    for (size_t i = 0; i < values.size(); ++i) values[i] = static_cast<double>(1 + i % 7);
    add(values);
    KorGraph_SetType(graph, GetParam());
    EXPECT_EQ(calls("Polygon"), 0);
    EXPECT_GT(calls("Polyline"), 50);
    EXPECT_LT(calls("Polyline"), 300) << "a plot of 200 by 100 pixels";
}

INSTANTIATE_TEST_SUITE_P(Of, ManyBars, ::testing::Values(KORGRAPH_COLUMN, KORGRAPH_BAR),
                         [](const auto& tested) {
                             return tested.param == KORGRAPH_BAR ? "Bars" : "Columns";
                         });

}  // namespace
}  // namespace kortest
