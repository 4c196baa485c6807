// A drag ends when the grid loses the capture: a host shows a message box, the user switches to
// another program. It ends as a release ends it, but nobody is notified.
#include "grid/use_grid.h"

#include "support/message_hook.h"

namespace kortest {
namespace {

class LostCapture : public GridUse {
protected:
    void SetUp() override {
        open(330, 168);
        spy.watchAll({"SetTimer", "KillTimer"});
        told();
    }
    ~LostCapture() override { ReleaseCapture(); }
};

TEST_F(LostCapture, StopsTheTimer) {
    press(middleX(1), clientHeight() - 3);
    settle();
    ReleaseCapture();
    EXPECT_EQ(spy.sequence(), "KillTimer");
    EXPECT_FALSE(KillTimer(grid, kAutoScrollTimer)) << "there is none any more";
}

TEST_F(LostCapture, EndsTheSelectingWithoutANotification) {
    press(middleX(1), middleY(1));
    move(middleX(2), middleY(2));
    told();
    SetCapture(host.window());
    move(middleX(4), middleY(4));
    EXPECT_EQ(told(), Lines{});
    EXPECT_EQ(Selection(), Block(1, 2, 1, 2));
}

TEST_F(LostCapture, KeepsTheAnchorWithShiftAsAReleaseDoes) {
    press(middleX(1), middleY(1));
    {
        const KeyHeld shift(VK_SHIFT);
        ReleaseCapture();
    }
    move(middleX(2), middleY(2));
    EXPECT_EQ(Selection(), Block(1, 2, 1, 2));
}

TEST_F(LostCapture, IsOneToACancelledMode) {
    press(middleX(1), middleY(1));
    send(WM_CANCELMODE);
    EXPECT_EQ(GetCapture(), nullptr);
    move(middleX(2), middleY(2));
    EXPECT_EQ(Selection(), Block(1, 1, 1, 1));
}

TEST_F(LostCapture, InsideTheClicksNotificationEndsThePress) {
    host.onMessage = [&](UINT message, WPARAM code, LPARAM) -> LRESULT {
        if (message == WM_NOTIFY && code == GRIDN_CELLCLICKED) SetCapture(host.window());
        return 0;
    };
    press(middleX(1), clientHeight() - 3);
    host.onMessage = nullptr;
    EXPECT_FALSE(KillTimer(grid, kAutoScrollTimer));
    told();
    move(middleX(3), middleY(1));
    EXPECT_EQ(BlockName(Selection()), "B11:B11");
    EXPECT_EQ(told(), Lines{});
}

TEST_F(LostCapture, ToTheWindowThatHadItMakesThePressAClick) {
    const HWND loser = CreateWindowExW(0, L"STATIC", L"", WS_CHILD, 0, 0, 5, 5, host.window(),
                                       nullptr, GetModuleHandleW(nullptr), nullptr);
    MessageHook hook(loser);
    SetCapture(loser);
    hook.before(WM_CAPTURECHANGED, [&](WPARAM, LPARAM) { SetCapture(loser); });
    press(middleX(1), middleY(1));
    EXPECT_EQ(GetCapture(), loser);
    EXPECT_EQ(told(), Lines{"sent GRIDN_CELLCLICKED B2"});
    EXPECT_EQ(spy.count("SetTimer"), 0);
    move(middleX(3), middleY(3));
    EXPECT_EQ(Selection(), Block(1, 1, 1, 1));
}

TEST_F(LostCapture, GoesUnnoticedAfterTheRelease) {
    pressCell(1, 1, false);
    settle();
    send(WM_CAPTURECHANGED);
    EXPECT_EQ(spy.sequence(), "");
}

TEST_F(LostCapture, OfAGridThatGoesLeavesTheNextOneWithoutAnAnchor) {
    press(middleX(1), middleY(1));
    destroy();
    open(330, 168);
    told();
    move(middleX(3), middleY(3));
    EXPECT_EQ(told(), Lines{});
}

// ---- Borders of the grid's strips ---------------------------------------------------------------

TEST_F(LostCapture, TakesTheTrackingLineAway) {
    UpdateWindow(grid);
    const Picture before = ReadWindow(grid);
    PressAt(columnHeader, 60, 5);
    MoveTo(columnHeader, 100, 5);
    host.pump();
    ASSERT_FALSE(SamePicture(ReadWindow(grid), before)) << "or there is no line";
    ReleaseCapture();
    UpdateWindow(columnHeader);
    EXPECT_TRUE(SamePicture(ReadWindow(grid), before));
    EXPECT_EQ(HeaderSizes(columnHeader)[0], kColumnWidth) << "in step with the cells";
    told();
    host.pump();
    EXPECT_EQ(told(), Lines{});
}

TEST_F(LostCapture, TakesTheTrackingLineOfARowAway) {
    UpdateWindow(grid);
    const Picture before = ReadWindow(grid);
    PressAt(rowHeader, 5, 32);
    MoveTo(rowHeader, 5, 50);
    host.pump();
    ReleaseCapture();
    UpdateWindow(rowHeader);
    EXPECT_TRUE(SamePicture(ReadWindow(grid), before));
    EXPECT_EQ(HeaderSizes(rowHeader)[1], kRowHeight);
}

}  // namespace
}  // namespace kortest
