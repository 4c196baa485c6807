// The tooltip's size and place, showing and hiding.
#include "graph/graph_fixture.h"

#include <climits>

namespace kortest {
namespace {

SIZE MeasureIn(HWND window, const std::wstring& text) {
    const HDC dc = GetDC(window);
    RECT measured{};
    DrawTextW(dc, text.c_str(), -1, &measured, DT_CALCRECT);
    ReleaseDC(window, dc);
    return {measured.right, measured.bottom};
}

class ToolTip : public GraphTest {
protected:
    ToolTip() { create(); }

    LRESULT show(const wchar_t* text, LONG x, LONG y, LONG limit) const {
        const ToolTipRequest request = {text, x, y, limit};
        return SendMessageW(tip, TIPM_SHOW, 0, reinterpret_cast<LPARAM>(&request));
    }

    RECT place() const { return PlaceIn(host.window(), tip); }
};

TEST_F(ToolTip, IsSixPixelsLargerThanItsTextAndStandsOnThePoint) {
    const SIZE text = MeasureIn(tip, L"Value:12.5");
    EXPECT_EQ(show(L"Value:12.5", 50, 100, 390), 0);
    EXPECT_TRUE(IsWindowVisible(tip));
    EXPECT_EQ(place(), (RECT{50, 100 - text.cy - 6, 50 + text.cx + 6, 100}));
}

TEST_F(ToolTip, OfTwoLinesIsTwoLinesHigh) {
    const SIZE text = MeasureIn(tip, L"25%\r\nValue:1");
    ASSERT_EQ(text.cy, 2 * MeasureIn(tip, L"25%").cy);
    show(L"25%\r\nValue:1", 50, 100, 390);
    EXPECT_EQ(place(), (RECT{50, 100 - text.cy - 6, 50 + text.cx + 6, 100}));
}

TEST_F(ToolTip, StaysLeftOfTheLimit) {
    const LONG width = MeasureIn(tip, L"Value:12.5").cx + 6;
    show(L"Value:12.5", 230, 100, 240);
    EXPECT_EQ(place().left, 240 - width - 1);
    EXPECT_EQ(place().right, 239);
}

TEST_F(ToolTip, MayReachTheLimit) {
    const LONG width = MeasureIn(tip, L"Value:12.5").cx + 6;
    show(L"Value:12.5", 100, 100, 100 + width);
    EXPECT_EQ(place().left, 100);
    show(L"Value:12.5", 101, 100, 100 + width);
    EXPECT_EQ(place().left, 99);
}

TEST_F(ToolTip, MayStandOutsideItsParent) {
    show(L"Value:12.5", -20, 5, 390);
    EXPECT_EQ(place().left, -20);
    EXPECT_EQ(place().bottom, 5);
    show(L"Value:12.5", 20, 50, -1000);
    EXPECT_EQ(place().right, -1001);
}

// The far ends of what a position can be: no sum of them may come out on the other side.
TEST_F(ToolTip, StaysLeftOfTheLimitFromAnywhere) {
    show(L"Value:12.5", LONG_MAX, 100, 240);
    EXPECT_EQ(place().right, 239);
    spy.watch("SetWindowPos");
    show(L"Value:12.5", 0, LONG_MIN, LONG_MIN);
    const auto calls = spy.callsOf("SetWindowPos");
    ASSERT_EQ(calls.size(), 1u);
    EXPECT_EQ(static_cast<LONG>(calls[0].arguments[2]), LONG_MIN);
    EXPECT_EQ(static_cast<LONG>(calls[0].arguments[3]), LONG_MIN);
}

TEST_F(ToolTip, NullRequestDoesNothing) {
    EXPECT_EQ(SendMessageW(tip, TIPM_SHOW, 0, 0), 0);
    EXPECT_FALSE(IsWindowVisible(tip));
    EXPECT_EQ(place(), (RECT{0, 0, 25, 15}));
}

TEST_F(ToolTip, NullTextIsSurvived) {
    EXPECT_EQ(show(nullptr, 50, 100, 390), 0);
    UpdateWindow(tip);
}

TEST_F(ToolTip, EmptyTextIsShown) {
    show(L"", 50, 100, 390);
    EXPECT_TRUE(IsWindowVisible(tip));
    EXPECT_EQ(place().left, 50);
    EXPECT_EQ(place().bottom, 100);
}

TEST_F(ToolTip, IsHiddenByItsMessage) {
    show(L"Value:1", 50, 100, 390);
    EXPECT_EQ(SendMessageW(tip, TIPM_HIDE, 0, 0), 0);
    EXPECT_FALSE(IsWindowVisible(tip));
}

TEST_F(ToolTip, IsHiddenByATap) {
    show(L"Value:1", 50, 100, 390);
    PressAt(tip, 5, 5);
    EXPECT_TRUE(IsWindowVisible(tip));
    EXPECT_EQ(ReleaseAt(tip, 5, 5), 0);
    EXPECT_FALSE(IsWindowVisible(tip));
}

TEST_F(ToolTip, ComesToTheTop) {
    show(L"Value:1", 50, 100, 390);
    EXPECT_EQ(GetWindow(host.window(), GW_CHILD), tip) << "over the chart";
}

TEST_F(ToolTip, OtherMessagesReachDefaultProcessing) {
    spy.watch("DefWindowProcW");
    EXPECT_EQ(SendMessageW(tip, WM_USER + 5002, 0, 0), 0);
    EXPECT_EQ(SendMessageW(tip, WM_LBUTTONDOWN, 0, 0), 0);
    EXPECT_EQ(spy.count("DefWindowProcW"), 2);
}

TEST_F(ToolTip, ShowingReturnsEveryHandle) {
    WatchHandles(spy);
    spy.clearCalls();
    for (int i = 0; i < 5; ++i) {
        show(L"Value:1", 50, 100 + i, 390);
        UpdateWindow(tip);
    }
    EXPECT_EQ(UnreturnedHandles(spy), std::vector<std::string>{});
}

TEST_F(ToolTip, WithoutAParentAnswersZeroToEverything) {
    const HWND alone = CreateWindowExW(0, KORTOOLTIP_CLASS, L"", WS_POPUP, 0, 0, 50, 30, nullptr,
                                       nullptr, GetModuleHandleW(nullptr), nullptr);
    ASSERT_NE(alone, nullptr);
    const ToolTipRequest request = {L"Value:1", 10, 60, 300};
    EXPECT_EQ(SendMessageW(alone, TIPM_SHOW, 0, reinterpret_cast<LPARAM>(&request)), 0);
    EXPECT_EQ(SendMessageW(alone, TIPM_HIDE, 0, 0), 0);
    EXPECT_EQ(SendMessageW(alone, WM_LBUTTONUP, 0, 0), 0);
    EXPECT_EQ(SendMessageW(alone, WM_PAINT, 0, 0), 0);
    DestroyWindow(alone);
}

class ToolTipFaults : public GuardedGraphTest {
protected:
    HWND createTip() {
        return CreateWindowExW(0, KORTOOLTIP_CLASS, L"", WS_CHILD, 0, 0, 50, 30, host.window(),
                               nullptr, GetModuleHandleW(nullptr), nullptr);
    }

    void use(HWND window) {
        if (!window) return;
        const ToolTipRequest request = {L"Value:1", 10, 60, 300};
        EXPECT_EQ(SendMessageW(window, TIPM_SHOW, 0, reinterpret_cast<LPARAM>(&request)), 0);
        UpdateWindow(window);
        EXPECT_EQ(SendMessageW(window, TIPM_HIDE, 0, 0), 0);
        DestroyWindow(window);
    }
};

TEST_F(ToolTipFaults, NoMemoryLeavesAWindowThatAnswersZero) {
    create();
    const int live = heap->live();
    for (const char* name : {"malloc", "LocalAlloc"}) {
        spy.watch(name);
        spy.failNth(name, 1);
        use(createTip());
        EXPECT_EQ(heap->live(), live) << name;
    }
    use(createTip());
    EXPECT_EQ(heap->live(), live);
}

}  // namespace
}  // namespace kortest
