// Pressing items and dragging over them.
#include "header_fixture.h"

namespace kortest {
namespace {

// Three items of 60 pixels.
class HeaderPress : public HeaderTest {
protected:
    HeaderPress() { AppendSizes(header, {60, 60, 60}); }
    ~HeaderPress() override { ReleaseCapture(); }

    HWND header = createHorizontal();
};

TEST_F(HeaderPress, PostsTheItemTwice) {
    PressAt(header, 90, 5);
    EXPECT_EQ(host->transcript(), Lines{});  // not sent
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMCLICK column 1 1"});
}

TEST_F(HeaderPress, NamesTheStripsWindow) {
    WPARAM wParam = 0;
    host->onMessage = [&](UINT, WPARAM strip, LPARAM) -> LRESULT {
        wParam = strip;
        return 0;
    };
    PressAt(header, 90, 5);
    host->pump();
    EXPECT_EQ(wParam, reinterpret_cast<WPARAM>(header));
}

TEST_F(HeaderPress, TakesTheCaptureUntilTheRelease) {
    PressAt(header, 90, 5);
    EXPECT_EQ(GetCapture(), header);
    ReleaseAt(header, 90, 5);
    EXPECT_EQ(GetCapture(), nullptr);
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMCLICK column 1 1"});  // none for the release
}

TEST_F(HeaderPress, PostsTheItemUnderThePointerOnceForEachChange) {
    PressAt(header, 90, 5);
    MoveTo(header, 100, 5);
    posted();
    MoveTo(header, 110, 5);
    EXPECT_EQ(posted(), Lines{});
    MoveTo(header, 150, 5);
    MoveTo(header, 151, 5);
    MoveTo(header, 30, 5);
    EXPECT_EQ(posted(),
              (Lines{"posted HCN_ITEMCLICK column 1 2", "posted HCN_ITEMCLICK column 1 0"}));
    ReleaseAt(header, 30, 5);
    EXPECT_EQ(posted(), Lines{});
}

TEST_F(HeaderPress, PostsThePressedItemAgainOnTheVeryFirstMove) {
    PressAt(header, 90, 5);
    MoveTo(header, 90, 5);
    EXPECT_EQ(posted(),
              (Lines{"posted HCN_ITEMCLICK column 1 1", "posted HCN_ITEMCLICK column 1 1"}));
}

TEST_F(HeaderPress, CountsBordersToTheirItemsWhileDragging) {
    PressAt(header, 90, 5);
    MoveTo(header, 90, 5);
    posted();
    MoveTo(header, 119, 5);
    EXPECT_EQ(posted(), Lines{});
    MoveTo(header, 120, 5);
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMCLICK column 1 2"});
    MoveTo(header, 0, 5);
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMCLICK column 1 0"});
}

TEST_F(HeaderPress, IgnoresPositionsWithoutAnItemWhileDragging) {
    PressAt(header, 90, 5);
    MoveTo(header, 90, 5);
    posted();
    MoveTo(header, 180, 5);
    MoveTo(header, 399, 5);
    MoveTo(header, -1, 5);
    MoveTo(header, -3000, 5);
    MoveTo(header, 90, 5);  // still the item reported last
    EXPECT_EQ(posted(), Lines{});
}

TEST_F(HeaderPress, ReachesOutsideTheStripWhileDragging) {
    AppendItem(header, L"wide", 1000);
    PressAt(header, 90, 5);
    MoveTo(header, 700, -40);  // right of the window and above it
    EXPECT_EQ(posted(),
              (Lines{"posted HCN_ITEMCLICK column 1 1", "posted HCN_ITEMCLICK column 1 3"}));
}

// The item reported last is not forgotten with the end of a drag.
TEST_F(HeaderPress, StaysSilentOnTheItemWhereTheLastDragEnded) {
    PressAt(header, 30, 5);
    MoveTo(header, 90, 5);
    ReleaseAt(header, 90, 5);
    posted();
    PressAt(header, 90, 5);
    MoveTo(header, 91, 5);
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMCLICK column 1 1"});  // the press's own
    MoveTo(header, 30, 5);
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMCLICK column 1 0"});
}

TEST_F(HeaderPress, IsTrackedUntilTheReleaseOnly) {
    PressAt(header, 30, 5);
    ReleaseAt(header, 30, 5);
    posted();
    MoveTo(header, 90, 5);
    EXPECT_EQ(posted(), Lines{});
}

TEST_F(HeaderPress, BeyondAllItemsDoesNothing) {
    PressAt(header, 180, 5);
    EXPECT_EQ(GetCapture(), nullptr);
    MoveTo(header, 90, 5);
    ReleaseAt(header, 90, 5);
    EXPECT_EQ(posted(), Lines{});
}

TEST_F(HeaderPress, BeyondAllItemsForgetsAnEarlierPress) {
    PressAt(header, 30, 5);
    posted();
    PressAt(header, 200, 5);
    MoveTo(header, 90, 5);
    EXPECT_EQ(posted(), Lines{});
}

TEST_F(HeaderPress, BeyondAllItemsForgetsAnEarlierBorderDrag) {
    PressAt(header, 58, 5);
    PressAt(header, 200, 5);
    MoveTo(header, 90, 5);
    ReleaseAt(header, 90, 5);
    EXPECT_EQ(posted(), Lines{});
    EXPECT_EQ(SizesOf(header), (std::vector<int>{60, 60, 60}));
}

TEST_F(HeaderPress, OnAnItemForgetsAnEarlierBorderDrag) {
    PressAt(header, 58, 5);
    PressAt(header, 90, 5);
    posted();
    MoveTo(header, 100, 5);
    ReleaseAt(header, 100, 5);
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMCLICK column 1 1"});
    EXPECT_EQ(SizesOf(header), (std::vector<int>{60, 60, 60}));
}

TEST_F(HeaderPress, OnABorderForgetsAnEarlierPress) {
    PressAt(header, 90, 5);
    posted();
    PressAt(header, 3, 5);  // border before the first item: nothing to resize either
    MoveTo(header, 150, 5);
    EXPECT_EQ(posted(), Lines{});
}

// Nobody gives this capture back but the host or the system.
TEST_F(HeaderPress, AtTheStripsBeginTakesTheCaptureForGood) {
    PressAt(header, 0, 5);
    EXPECT_EQ(GetCapture(), header);
    MoveTo(header, 90, 5);
    ReleaseAt(header, 90, 5);
    EXPECT_EQ(GetCapture(), header);
    EXPECT_EQ(posted(), Lines{});
    EXPECT_EQ(SizesOf(header), (std::vector<int>{60, 60, 60}));
}

TEST_F(HeaderPress, ReleaseAloneDoesNothing) {
    SetCapture(host->window());
    ReleaseAt(header, 90, 5);
    EXPECT_EQ(GetCapture(), host->window());
    MoveTo(header, 90, 5);
    EXPECT_EQ(posted(), Lines{});
}

// The class has CS_DBLCLKS, and a strip does not handle the second press of a double click.
TEST_F(HeaderPress, TwiceQuicklyCountsOnce) {
    SendMessageW(header, WM_LBUTTONDBLCLK, MK_LBUTTON, MAKELPARAM(90, 5));
    EXPECT_EQ(GetCapture(), nullptr);
    MoveTo(header, 30, 5);
    EXPECT_EQ(posted(), Lines{});
}

TEST_F(HeaderPress, OnOneStripIsTrackedOnAll) {
    HWND other = createHorizontal();
    AppendSizes(other, {100, 100});
    PressAt(header, 150, 5);
    posted();
    MoveTo(other, 120, 5);
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMCLICK column2 2 1"});
    ReleaseAt(other, 120, 5);
    MoveTo(header, 30, 5);
    EXPECT_EQ(posted(), Lines{});
}

TEST_F(HeaderPress, GoesDownAVerticalStrip) {
    HWND rows = createVertical();
    AppendSizes(rows, {40, 40, 40});
    PressAt(rows, 100, 60);
    MoveTo(rows, 0, 100);
    ReleaseAt(rows, 0, 100);
    EXPECT_EQ(posted(), (Lines{"posted HCN_ITEMCLICK row 1 1", "posted HCN_ITEMCLICK row 1 2"}));
}

TEST_F(HeaderPress, IsPostedToTheParentAtCreation) {
    RecordingHost other;
    SetParent(header, other.window());
    PressAt(header, 90, 5);
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMCLICK column 1 1"});
    other.pump();
    EXPECT_EQ(other.transcript(), Lines{});
    SetParent(header, host->window());
}

TEST_F(HeaderPress, OnAStripWithoutAParentDoesNothing) {
    HWND orphan = CreateWindowExW(0, KORHEADER_CLASS, L"", WS_POPUP, 0, 0, 400, 16, nullptr,
                                  nullptr, GetModuleHandleW(nullptr), nullptr);
    AppendSizes(orphan, {60, 60});
    PressAt(orphan, 30, 5);
    EXPECT_NE(GetCapture(), orphan);
    MoveTo(orphan, 90, 5);
    ReleaseAt(orphan, 90, 5);
    EXPECT_EQ(posted(), Lines{});
    DestroyWindow(orphan);
}

}  // namespace
}  // namespace kortest
