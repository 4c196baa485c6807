// Live mode that replaces a series' values at each update.
#include "graph/graph_fixture.h"

namespace kortest {
namespace {

// x shows 0 to 4, 50 pixels a unit; y shows 0 to 10, 10 pixels a unit.
class GraphLiveReplace : public GraphTest {
protected:
    void createLive() {
        createPlain();
        send(GM_TOGGLEOPTIONS, 0, KORGRAPH_LIVE);
        add({0, 0, 0});
        KorGraph_SetRange(graph, KORGRAPH_Y, 0, 10);
        KorGraph_SetDataMode(graph, KORGRAPH_REPLACE);
        redraw();
        settle();
        watchInvalidations();
    }

    RECT update(LONG series, const std::vector<double>& values) {
        invalidations.clear();
        const GraphSeriesData data = {static_cast<LONG>(values.size()), nullptr, values.data(),
                                      series};
        EXPECT_EQ(notify(GN_LIVEUPDATE, reinterpret_cast<LPARAM>(&data)), 0);
        return onlyInvalidation();
    }
};

// The first update covers the whole chart from the first point on; later ones what was and is.
TEST_F(GraphLiveReplace, InvalidatesTheOldAndTheNewTrace) {
    createLive();
    EXPECT_EQ(update(0, {2, 4, 3}), (RECT{64, 0, 230, 130}));
    // rows 95, 75 and 85, up to column 165, are remembered
    EXPECT_EQ(update(0, {5, 5, 6}), (RECT{64, 55, 165, 95}));
    EXPECT_EQ(update(0, {1, 1, 1}), (RECT{64, 55, 165, 105}));
    EXPECT_EQ(update(0, {1, 1, 1}), (RECT{64, 105, 165, 105}));
}

TEST_F(GraphLiveReplace, StoresTheValues) {
    createLive();
    update(0, {2, 4, 3});
    EXPECT_EQ(tap(65, 95), L"Value:2");
    EXPECT_EQ(tap(115, 75), L"Value:4");
    EXPECT_EQ(tap(165, 85), L"Value:3");
}

TEST_F(GraphLiveReplace, MissingValuesAreZero) {
    createLive();
    update(0, {2});
    EXPECT_EQ(tap(115, 115), L"Value:0");
}

TEST_F(GraphLiveReplace, DrawsTheTrace) {
    createLive();
    update(0, {5, 5, 5});
    UpdateWindow(graph);
    update(0, {5, 5, 5});
    const RECT part = {64, 0, 200, 130};
    InvalidateRect(graph, &part, FALSE);
    spy.watch("BitBlt");
    spy.clearCalls();
    UpdateWindow(graph);
    EXPECT_EQ(spy.count("BitBlt"), 0);
    const Picture screen = ReadWindow(graph);
    for (int x = 66; x < 164; ++x) EXPECT_EQ(screen.pixel(x, 65), RGB(0, 255, 0)) << x;
}

TEST_F(GraphLiveReplace, BadSeriesKeepsTheValues) {
    createLive();
    update(0, {2, 4, 3});
    for (const LONG series : {1L, -1L, 1000L}) {
        update(series, {9, 9, 9});
        EXPECT_EQ(tap(115, 75), L"Value:4");
    }
}

TEST_F(GraphLiveReplace, WaitsForTheOption) {
    createRegular();
    KorGraph_SetDataMode(graph, KORGRAPH_REPLACE);
    watchInvalidations();
    const double values[] = {9, 9};
    const GraphSeriesData data = {2, nullptr, values, 0};
    EXPECT_EQ(notify(GN_LIVEUPDATE, reinterpret_cast<LPARAM>(&data)), 0);
    EXPECT_EQ(invalidations.size(), 0u);
    EXPECT_EQ(tap(35, 105), L"Value:1");
}

TEST_F(GraphLiveReplace, SeriesAddedBeforeLiveModeHaveNoTrace) {
    createRegular();
    send(GM_TOGGLEOPTIONS, 0, KORGRAPH_LIVE);
    KorGraph_SetDataMode(graph, KORGRAPH_REPLACE);
    settle();
    const double values[] = {9, 9};
    const GraphSeriesData data = {2, nullptr, values, 0};
    for (int i = 0; i < 3; ++i) {
        notify(GN_LIVEUPDATE, reinterpret_cast<LPARAM>(&data));
        UpdateWindow(graph);
    }
    EXPECT_EQ(tap(35, 25), L"Value:9");
}

}  // namespace
}  // namespace kortest
