// Live mode that draws one sample after the other from left to right.
#include "graph/graph_fixture.h"

namespace kortest {
namespace {

constexpr COLORREF kGreen = RGB(0, 255, 0);

// A live chart of one series of three points: x shows 0 to 4, 50 pixels a unit; y shows 0 to 10, 10
// pixels a unit.
class GraphSweep : public GraphTest {
protected:
    void createLive() {
        createPlain();
        send(GM_TOGGLEOPTIONS, 0, KORGRAPH_LIVE);
        add({0, 0, 0});
        KorGraph_SetRange(graph, KORGRAPH_Y, 0, 10);
        redraw();
        settle();
        watchInvalidations();
    }

    // The rectangle that one sample invalidates.
    RECT step(LPARAM sample) {
        invalidations.clear();
        EXPECT_EQ(notify(GN_LIVEUPDATE, sample), 0);
        return onlyInvalidation();
    }
};

TEST_F(GraphSweep, WaitsForTheOption) {
    createRegular();
    watchInvalidations();
    EXPECT_EQ(notify(GN_LIVEUPDATE, 7), 0);
    EXPECT_EQ(invalidations.size(), 0u);
    EXPECT_EQ(tap(35, 105), L"Value:1");
}

TEST_F(GraphSweep, InvalidatesTheStripOfTheNewestStretch) {
    createLive();
    EXPECT_EQ(step(5), (RECT{14, 0, 16, 130})) << "0 to 0";
    EXPECT_EQ(step(5), (RECT{14, 0, 66, 130})) << "0 to 1";
    EXPECT_EQ(step(5), (RECT{64, 0, 116, 130})) << "1 to 2";
    EXPECT_EQ(step(5), (RECT{114, 0, 166, 130})) << "2 to 3";
    EXPECT_EQ(step(5), (RECT{164, 0, 216, 130})) << "3 to 4";
}

TEST_F(GraphSweep, BeginsAgainBehindTheRange) {
    createLive();
    for (int i = 0; i < 5; ++i) step(5);
    EXPECT_EQ(step(5), (RECT{14, 0, 16, 130}));
    EXPECT_EQ(step(5), (RECT{14, 0, 66, 130}));
}

TEST_F(GraphSweep, StoresTheSampleAsTheFirstValue) {
    createLive();
    step(7);
    EXPECT_EQ(tap(65, 45), L"Value:7");
    step(-3);
    EXPECT_EQ(tap(65, 45), L"-");
    KorGraph_SetRange(graph, KORGRAPH_Y, -5, 5);
    EXPECT_EQ(tap(65, 95), L"Value:-3");
}

TEST_F(GraphSweep, DrawsTheStretchOnTheScreenAlone) {
    createLive();
    for (int i = 0; i < 3; ++i) {
        step(5);
        UpdateWindow(graph);
    }
    const Picture before = image();
    spy.watch("BitBlt");
    step(5);  // from (115, 65) to (165, 65)
    UpdateWindow(graph);
    EXPECT_EQ(spy.count("BitBlt"), 0);
    const Picture screen = ReadWindow(graph);
    for (int x = 116; x < 164; ++x) EXPECT_EQ(screen.pixel(x, 65), kGreen) << x;
    EXPECT_TRUE(SamePicture(before, image())) << "the image has no part in it";
}

TEST_F(GraphSweep, DrawsOnlyPointsThatWereWritten) {
    createLive();
    step(5);
    UpdateWindow(graph);
    const RECT part = {30, 0, 200, 130};
    InvalidateRect(graph, &part, FALSE);
    UpdateWindow(graph);
    EXPECT_EQ(ReadWindow(graph).count(kGreen, part), 0);
}

TEST_F(GraphSweep, PaintsBackgroundGridAndXAxisInThePart) {
    createLive();
    send(GM_TOGGLEOPTIONS, 0, KORGRAPH_VERTICALGRID);
    redraw();
    UpdateWindow(graph);
    const Picture whole = ReadWindow(graph);
    KorGraph_SetBackgroundColour(graph, RGB(250, 240, 230));
    const RECT part = {100, 0, 150, 130};
    InvalidateRect(graph, &part, FALSE);
    UpdateWindow(graph);
    const Picture screen = ReadWindow(graph);
    EXPECT_EQ(screen.pixel(130, 40), RGB(250, 240, 230));
    EXPECT_EQ(screen.pixel(115, 40), RGB(0, 150, 150)) << "a grid line";
    EXPECT_EQ(screen.pixel(130, 115), RGB(0, 0, 0)) << "the x axis";
    EXPECT_TRUE(SamePicture(whole.part({0, 0, 100, 130}), screen.part({0, 0, 100, 130})));
    EXPECT_TRUE(SamePicture(whole.part({150, 0, 230, 130}), screen.part({150, 0, 230, 130})));
}

TEST_F(GraphSweep, RectanglesThatTouchASideAreCopied) {
    createLive();
    spy.watch("BitBlt");
    for (const RECT part : {RECT{0, 0, 50, 130}, RECT{180, 0, 230, 130}, RECT{0, 0, 230, 130}}) {
        spy.clearCalls();
        UpdateWindow(graph);
        spy.clearCalls();
        InvalidateRect(graph, &part, FALSE);
        UpdateWindow(graph);
        EXPECT_EQ(spy.count("BitBlt"), 1) << part.left;
    }
}

TEST_F(GraphSweep, WithoutTheOptionEveryRectangleIsCopied) {
    createRegular();
    spy.watch("BitBlt");
    const RECT part = {100, 0, 150, 130};
    InvalidateRect(graph, &part, FALSE);
    UpdateWindow(graph);
    EXPECT_EQ(spy.count("BitBlt"), 1);
}

TEST_F(GraphSweep, WithoutASeriesAddsOneOfThreePoints) {
    createPlain();
    send(GM_TOGGLEOPTIONS, 0, KORGRAPH_LIVE);
    notify(GN_LIVEUPDATE, 7);
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.0, 4.0}));
    EXPECT_EQ(colour(0), kGreen);
    settle();
    watchInvalidations();
    EXPECT_EQ(step(7), (RECT{14, 0, 66, 130}));
}

TEST_F(GraphSweep, WithoutMemoryForASeriesStops) {
    createPlain();
    send(GM_TOGGLEOPTIONS, 0, KORGRAPH_LIVE);
    settle();
    watchInvalidations();
    spy.watch("malloc");
    spy.failAlways("malloc");
    EXPECT_EQ(notify(GN_LIVEUPDATE, 7), 0);
    spy.stopFailing("malloc");
    EXPECT_EQ(invalidationsOf(graph).size(), 0u);
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.0, 1.0}));
}

TEST_F(GraphSweep, SeriesAddedBeforeLiveModeAreSurvived) {
    createRegular();
    send(GM_TOGGLEOPTIONS, 0, KORGRAPH_LIVE);
    for (int i = 0; i < 15; ++i) {
        notify(GN_LIVEUPDATE, i);
        UpdateWindow(graph);
    }
    EXPECT_TRUE(IsWindow(graph));
}

TEST_F(GraphSweep, OtherDataModesStoreNothing) {
    createLive();
    KorGraph_SetDataMode(graph, 2);
    EXPECT_EQ(notify(GN_LIVEUPDATE, 7), 0);
    EXPECT_EQ(tap(65, 45), L"-");
    EXPECT_EQ(tap(65, 115), L"Value:0");
}

class GraphSweepHeap : public GuardedGraphTest {};

TEST_F(GraphSweepHeap, OneValuedSeriesIsSwept) {
    createPlain();
    send(GM_TOGGLEOPTIONS, 0, KORGRAPH_LIVE);
    add({4});
    add({1, 2, 3, 4, 5, 6, 7});
    for (int i = 0; i < 20; ++i) {
        notify(GN_LIVEUPDATE, i);
        const RECT part = {20, 0, 200, 130};
        InvalidateRect(graph, &part, FALSE);
        UpdateWindow(graph);
    }
    EXPECT_EQ(heap->report(), "");
}

}  // namespace
}  // namespace kortest
