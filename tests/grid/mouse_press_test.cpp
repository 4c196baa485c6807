// The left button pressed and released in the grid.
#include "grid/use_grid.h"

namespace kortest {
namespace {

class MousePress : public GridUse {
protected:
    void SetUp() override {
        open(330, 168);
        told();
    }

    // The block that a press at a point selects.
    std::string pressed(int x, int y) {
        EXPECT_EQ(press(x, y), 0);
        const std::string block = BlockName(Selection());
        release();
        return block;
    }
};

TEST_F(MousePress, SelectsTheCellUnderThePointer) {
    EXPECT_EQ(press(middleX(2), middleY(4)), 0);
    EXPECT_EQ(Selection(), Block(2, 2, 4, 4));
    EXPECT_EQ(told(), (Lines{"sent GRIDN_CELLCLICKED C5"}));
    EXPECT_EQ(release(), 0);
    EXPECT_EQ(Selection(), Block(2, 2, 4, 4));
    EXPECT_EQ(told(), (Lines{"sent GRIDN_SELECTIONDONE C5:C5"}));
}

TEST_F(MousePress, CellsCountFromTheFirstVisibleOne) {
    SetFirstVisibleCell(KORGRID_CELL(10, 200));
    EXPECT_EQ(pressed(middleX(2), middleY(4)), "M205:M205");
}

TEST_F(MousePress, CellsBeginBehindTheirLines) {
    const int top = cellsTop();
    EXPECT_EQ(pressed(90, top + 5), "A1:A1");  // the line between A and B belongs to A
    EXPECT_EQ(pressed(91, top + 5), "B1:B1");
    EXPECT_EQ(pressed(35, top + 16), "A1:A1");
    EXPECT_EQ(pressed(35, top + 17), "A2:A2");
}

TEST_F(MousePress, HeaderAreaMeansTheFirstVisibleCells) {
    SetFirstVisibleCell(KORGRID_CELL(3, 7));
    EXPECT_EQ(pressed(5, middleY(2)), "D10:D10");
    EXPECT_EQ(pressed(middleX(2), 3), "F8:F8");
    EXPECT_EQ(pressed(0, 0), "D8:D8");
}

TEST_F(MousePress, AboveTheWindowMeansTheFirstCell) {
    SetFirstVisibleCell(KORGRID_CELL(3, 7));
    EXPECT_EQ(pressed(middleX(2), -1), "A1:A1");
    EXPECT_EQ(pressed(middleX(2), 0), "F8:F8");
}

// At the sheet's end the cells do not fill the view.
TEST_F(MousePress, PastTheLastColumnOneMoreIsFoundAndThenTheFirst) {
    SetFirstVisibleCell(KORGRID_CELL(253, 0));
    // Columns 253 to 255 end at 210.
    EXPECT_EQ(pressed(210, middleY(2)), "IV3:IV3");
    EXPECT_EQ(pressed(211, middleY(2)), "IW3:IW3");
    EXPECT_EQ(pressed(270, middleY(2)), "IW3:IW3");
    EXPECT_EQ(pressed(271, middleY(2)), "A3:A3");
    EXPECT_EQ(pressed(clientWidth() - 1, middleY(2)), "A3:A3");
}

TEST_F(MousePress, PastTheLastRowOneMoreIsFoundAndThenTheFirst) {
    SetFirstVisibleCell(KORGRID_CELL(0, 16381));
    const int bottom = cellsTop() + 48;
    EXPECT_EQ(pressed(middleX(1), bottom), "B16384:B16384");
    EXPECT_EQ(pressed(middleX(1), bottom + 1), "B16385:B16385");
    EXPECT_EQ(pressed(middleX(1), bottom + 16), "B16385:B16385");
    EXPECT_EQ(pressed(middleX(1), bottom + 17), "B1:B1");
}

TEST_F(MousePress, OutsideOnOneSideIsTakenToTheEdge) {
    const int right = clientWidth();
    const int bottom = clientHeight();
    EXPECT_EQ(pressed(right + 500, middleY(1)), "F2:F2");
    EXPECT_EQ(pressed(middleX(1), bottom + 500), "B11:B11");
}

TEST_F(MousePress, OutsideOnBothSidesIsIgnored) {
    SetFocus(edit);
    told();
    EXPECT_EQ(press(clientWidth() + 1, clientHeight() + 1), 0);
    EXPECT_EQ(told(), Lines{});
    EXPECT_EQ(GetFocus(), edit);
    EXPECT_NE(GetCapture(), grid);
    EXPECT_EQ(Selection(), Block(0, 0, 0, 0));
}

// The x position is unsigned, so left of the window is far right of it; y is signed, and above the
// window there is A1 alone.
TEST_F(MousePress, NegativePositions) {
    EXPECT_EQ(pressed(-1, middleY(2)), "F3:F3");
    EXPECT_EQ(pressed(-30000, middleY(2)), "F3:F3");
    SetFirstVisibleCell(KORGRID_CELL(3, 7));
    EXPECT_EQ(pressed(middleX(2), -1), "A1:A1");
    EXPECT_EQ(pressed(-1, clientHeight() + 1), "A1:A1");  // ignored: beyond both edges
}

TEST_F(MousePress, TakesFocusAndCapture) {
    SetFocus(host.window());
    press(middleX(0), middleY(0));
    EXPECT_EQ(GetFocus(), grid);
    EXPECT_EQ(GetCapture(), grid);
    release();
    EXPECT_EQ(GetCapture(), nullptr);
    EXPECT_EQ(GetFocus(), grid);
    EXPECT_EQ(GetControlWithFocus(), grid);
}

TEST_F(MousePress, StartsAndStopsTheTimer) {
    spy.watch("SetTimer");
    spy.watch("KillTimer");
    press(middleX(1), middleY(1));
    ASSERT_EQ(spy.sequence(), "SetTimer");
    EXPECT_EQ(ArgumentsOf(spy.callsOf("SetTimer")[0]),
              (std::vector<DWORD>{HandleValue(grid), 10101, 500, 0}));
    release();
    ASSERT_EQ(spy.sequence(), "SetTimer KillTimer");
    EXPECT_EQ(ArgumentsOf(spy.callsOf("KillTimer")[0]),
              (std::vector<DWORD>{HandleValue(grid), 10101}));
}

TEST_F(MousePress, OldHighlightIsGoneAndTheNewOneNotYetThereWhenTheHostIsTold) {
    Select(1, 1, 1, 1);
    Lines seen;
    GridSelection seenSelection{};
    host.onMessage = [&](UINT message, WPARAM wParam, LPARAM) {
        if (message == WM_NOTIFY && wParam == GRIDN_CELLCLICKED) {
            seen = highlight();
            seenSelection = Selection();
        }
        return LRESULT{0};
    };
    press(middleX(3), middleY(4));
    EXPECT_EQ(seen, Lines(11, "......"));
    EXPECT_EQ(seenSelection, Block(3, 3, 4, 4));
    const Lines now = highlight();
    EXPECT_EQ(now[1], "......");
    EXPECT_EQ(now[4], "...#..");
}

TEST_F(MousePress, ShiftSpansFromTheAnchor) {
    anchorAt(2, 3);
    told();
    press(middleX(4), middleY(1), true);
    EXPECT_EQ(Selection(), Block(2, 4, 1, 3));
    EXPECT_EQ(told(), (Lines{"sent GRIDN_CELLCLICKED E2"}));
    release(true);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_SELECTIONDONE C2:E4"}));
    press(middleX(0), middleY(5), true);  // the anchor is still at C4
    EXPECT_EQ(Selection(), Block(0, 2, 3, 5));
    release(true);
    press(middleX(2), middleY(3), true);
    EXPECT_EQ(Selection(), Block(2, 2, 3, 3));
}

TEST_F(MousePress, ShiftWithoutAnAnchorPressesPlainlyAndSetsIt) {
    Select(0, 0, 0, 0);
    press(middleX(2), middleY(3), true);
    EXPECT_EQ(Selection(), Block(2, 2, 3, 3));
    release(true);
    press(middleX(4), middleY(5), true);
    EXPECT_EQ(Selection(), Block(2, 4, 3, 5));
}

TEST_F(MousePress, PlainPressMovesTheAnchor) {
    anchorAt(2, 3);
    anchorAt(4, 4);
    press(middleX(5), middleY(5), true);
    EXPECT_EQ(Selection(), Block(4, 5, 4, 5));
}

TEST_F(MousePress, ReleaseWithoutShiftForgetsTheAnchor) {
    anchorAt(2, 3);
    release(false);
    press(middleX(4), middleY(5), true);
    EXPECT_EQ(Selection(), Block(4, 4, 5, 5));
}

TEST_F(MousePress, KeyboardStateOfShiftDoesNotCount) {
    anchorAt(2, 3);
    KeyHeld shift(VK_SHIFT);
    press(middleX(4), middleY(5), false);
    EXPECT_EQ(Selection(), Block(4, 4, 5, 5));
}

TEST_F(MousePress, ReleaseAloneTellsTheSelection) {
    Select(1, 2, 3, 4);
    spy.watch("KillTimer");
    EXPECT_EQ(release(), 0);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_SELECTIONDONE B4:C5"}));
    EXPECT_EQ(spy.count("KillTimer"), 1);
}

TEST_F(MousePress, CommitsTheEquationBarForTheOldCellFirst) {
    Select(1, 1, 1, 1);
    SetFocus(edit);
    SetWindowTextW(edit, L"12");
    SendMessageW(edit, EM_SETMODIFY, TRUE, 0);
    told();
    press(middleX(3), middleY(4));
    EXPECT_EQ(told(),
              (Lines{"sent GRIDN_EDITKILLFOCUS 1", "sent GRIDN_EQUATIONENTERED \"12\" B2",
                     "sent GRIDN_PAINTCELLS columns 0-6 rows 0-11", "sent GRIDN_CELLCLICKED D5"}));
    model.selection = Block(3, 3, 4, 4);
    EXPECT_EQ(highlight(), expectedHighlight());
}

TEST_F(MousePress, OldAndNewCellAreInvalidated) {
    Select(1, 1, 1, 1);
    SetFocus(grid);
    TakeInvalid(grid);
    press(middleX(3), middleY(4));
    const int top = cellsTop();
    EXPECT_EQ(TakeInvalid(grid), (RECT{90, top + 16, 270, top + 80}));
}

TEST_F(MousePress, SameCellAgainIsToldAgain) {
    pressCell(2, 2);
    pressCell(2, 2);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_CELLCLICKED C3", "sent GRIDN_SELECTIONDONE C3:C3",
                             "sent GRIDN_CELLCLICKED C3", "sent GRIDN_SELECTIONDONE C3:C3"}));
    model.selection = Block(2, 2, 2, 2);
    EXPECT_EQ(highlight(), expectedHighlight());
}

TEST_F(MousePress, DoubleClickMessageIsTheSystems) {
    EXPECT_EQ(send(WM_LBUTTONDBLCLK, MK_LBUTTON, MAKELPARAM(middleX(2), middleY(2))), 0);
    EXPECT_EQ(Selection(), Block(0, 0, 0, 0));
    EXPECT_EQ(told(), Lines{});
}

// A column past the sheet can be selected where the host made one the first; the next key starts
// again at A1.
TEST_F(MousePress, CellsPastTheSheetCanBeSelected) {
    SetFirstVisibleCell(KORGRID_CELL(300, 0));
    EXPECT_EQ(pressed(middleX(0), middleY(1)), CellName(300, 1) + ":" + CellName(300, 1));
    EXPECT_EQ(pressed(middleX(1), middleY(1)), "A2:A2");
    pressed(middleX(0), middleY(1));
    PressKey(grid, VK_DOWN);
    EXPECT_EQ(Selection(), Block(0, 0, 0, 0));
}

}  // namespace
}  // namespace kortest
