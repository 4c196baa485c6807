// A whole life of a chart with each call of the platform failing in turn.
#include "graph/graph_fixture.h"

namespace kortest {
namespace {

class GraphFaults : public GuardedGraphTest, public ::testing::WithParamInterface<const char*> {
protected:
    // A short life of a chart, whatever of it could be made.
    void live() {
        RegisterGraphClass();
        graph = CreateGraphWindow(host.window(), WS_CHILD | WS_VISIBLE, {0, 0, 160, 110},
                                  GetModuleHandleW(nullptr));
        if (!graph) return;
        KorGraph_SetTitle(graph, L"title");
        KorGraph_SetYTitle(graph, L"up");
        add({3, -1, 2}, L"one");
        add({1, 4});
        categories({L"a", L"b", L"c"});
        setValue(0, 1, 5);
        replace(1, {2, 3});
        showLegendAnyhow();
        for (LONG type = 0; type <= 4; ++type) {
            KorGraph_SetType(graph, type);
            UpdateWindow(graph);
        }
        KorGraph_SetBackgroundColour(graph, RGB(1, 2, 3));
        KorGraph_SetType(graph, KORGRAPH_COLUMN);
        for (int y = 20; y < 90; y += 20)
            for (int x = 40; x < 140; x += 20) tapAnyhow(x, y);
        KorGraph_SetType(graph, KORGRAPH_LINE);
        KorGraph_SetZoom(graph, KORGRAPH_ZOOM200);
        for (int x = 2; x < 160; x += 12) tapAnyhow(x, 60);
        tapAnyhow(80, 5);
        resize(150, 100);
        send(GM_TOGGLEOPTIONS, 0, KORGRAPH_LIVE);
        notify(GN_CLEAR);
        notify(GN_LIVEUPDATE, 4);
        notify(GN_LIVEUPDATE, 5);
        const RECT part = {40, 0, 60, 100};
        InvalidateRect(graph, &part, FALSE);
        UpdateWindow(graph);
        host.pump();
        end();
    }

    void showLegendAnyhow() {
        const RECT place = {20, 10, 90, 80};
        KorGraph_ShowLegend(graph, &place);
        if (const HWND legend = GetDlgItem(graph, KORLEGEND_ID)) {
            UpdateWindow(legend);
            SendMessageW(legend, WM_VSCROLL, SB_LINEDOWN, 0);
        }
    }

    void tapAnyhow(int x, int y) {
        PressAt(graph, x, y);
        if (const HWND toolTip = GetDlgItem(host.window(), KORTOOLTIP_ID)) UpdateWindow(toolTip);
        ReleaseAt(graph, x, y);
    }

    void end() {
        if (IsWindow(graph)) DestroyWindow(graph);
        while (const HWND toolTip = GetDlgItem(host.window(), KORTOOLTIP_ID))
            DestroyWindow(toolTip);
        graph = nullptr;
    }

    // Whether the call that was to fail was made.
    bool failOnce(const std::string& name, int nth) {
        spy.clearCalls();
        spy.failNth(name, nth);
        live();
        end();
        spy.stopFailing(name);
        for (const auto& call : spy.callsOf(name))
            if (call.failed) return true;
        return false;
    }
};

TEST_P(GraphFaults, AreSurvivedOneByOne) {
    const std::string name = GetParam();
    live();
    const int left = heap->live();
    if (!spy.watch(name)) GTEST_SKIP() << "the library does not call " << name;
    // Every one of the first calls, then ever rarer ones.
    int failures = 0;
    for (int nth = 1; nth <= 3000; nth += 1 + nth / 12) {
        if (!failOnce(name, nth)) break;
        ++failures;
        ASSERT_EQ(heap->report(), "") << name << " " << nth;
    }
    EXPECT_GT(failures, 0) << name << " was never called";
    if (name == "LocalAlloc" || name == "malloc") {
        EXPECT_LE(heap->live(), left) << "blocks stayed behind: " << heap->liveReport();
    }
    createRegular();
    EXPECT_EQ(tap(95, 75), L"Value:4") << "the next chart is whole";
}

std::string NameOf(const ::testing::TestParamInfo<const char*>& info) { return info.param; }

INSTANTIATE_TEST_SUITE_P(Imports, GraphFaults,
                         ::testing::Values("malloc", "LocalAlloc", "CreateWindowExW", "CreatePen",
                                           "GetDC", "CreateCompatibleDC", "CreateCompatibleBitmap",
                                           "CreateFontIndirectW", "CreateSolidBrush",
                                           "CreateRectRgn", "SelectObject", "DrawTextW",
                                           "BeginPaint", "GetClientRect", "GetWindowRect",
                                           "LoadStringW", "GetDeviceCaps", "SetScrollInfo",
                                           "SetWindowPos", "GetStockObject"),
                         NameOf);

}  // namespace
}  // namespace kortest
