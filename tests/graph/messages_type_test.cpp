// Changing the chart type.
#include "graph/graph_fixture.h"

namespace kortest {
namespace {

class GraphType : public GraphTest {
protected:
    GraphType() {
        create();
        KorGraph_SetRange(graph, KORGRAPH_X, 2, 20);
        KorGraph_SetRange(graph, KORGRAPH_Y, -5, 55);
        KorGraph_SetXTitle(graph, L"across");
        KorGraph_SetYTitle(graph, L"up");
    }

    void type(LONG number) { KorGraph_SetType(graph, number); }

    void expectKept() {
        EXPECT_EQ(range(KORGRAPH_X), (std::pair{2.0, 20.0}));
        EXPECT_EQ(range(KORGRAPH_Y), (std::pair{-5.0, 55.0}));
        EXPECT_STREQ(title(GM_GETXTITLE), L"across");
        EXPECT_STREQ(title(GM_GETYTITLE), L"up");
    }

    void expectTraded() {
        EXPECT_EQ(range(KORGRAPH_X), (std::pair{-5.0, 55.0}));
        EXPECT_EQ(range(KORGRAPH_Y), (std::pair{2.0, 20.0}));
        EXPECT_STREQ(title(GM_GETXTITLE), L"up");
        EXPECT_STREQ(title(GM_GETYTITLE), L"across");
    }
};

TEST_F(GraphType, IsRead) {
    for (LONG number = 0; number <= 4; ++number) {
        type(number);
        EXPECT_EQ(KorGraph_GetType(graph), number);
    }
}

TEST_F(GraphType, FromLineToColumnKeepsTheAxes) {
    type(KORGRAPH_COLUMN);
    expectKept();
}

TEST_F(GraphType, FromLineToBarTradesTheAxes) {
    type(KORGRAPH_BAR);
    expectTraded();
}

TEST_F(GraphType, FromBarToBarKeepsTheAxes) {
    type(KORGRAPH_BAR);
    type(KORGRAPH_BAR);
    expectTraded();
}

TEST_F(GraphType, FromBarToAnyOtherTradesBack) {
    for (const LONG other : {KORGRAPH_LINE, KORGRAPH_AREA, KORGRAPH_COLUMN, KORGRAPH_PIE, 7}) {
        type(KORGRAPH_BAR);
        expectTraded();
        type(other);
        expectKept();
    }
}

TEST_F(GraphType, TradingDoesNotTouchWhetherARangeIsAutomatic) {
    KorGraph_AutoRange(graph, KORGRAPH_X);
    type(KORGRAPH_BAR);
    add({3, 4});
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.0, 4.0})) << "x is automatic still";
    EXPECT_EQ(range(KORGRAPH_Y), (std::pair{0.0, 1.0})) << "y is fixed still";
}

TEST_F(GraphType, UnknownNumberIsStoredAndDrawsNothing) {
    add({5, 6});
    redraw();
    const Picture before = image();
    for (const LONG number : {5, 7, -1, 0x7FFFFFFF}) {
        type(number);
        EXPECT_EQ(KorGraph_GetType(graph), number);
        EXPECT_TRUE(SamePicture(before, image()));
    }
    redraw();
    EXPECT_TRUE(SamePicture(before, image()));
    expectKept();
}

TEST_F(GraphType, DrawsTheNewTypeAndShowsItWithTheNextPaint) {
    add({5, 6});
    settle();
    for (const LONG number : {KORGRAPH_PIE, KORGRAPH_COLUMN, KORGRAPH_BAR, KORGRAPH_LINE}) {
        const Picture before = image();
        type(number);
        EXPECT_FALSE(before == image()) << number;
        UpdateWindow(graph);
        EXPECT_TRUE(SamePicture(image(), ReadWindow(graph))) << number;
    }
}

TEST_F(GraphType, SameTypeDrawsToo) {
    PatBlt(imageDC, 0, 0, 230, 130, BLACKNESS);
    type(KORGRAPH_LINE);
    EXPECT_EQ(image().pixel(1, 128), RGB(255, 255, 255));
}

// The exchanged axes are laid out and scaled before they are drawn.
TEST_F(GraphType, TradedAxesAreScaled) {
    destroy();
    settle();
    createPlain();
    KorGraph_SetRange(graph, KORGRAPH_X, 0, 10);
    KorGraph_SetRange(graph, KORGRAPH_Y, 0, 100);
    add({50});
    type(KORGRAPH_BAR);  // x 0 to 100: 2 pixels a unit, y 0 to 10: 10 pixels a unit
    EXPECT_EQ(tap(100, 105), L"Value:50");
    EXPECT_EQ(tap(115, 105), L"Value:50");
    EXPECT_EQ(tap(116, 105), L"-");
}

TEST_F(GraphType, ChangeUpdatesTheLegendAtOnce) {
    add({5}, L"one");
    const HWND legend = showLegend({10, 10, 100, 100});
    host.pump();
    const Picture before = ReadWindow(legend);
    type(KORGRAPH_PIE);
    EXPECT_FALSE(before == ReadWindow(legend)) << "painted already";
}

}  // namespace
}  // namespace kortest
