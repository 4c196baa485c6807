// The legend's window: when it is made, where it stands, how high it is.
#include "graph/graph_fixture.h"

namespace kortest {
namespace {

class LegendWindow : public GraphTest {
protected:
    // Height of one line of the legend: a capital M in a window's own font, and 5 pixels.
    static int pitchOf(HWND legend) {
        const HDC dc = GetDC(legend);
        RECT measured{};
        DrawTextW(dc, L"M", 1, &measured, DT_CALCRECT);
        ReleaseDC(legend, dc);
        return measured.bottom + 5;
    }

    // The client height that a legend of this height has before it is rounded up to lines.
    static int clientHeightOf(HWND legend, int height) {
        RECT frame{};
        AdjustWindowRectEx(&frame, static_cast<DWORD>(GetWindowLongW(legend, GWL_STYLE)), FALSE, 0);
        return height - static_cast<int>(frame.bottom - frame.top);
    }
};

TEST_F(LegendWindow, IsAChildWithItsClassTitleStyleAndId) {
    create();
    const HWND legend = showLegend({30, 20, 130, 90});
    ASSERT_NE(legend, nullptr);
    EXPECT_EQ(GetParent(legend), graph);
    wchar_t name[64]{};
    GetClassNameW(legend, name, 64);
    EXPECT_STREQ(name, L"KORVANE Corporation LegendControl");
    EXPECT_EQ(TextOf(legend), L"Legend");
    EXPECT_TRUE(IsWindowVisible(legend));
    const DWORD style = static_cast<DWORD>(GetWindowLongW(legend, GWL_STYLE));
    EXPECT_EQ(style & ~WS_CLIPSIBLINGS, DWORD{WS_CHILD | WS_CAPTION | WS_VSCROLL | WS_VISIBLE});
}

TEST_F(LegendWindow, StandsAtTheRectanglesPlaceWithItsWidth) {
    create();
    const RECT place = PlaceIn(graph, showLegend({30, 20, 130, 90}));
    EXPECT_EQ(place.left, 30);
    EXPECT_EQ(place.top, 20);
    EXPECT_EQ(place.right, 130);
}

TEST_F(LegendWindow, IsRoundedUpToWholeLines) {
    create(230, 220);
    for (const int height : {60, 61, 75, 90, 100}) {
        const HWND legend = showLegend({10, 5, 130, 5 + height});
        const int pitch = pitchOf(legend);
        const int client = clientHeightOf(legend, height);
        const int lines = (client + pitch - 1) / pitch;
        // The window ends where the lines do, so its bottom frame covers some of the last one.
        POINT corner = {0, lines * pitch + 2};
        ClientToScreen(legend, &corner);
        ScreenToClient(graph, &corner);
        EXPECT_EQ(PlaceIn(graph, legend).bottom, corner.y) << height;
        destroy();
        spy.clearCalls();
        create(230, 220);
    }
}

TEST_F(LegendWindow, IsMadeOnce) {
    create();
    const HWND legend = showLegend({30, 20, 130, 90});
    const RECT place = PlaceIn(graph, legend);
    spy.watch("CreateWindowExW");
    EXPECT_EQ(showLegend({5, 5, 80, 60}), legend);
    EXPECT_EQ(spy.count("CreateWindowExW"), 0);
    EXPECT_EQ(PlaceIn(graph, legend), place);
}

TEST_F(LegendWindow, GoesWithTheChart) {
    create();
    const HWND legend = showLegend({30, 20, 130, 90});
    DestroyWindow(graph);
    EXPECT_FALSE(IsWindow(legend));
}

TEST_F(LegendWindow, OfTwoChartsAreTwo) {
    create();
    const HWND first = showLegend({30, 20, 130, 90});
    const HWND firstGraph = graph;
    spy.clearCalls();
    create();
    const HWND second = showLegend({30, 20, 130, 90});
    EXPECT_NE(first, second);
    EXPECT_EQ(GetParent(first), firstGraph);
    EXPECT_EQ(GetParent(second), graph);
}

TEST_F(LegendWindow, ThatCannotBeMadeIsTriedAgain) {
    create();
    spy.watch("CreateWindowExW");
    spy.failNth("CreateWindowExW", 1);
    EXPECT_EQ(showLegend({30, 20, 130, 90}), nullptr);
    EXPECT_NE(showLegend({30, 20, 130, 90}), nullptr);
}

TEST_F(LegendWindow, WithoutARecordOnlyExists) {
    create();
    add({1, 2}, L"one");
    spy.watch("malloc");
    spy.failNth("malloc", 1);
    const HWND legend = showLegend({30, 20, 130, 90});
    spy.stopFailing("malloc");
    if (legend) {
        for (const UINT message : {WM_PAINT, WM_VSCROLL, WM_HSCROLL})
            SendMessageW(legend, message, 1, 0);
    }
    KorGraph_SetType(graph, KORGRAPH_PIE);
    host.pump();
    EXPECT_EQ(KorGraph_GetType(graph), KORGRAPH_PIE);
}

TEST_F(LegendWindow, ReturnsEveryHandle) {
    create();
    add({1, 2}, L"one");
    WatchHandles(spy);
    spy.clearCalls();
    const HWND legend = showLegend({30, 20, 130, 90});
    for (int i = 0; i < 5; ++i) {
        InvalidateRect(legend, nullptr, TRUE);
        UpdateWindow(legend);
    }
    EXPECT_EQ(UnreturnedHandles(spy), std::vector<std::string>{});
}

TEST_F(LegendWindow, OfStrangeRectanglesIsSurvived) {
    for (const RECT& place : {RECT{0, 0, 0, 0}, RECT{50, 50, 20, 20}, RECT{-500, -500, -400, -400},
                              RECT{0, 0, 30000, 30000}}) {
        create();
        add({1, 2}, L"one");
        showLegend(place);
        host.pump();
        destroy();
        spy.clearCalls();
    }
}

// Its creation answers 1, which is no failure to the platform: the window lives on, without a
// graph.
TEST_F(LegendWindow, WithoutAParentIsAnEmptyWindow) {
    create();
    showLegend({0, 0, 90, 60});  // registers the class
    const HWND legend =
        CreateWindowExW(0, L"KORVANE Corporation LegendControl", L"", WS_POPUP | WS_VISIBLE, 10, 10,
                        60, 40, nullptr, nullptr, GetModuleHandleW(nullptr), nullptr);
    ASSERT_NE(legend, nullptr);
    InvalidateRect(legend, nullptr, TRUE);
    EXPECT_TRUE(GetUpdateRect(legend, nullptr, FALSE));
    EXPECT_EQ(SendMessageW(legend, WM_PAINT, 0, 0), 0);
    EXPECT_FALSE(GetUpdateRect(legend, nullptr, FALSE));
    spy.watch("InvalidateRect");
    EXPECT_EQ(SendMessageW(legend, WM_VSCROLL, SB_LINEDOWN, 0), 0);
    EXPECT_TRUE(spy.callsOf("InvalidateRect").empty()) << "of no window is of every window";
    EXPECT_TRUE(DestroyWindow(legend));
}

}  // namespace
}  // namespace kortest
