// Pointer moves with an anchor extend the selection.
#include "grid/use_grid.h"

namespace kortest {
namespace {

class MouseDrag : public GridUse {
protected:
    void SetUp() override {
        open(330, 168);
        told();
    }

    std::string movedTo(int x, int y) {
        EXPECT_EQ(move(x, y), 0);
        return BlockName(Selection());
    }
};

TEST_F(MouseDrag, SpansFromThePressedCell) {
    press(middleX(2), middleY(4));
    told();
    EXPECT_EQ(movedTo(middleX(4), middleY(6)), "C5:E7");
    EXPECT_EQ(movedTo(middleX(0), middleY(1)), "A2:C5");
    EXPECT_EQ(movedTo(middleX(4), middleY(1)), "C2:E5");
    EXPECT_EQ(movedTo(middleX(0), middleY(6)), "A5:C7");
    EXPECT_EQ(movedTo(middleX(2), middleY(4)), "C5:C5");
    EXPECT_EQ(told(), (Lines{"sent GRIDN_SELECTING C5:E7", "sent GRIDN_SELECTING A2:C5",
                             "sent GRIDN_SELECTING C2:E5", "sent GRIDN_SELECTING A5:C7",
                             "sent GRIDN_SELECTING C5:C5"}));
}

TEST_F(MouseDrag, MoveInsideTheSameCellsChangesNothing) {
    press(middleX(2), middleY(4));
    move(middleX(3), middleY(5));
    told();
    TakeInvalid(grid);
    spy.watch("PatBlt");
    EXPECT_EQ(move(middleX(3) + 20, middleY(5) - 5), 0);
    EXPECT_EQ(told(), Lines{});
    EXPECT_FALSE(TakeInvalid(grid));
    EXPECT_EQ(spy.count("PatBlt"), 0);
}

TEST_F(MouseDrag, MoveInsideThePressedCellChangesNothing) {
    press(middleX(2), middleY(4));
    told();
    EXPECT_EQ(move(middleX(2) + 10, middleY(4) + 3), 0);
    EXPECT_EQ(told(), Lines{});
}

TEST_F(MouseDrag, WithoutAnAnchorNothingHappens) {
    TakeInvalid(grid);
    EXPECT_EQ(move(middleX(3), middleY(5)), 0);
    EXPECT_EQ(Selection(), Block(0, 0, 0, 0));
    EXPECT_EQ(told(), Lines{});
    EXPECT_FALSE(TakeInvalid(grid));
}

TEST_F(MouseDrag, EndsWithARelease) {
    press(middleX(2), middleY(4));
    move(middleX(3), middleY(5));
    release();
    told();
    move(middleX(5), middleY(8));
    EXPECT_EQ(Selection(), Block(2, 3, 4, 5));
    EXPECT_EQ(told(), Lines{});
}

// The anchor alone decides that a drag is under way: after a release with Shift, moves without a
// button extend the selection until a release without Shift.
TEST_F(MouseDrag, GoesOnAfterAReleaseWithShift) {
    press(middleX(2), middleY(4));
    release(true);
    told();
    EXPECT_EQ(send(WM_MOUSEMOVE, 0, MAKELPARAM(middleX(4), middleY(6))), 0);
    EXPECT_EQ(Selection(), Block(2, 4, 4, 6));
    EXPECT_EQ(told(), (Lines{"sent GRIDN_SELECTING C5:E7"}));
    release(false);
    told();
    send(WM_MOUSEMOVE, 0, MAKELPARAM(middleX(5), middleY(7)));
    EXPECT_EQ(Selection(), Block(2, 4, 4, 6));
    EXPECT_EQ(told(), Lines{});
}

TEST_F(MouseDrag, ShiftOfAMoveDoesNotCount) {
    press(middleX(2), middleY(4));
    send(WM_MOUSEMOVE, MK_LBUTTON | MK_SHIFT, MAKELPARAM(middleX(4), middleY(6)));
    EXPECT_EQ(Selection(), Block(2, 4, 4, 6));
}

TEST_F(MouseDrag, NegativeYIsTheFirstVisibleRow) {
    SetFirstVisibleCell(KORGRID_CELL(3, 7));
    press(middleX(2), middleY(4));  // F12
    EXPECT_EQ(movedTo(middleX(1), -5), "E8:F12");
    EXPECT_EQ(movedTo(middleX(1), -32768), "E8:F12");
    EXPECT_EQ(movedTo(middleX(1), 0), "E8:F12");
}

TEST_F(MouseDrag, LeftOfTheWindowIsFarRightOfIt) {
    press(middleX(2), middleY(4));
    EXPECT_EQ(movedTo(-1, middleY(4)), "C5:F5");
    EXPECT_EQ(movedTo(-32768, middleY(4)), "C5:F5");
    EXPECT_EQ(movedTo(32767, middleY(4)), "C5:F5");
}

TEST_F(MouseDrag, OutsideIsTakenToTheEdge) {
    press(middleX(2), middleY(4));
    EXPECT_EQ(movedTo(5000, 5000), "C5:F11");
    EXPECT_EQ(movedTo(5, middleY(4)), "A5:C5");
    EXPECT_EQ(movedTo(middleX(2), 20000), "C5:C11");
}

TEST_F(MouseDrag, HighlightFollows) {
    press(middleX(2), middleY(4));
    model.press(middleX(2), middleY(4), false);
    const int points[][2] = {{4, 6}, {0, 1}, {5, 1}, {2, 4}, {1, 9}, {1, 9}, {3, 3}};
    for (const auto& point : points) {
        move(middleX(point[0]), middleY(point[1]));
        model.move(middleX(point[0]), middleY(point[1]));
        EXPECT_EQ(highlight(), expectedHighlight());
    }
}

TEST_F(MouseDrag, NewHighlightIsThereWhenTheHostIsTold) {
    press(middleX(2), middleY(4));
    Lines seen;
    host.onMessage = [&](UINT message, WPARAM wParam, LPARAM) {
        if (message == WM_NOTIFY && wParam == GRIDN_SELECTING) seen = highlight();
        return LRESULT{0};
    };
    move(middleX(3), middleY(5));
    ASSERT_EQ(seen.size(), 11u);
    EXPECT_EQ(seen[4], "..##..");
    EXPECT_EQ(seen[5], "..##..");
    EXPECT_EQ(seen[6], "......");
}

TEST_F(MouseDrag, FollowsTheViewWhenItScrolls) {
    press(middleX(2), middleY(4));
    scrollRows(SB_LINEDOWN);
    scrollColumns(SB_LINEDOWN);
    EXPECT_EQ(Selection(), Block(2, 2, 4, 4));
    EXPECT_EQ(movedTo(middleX(2), middleY(4)), "C5:D6");
}

TEST_F(MouseDrag, SelectionChangedByTheHostIsSpannedAnew) {
    press(middleX(2), middleY(4));
    Select(0, 0, 0, 0);
    told();
    EXPECT_EQ(movedTo(middleX(2), middleY(4)), "C5:C5");
    EXPECT_EQ(told(), (Lines{"sent GRIDN_SELECTING C5:C5"}));
}

TEST_F(MouseDrag, RealInputMessagesThroughTheQueue) {
    PostMessageW(grid, WM_LBUTTONDOWN, MK_LBUTTON, MAKELPARAM(middleX(1), middleY(1)));
    PostMessageW(grid, WM_MOUSEMOVE, MK_LBUTTON, MAKELPARAM(middleX(3), middleY(2)));
    PostMessageW(grid, WM_LBUTTONUP, 0, MAKELPARAM(middleX(3), middleY(2)));
    host.pump();
    EXPECT_EQ(told(), (Lines{"sent GRIDN_CELLCLICKED B2", "sent GRIDN_SELECTING B2:D3",
                             "sent GRIDN_SELECTIONDONE B2:D3"}));
}

}  // namespace
}  // namespace kortest
