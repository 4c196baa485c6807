// Page Up and Page Down.
#include "grid/use_grid.h"

namespace kortest {
namespace {

// 6 columns and 11 rows are visible.
class PageKeys : public GridUse {
protected:
    void SetUp() override {
        open(330, 168);
        told();
    }
};

TEST_F(PageKeys, PageDownMovesByTheVisibleRowsAndScrollsALineAndAPage) {
    Select(2, 2, 3, 3);
    EXPECT_EQ(PressKey(grid, VK_NEXT), 0);
    EXPECT_EQ(Selection(), Block(2, 2, 14, 14));
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 0-6 rows 1-12",
                             "sent GRIDN_PAINTCELLS columns 0-6 rows 11-22",
                             "sent GRIDN_CURRENTCELL C15"}));
}

TEST_F(PageKeys, PageDownInsideTheViewScrollsThePageAlone) {
    SetFirstVisibleCell(KORGRID_CELL(0, 20));
    Select(2, 2, 10, 10);
    told();
    PressKey(grid, VK_NEXT);  // to row 21, which is visible
    EXPECT_EQ(Selection(), Block(2, 2, 21, 21));
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 0-6 rows 30-41",
                             "sent GRIDN_CURRENTCELL C22"}));
}

TEST_F(PageKeys, PageDownLooksForTheRowAfterTheView) {
    SetFirstVisibleCell(KORGRID_CELL(0, 20));
    Select(2, 2, 20, 20);
    told();
    PressKey(grid, VK_NEXT);  // to row 31, the first one below the view
    EXPECT_EQ(told().size(), 3u);
    SetFirstVisibleCell(KORGRID_CELL(0, 20));
    Select(2, 2, 19, 19);
    told();
    PressKey(grid, VK_NEXT);  // to row 30, the last one in it
    EXPECT_EQ(told().size(), 2u);
}

TEST_F(PageKeys, PageDownMakesABlockOneCell) {
    Select(2, 4, 3, 8);
    PressKey(grid, VK_NEXT);
    EXPECT_EQ(Selection(), Block(2, 2, 14, 14));
}

TEST_F(PageKeys, ShiftChangesNothing) {
    anchorAt(2, 3);
    KeyHeld shift(VK_SHIFT);
    PressKey(grid, VK_NEXT);
    EXPECT_EQ(Selection(), Block(2, 2, 14, 14));
    PressKey(grid, VK_PRIOR);
    EXPECT_EQ(Selection(), Block(2, 2, 3, 3));
}

// The row after the last one is what a page too far leads to; the next arrow key finds the
// selection invalid and starts again at A1.
TEST_F(PageKeys, PageDownPastTheEndSelectsTheRowAfterTheLast) {
    SetFirstVisibleCell(KORGRID_CELL(0, 16370));
    Select(2, 2, 16380, 16380);
    told();
    EXPECT_EQ(PressKey(grid, VK_NEXT), 0);
    EXPECT_EQ(Selection(), Block(2, 2, 16384, 16384));
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 0-6 rows 16371-16382",
                             "sent GRIDN_PAINTCELLS columns 0-6 rows 16381-16384",
                             "sent GRIDN_CURRENTCELL C16385"}));
    EXPECT_EQ(PressKey(grid, VK_DOWN), 0);
    EXPECT_EQ(Selection(), Block(0, 0, 0, 0));
    EXPECT_EQ(told(), (Lines{"sent GRIDN_CURRENTCELL A1"}));
}

TEST_F(PageKeys, PageDownReachesTheLastRowExactly) {
    Select(2, 2, 16372, 16372);
    PressKey(grid, VK_NEXT);
    EXPECT_EQ(Selection(), Block(2, 2, 16383, 16383));
    Select(2, 2, 16373, 16373);
    PressKey(grid, VK_NEXT);
    EXPECT_EQ(Selection(), Block(2, 2, 16384, 16384));
}

TEST_F(PageKeys, PageUpInTheFirstScreenOnlyScrolls) {
    SetFirstVisibleCell(KORGRID_CELL(0, 20));
    for (const int row : {0, 5, 11}) {
        Select(2, 3, row, row + 1);
        SetFirstVisibleCell(KORGRID_CELL(0, 20));
        told();
        EXPECT_EQ(PressKey(grid, VK_PRIOR), 0);
        EXPECT_EQ(Selection(), Block(2, 3, row, row + 1));
        EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 0-6 rows 9-20"}));
    }
    SetFirstVisibleCell(0);
    told();
    PressKey(grid, VK_PRIOR);  // already at the top: drawn again
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 0-6 rows 0-11"}));
}

TEST_F(PageKeys, PageUpMovesByTheVisibleRows) {
    SetFirstVisibleCell(KORGRID_CELL(0, 20));
    Select(2, 4, 25, 28);
    told();
    EXPECT_EQ(PressKey(grid, VK_PRIOR), 0);
    EXPECT_EQ(Selection(), Block(2, 2, 14, 14));
    EXPECT_EQ(told(),
              (Lines{"sent GRIDN_PAINTCELLS columns 0-6 rows 9-20", "sent GRIDN_CURRENTCELL C15"}));
}

TEST_F(PageKeys, PageUpFromTheRowAfterTheFirstScreen) {
    Select(2, 2, 12, 12);
    PressKey(grid, VK_PRIOR);
    EXPECT_EQ(Selection(), Block(2, 2, 1, 1));
}

TEST_F(PageKeys, PageUpToARowBelowTheViewScrollsDownFirst) {
    Select(2, 2, 500, 500);
    told();
    PressKey(grid, VK_PRIOR);
    EXPECT_EQ(Selection(), Block(2, 2, 489, 489));
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 0-6 rows 1-12",
                             "sent GRIDN_PAINTCELLS columns 0-6 rows 0-11",
                             "sent GRIDN_CURRENTCELL C490"}));
}

TEST_F(PageKeys, ScrollMessagesAreSentToTheGrid) {
    host.alsoRecord(grid, "grid");
    host.leaveOut(WM_KEYDOWN);
    host.leaveOut(GRIDN_PAINTCELLS);
    Select(2, 2, 500, 500);
    PressKey(grid, VK_PRIOR);
    EXPECT_EQ(told(), (Lines{"grid sent WM_VSCROLL 1 0", "grid sent WM_VSCROLL 2 0",
                             "sent GRIDN_CURRENTCELL C490"}));
    PressKey(grid, VK_NEXT);
    EXPECT_EQ(told(), (Lines{"grid sent WM_VSCROLL 1 0", "grid sent WM_VSCROLL 3 0",
                             "sent GRIDN_CURRENTCELL C501"}));
}

TEST_F(PageKeys, HighlightFollows) {
    for (const WPARAM key : {VK_NEXT, VK_NEXT, VK_PRIOR, VK_DOWN, VK_NEXT, VK_PRIOR, VK_PRIOR}) {
        PressKey(grid, key);
        model.key(static_cast<int>(key), false);
        EXPECT_EQ(highlight(), expectedHighlight());
        EXPECT_TRUE(isAsModel());
    }
}

// ---- Invalid selections -------------------------------------------------------------------------

class InvalidSelection : public GridUse {
protected:
    void SetUp() override {
        open(330, 168);
        makeInvalid();
    }

    // Row 16385, by Page Down; the view then goes to E31.
    void makeInvalid() {
        Select(2, 2, 16380, 16380);
        PressKey(grid, VK_NEXT);
        ASSERT_EQ(Selection(), Block(2, 2, 16384, 16384));
        SetFirstVisibleCell(KORGRID_CELL(4, 30));
        told();
    }
};

TEST_F(InvalidSelection, BecomesA1ByEveryArrowAndPageKey) {
    const struct {
        WPARAM key;
        Lines lines;
    } cases[] = {
        {VK_LEFT, {"sent GRIDN_PAINTCELLS columns 3-9 rows 30-41", "sent GRIDN_CURRENTCELL A1"}},
        {VK_UP, {"sent GRIDN_PAINTCELLS columns 4-10 rows 29-40", "sent GRIDN_CURRENTCELL A1"}},
        {VK_RIGHT, {"sent GRIDN_CURRENTCELL A1"}},
        {VK_DOWN, {"sent GRIDN_CURRENTCELL A1"}},
        {VK_PRIOR, {"sent GRIDN_PAINTCELLS columns 4-10 rows 19-30", "sent GRIDN_CURRENTCELL A1"}},
        {VK_NEXT, {"sent GRIDN_PAINTCELLS columns 4-10 rows 40-51", "sent GRIDN_CURRENTCELL A1"}}};
    for (const auto& one : cases) {
        SCOPED_TRACE(one.key);
        EXPECT_EQ(PressKey(grid, one.key), 0);
        EXPECT_EQ(Selection(), Block(0, 0, 0, 0));
        EXPECT_EQ(told(), one.lines);
        makeInvalid();
    }
}

TEST_F(InvalidSelection, BecomesA1WithShiftAndAnchorToo) {
    anchorAt(0, 0);
    for (const WPARAM key : {VK_LEFT, VK_UP, VK_RIGHT, VK_DOWN}) {
        makeInvalid();
        KeyHeld shift(VK_SHIFT);
        PressKey(grid, key);
        EXPECT_EQ(Selection(), Block(0, 0, 0, 0)) << key;
    }
}

TEST_F(InvalidSelection, LeavesNoHighlightBehind) {
    SetFirstVisibleCell(0);
    PressKey(grid, VK_DOWN);
    model.selection = Block(0, 0, 0, 0);
    EXPECT_EQ(highlight(), expectedHighlight());
}

TEST_F(InvalidSelection, TabAndEnterStartAgainToo) {
    PressKey(grid, VK_TAB);
    EXPECT_EQ(Selection(), Block(0, 0, 0, 0));
    makeInvalid();
    PressKey(grid, VK_RETURN);
    EXPECT_EQ(Selection(), Block(0, 0, 0, 0));
}

TEST_F(InvalidSelection, OtherKeysLeaveIt) {
    for (const WPARAM key : {VK_DELETE, VK_ESCAPE, VK_CONTROL, VK_HOME, VK_END}) {
        PressKey(grid, key);
        EXPECT_EQ(Selection(), Block(2, 2, 16384, 16384));
    }
}

TEST_F(InvalidSelection, IsReadAndPaintedLikeAnyOther) {
    GridCellPair cell{};
    EXPECT_EQ(GetCurrentSelectedCell(&cell), 1u);
    EXPECT_EQ(cell.row, 16384);
    EXPECT_NE(Select(1, 1, 1, 1), 0u);
    SetFirstVisibleCell(0);
    model.setSelection(Block(1, 1, 1, 1));
    EXPECT_EQ(highlight(), expectedHighlight());
}

}  // namespace
}  // namespace kortest
