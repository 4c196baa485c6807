// A chart, legend or tooltip that goes inside a message that the system sends while it works. Its
// record stays until that work is done; the guard heap sees whoever uses it later.
#include "graph/graph_fixture.h"

#include "support/message_hook.h"

namespace kortest {
namespace {

constexpr RECT kLegendPlace = {30, 20, 130, 90};

class DestroyedInside : public GuardedGraphTest {
protected:
    void SetUp() override {
        RegisterGraphClass();
        WatchHandles(spy);
    }

    void start() {
        create();
        add({1, 5, 2}, L"one");
        redraw();
        settle();
    }

    // Nothing of the chart is left, whatever was cut short.
    void TearDown() override {
        if (IsWindow(graph)) DestroyWindow(graph);
        if (IsWindow(tip)) DestroyWindow(tip);
        GuardedGraphTest::TearDown();
        EXPECT_EQ(heap->live(), 0) << heap->liveReport();
        EXPECT_EQ(UnreturnedHandles(spy), std::vector<std::string>{});
    }
};

TEST_F(DestroyedInside, TheParentsNotificationOfItsTooltip) {
    MessageHook hook(host.window());
    hook.before(WM_PARENTNOTIFY, [&](WPARAM, LPARAM) {
        graph = FindWindowExW(host.window(), nullptr, KORGRAPH_CLASS, nullptr);
        DestroyWindow(graph);
    });
    CreateGraphWindow(host.window(), WS_CHILD | WS_VISIBLE, {0, 0, 90, 90},
                      GetModuleHandleW(nullptr));
    EXPECT_TRUE(hook.hasActed());
    EXPECT_FALSE(IsWindow(graph));
    tip = GetDlgItem(host.window(), KORTOOLTIP_ID);
}

TEST_F(DestroyedInside, ItsErasing) {
    start();
    MessageHook hook(graph);
    hook.before(WM_ERASEBKGND, [&](WPARAM, LPARAM) { DestroyWindow(graph); });
    InvalidateRect(graph, nullptr, TRUE);
    UpdateWindow(graph);
    EXPECT_TRUE(hook.hasActed());
    EXPECT_FALSE(IsWindow(graph));
}

TEST_F(DestroyedInside, TheLegendsPaintForANewType) {
    start();
    const HWND legend = showLegend(kLegendPlace);
    MessageHook hook(legend);
    hook.before(WM_PAINT, [&](WPARAM, LPARAM) { DestroyWindow(graph); });
    send(GM_SETTYPE, 0, KORGRAPH_COLUMN);
    EXPECT_TRUE(hook.hasActed());
    EXPECT_FALSE(IsWindow(graph));
}

TEST_F(DestroyedInside, TheLegendsErasing) {
    start();
    const HWND legend = showLegend(kLegendPlace);
    UpdateWindow(legend);
    add({4}, L"two");
    MessageHook hook(legend);
    hook.before(WM_ERASEBKGND, [&](WPARAM, LPARAM) { DestroyWindow(graph); });
    InvalidateRect(legend, nullptr, TRUE);
    UpdateWindow(legend);
    EXPECT_TRUE(hook.hasActed());
}

TEST_F(DestroyedInside, TheLegendsCreation) {
    start();
    MessageHook hook(graph);
    hook.before(WM_PARENTNOTIFY, [&](WPARAM, LPARAM) { DestroyWindow(graph); });
    showLegend(kLegendPlace);
    EXPECT_TRUE(hook.hasActed());
    EXPECT_FALSE(IsWindow(graph));
}

// Taken to another parent, the legend outlives its chart and shows nothing.
TEST_F(DestroyedInside, TheCreationOfALegendThatStays) {
    start();
    HWND legend = nullptr;
    MessageHook hook(graph);
    hook.before(WM_PARENTNOTIFY, [&](WPARAM, LPARAM child) {
        legend = reinterpret_cast<HWND>(child);
        SetParent(legend, host.window());
        DestroyWindow(graph);
    });
    showLegend(kLegendPlace);
    ASSERT_TRUE(IsWindow(legend));
    RedrawWindow(legend, nullptr, nullptr, RDW_INVALIDATE | RDW_ERASE | RDW_UPDATENOW);
    SendMessageW(legend, WM_VSCROLL, SB_LINEDOWN, 0);
    DestroyWindow(legend);
}

TEST_F(DestroyedInside, TheTooltipsMove) {
    start();
    MessageHook hook(tip);
    hook.before(WM_WINDOWPOSCHANGED, [&](WPARAM, LPARAM) { DestroyWindow(tip); });
    const ToolTipRequest request = {L"Value:5", 20, 40, 200};
    SendMessageW(tip, TIPM_SHOW, 0, reinterpret_cast<LPARAM>(&request));
    EXPECT_TRUE(hook.hasActed());
    EXPECT_FALSE(IsWindow(tip));
}

TEST_F(DestroyedInside, TheTooltipsErasing) {
    start();
    const ToolTipRequest request = {L"Value:5", 20, 40, 200};
    SendMessageW(tip, TIPM_SHOW, 0, reinterpret_cast<LPARAM>(&request));
    MessageHook hook(tip);
    hook.before(WM_ERASEBKGND, [&](WPARAM, LPARAM) { DestroyWindow(tip); });
    RedrawWindow(tip, nullptr, nullptr, RDW_INVALIDATE | RDW_ERASE | RDW_UPDATENOW);
    EXPECT_TRUE(hook.hasActed());
}

TEST_F(DestroyedInside, TheTooltipsPaintForAPress) {
    start();
    MessageHook hook(tip);
    hook.before(TIPM_SHOW, [&](WPARAM, LPARAM) { DestroyWindow(graph); });
    for (int x = 15; x < 200 && !hook.hasActed(); ++x) {
        for (int y = 15; y < 115 && !hook.hasActed(); ++y) PressAt(graph, x, y);
    }
    EXPECT_TRUE(hook.hasActed());
    EXPECT_FALSE(IsWindow(graph));
}

}  // namespace
}  // namespace kortest
