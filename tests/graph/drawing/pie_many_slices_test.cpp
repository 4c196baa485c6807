// What a pie's drawing costs does not grow with slices that are too thin to be seen.
#include "graph/graph_fixture.h"

namespace kortest {
namespace {

class ManySlices : public GraphTest {
protected:
    // Calls that one redraw of so many equal slices takes.
    int calls(const char* function, int slices) {
        notify(GN_CLEAR);
        add(std::vector<double>(static_cast<size_t>(slices), 1.0));
        spy.clearCalls();
        redraw();
        return spy.count(function);
    }

    void start(const char* function) {
        create();
        KorGraph_SetType(graph, KORGRAPH_PIE);
        spy.watch(function);
    }
};

TEST_F(ManySlices, MakeOnePenForEachColour) {
    start("CreatePen");
    EXPECT_EQ(calls("CreatePen", 3), 3);
    EXPECT_EQ(calls("CreatePen", 15), 15);
    EXPECT_EQ(calls("CreatePen", 400), 15);
}

// Lines and runs: no more than the disc has pixels, and its rim.
TEST_F(ManySlices, DrawNoMoreThanTheDiscHas) {
    start("Polyline");
    const int thin = calls("Polyline", 20000);
    EXPECT_LE(calls("Polyline", 60000), thin * 11 / 10);
}

TEST_F(ManySlices, WriteNoLabelTwiceOnOnePlace) {
    start("ExtTextOutW");
    const int thin = calls("ExtTextOutW", 20000);
    EXPECT_GT(thin, 100);
    EXPECT_LE(calls("ExtTextOutW", 60000), thin * 11 / 10);
}

TEST_F(ManySlices, ListOnlyThoseInTheLegendsView) {
    start("Rectangle");
    add(std::vector<double>(100000, 1.0));
    const HWND legend = showLegend({10, 10, 110, 100});
    UpdateWindow(legend);
    spy.clearCalls();
    SendMessageW(legend, WM_VSCROLL, SB_LINEDOWN, 0);
    EXPECT_GE(spy.count("Rectangle"), 3);
    EXPECT_LE(spy.count("Rectangle"), 10);
}

}  // namespace
}  // namespace kortest
