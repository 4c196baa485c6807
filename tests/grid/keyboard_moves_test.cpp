// The arrow keys without Shift, and without an anchor.
#include "grid/use_grid.h"

namespace kortest {
namespace {

class ArrowKeys : public GridUse {
protected:
    void SetUp() override {
        open(330, 168);
        host.leaveOut(GRIDN_PAINTCELLS);
        told();
    }

    // Selects a block, presses a key, and gives the block and what the host heard.
    std::string after(const GridSelection& block, WPARAM key) {
        EXPECT_NE(Select(block.left, block.right, block.top, block.bottom), 0u);
        told();
        EXPECT_EQ(PressKey(grid, key), 0);
        std::string result = BlockName(Selection());
        for (const std::string& line : told()) result += ", " + line;
        return result;
    }
    std::string after(int column, int row, WPARAM key) {
        return after(Block(column, column, row, row), key);
    }
};

TEST_F(ArrowKeys, MoveTheCellByOne) {
    EXPECT_EQ(after(2, 3, VK_LEFT), "B4:B4, sent GRIDN_CURRENTCELL B4");
    EXPECT_EQ(after(2, 3, VK_UP), "C3:C3, sent GRIDN_CURRENTCELL C3");
    EXPECT_EQ(after(2, 3, VK_RIGHT), "D4:D4, sent GRIDN_CURRENTCELL D4");
    EXPECT_EQ(after(2, 3, VK_DOWN), "C5:C5, sent GRIDN_CURRENTCELL C5");
}

TEST_F(ArrowKeys, StopAtTheSheetsEdgesAndStillTell) {
    EXPECT_EQ(after(0, 3, VK_LEFT), "A4:A4, sent GRIDN_CURRENTCELL A4");
    EXPECT_EQ(after(2, 0, VK_UP), "C1:C1, sent GRIDN_CURRENTCELL C1");
    EXPECT_EQ(after(255, 3, VK_RIGHT), "IV4:IV4, sent GRIDN_CURRENTCELL IV4");
    EXPECT_EQ(after(2, 16383, VK_DOWN), "C16384:C16384, sent GRIDN_CURRENTCELL C16384");
}

TEST_F(ArrowKeys, BlockBecomesTheCellBesideItsTopLeft) {
    const GridSelection block = Block(2, 4, 5, 8);
    EXPECT_EQ(after(block, VK_LEFT), "B6:B6, sent GRIDN_CURRENTCELL B6");
    EXPECT_EQ(after(block, VK_UP), "C5:C5, sent GRIDN_CURRENTCELL C5");
    EXPECT_EQ(after(block, VK_RIGHT), "D6:D6, sent GRIDN_CURRENTCELL D6");
    EXPECT_EQ(after(block, VK_DOWN), "C7:C7, sent GRIDN_CURRENTCELL C7");
}

TEST_F(ArrowKeys, BlockAtAnEdgeBecomesItsTopLeft) {
    EXPECT_EQ(after(Block(0, 3, 2, 4), VK_LEFT), "A3:A3, sent GRIDN_CURRENTCELL A3");
    EXPECT_EQ(after(Block(2, 3, 0, 4), VK_UP), "C1:C1, sent GRIDN_CURRENTCELL C1");
    EXPECT_EQ(after(Block(0, 255, 0, 16383), VK_RIGHT), "B1:B1, sent GRIDN_CURRENTCELL B1");
}

TEST_F(ArrowKeys, ShiftWithoutAnAnchorMoves) {
    KeyHeld shift(VK_SHIFT);
    EXPECT_EQ(after(2, 3, VK_RIGHT), "D4:D4, sent GRIDN_CURRENTCELL D4");
    EXPECT_EQ(after(2, 3, VK_LEFT), "B4:B4, sent GRIDN_CURRENTCELL B4");
    EXPECT_EQ(after(2, 3, VK_DOWN), "C5:C5, sent GRIDN_CURRENTCELL C5");
    EXPECT_EQ(after(2, 3, VK_UP), "C3:C3, sent GRIDN_CURRENTCELL C3");
}

TEST_F(ArrowKeys, AnchorWithoutShiftMoves) {
    anchorAt(4, 4);
    EXPECT_EQ(after(2, 3, VK_RIGHT), "D4:D4, sent GRIDN_CURRENTCELL D4");
    EXPECT_EQ(after(2, 3, VK_UP), "C3:C3, sent GRIDN_CURRENTCELL C3");
}

TEST_F(ArrowKeys, HighlightFollows) {
    for (const WPARAM key : {VK_RIGHT, VK_DOWN, VK_DOWN, VK_RIGHT, VK_LEFT, VK_UP, VK_UP}) {
        PressKey(grid, key);
        model.key(static_cast<int>(key), false);
        EXPECT_EQ(highlight(), expectedHighlight());
        EXPECT_TRUE(isAsModel());
    }
}

TEST_F(ArrowKeys, OnlyOldAndNewCellAreRepainted) {
    Select(2, 2, 3, 3);
    TakeInvalid(grid);
    PressKey(grid, VK_RIGHT);
    EXPECT_EQ(TakeInvalid(grid), (RECT{30 + 120, cellsTop() + 48, 30 + 240, cellsTop() + 64}));
}

// ---- Scrolling with the cell -------------------------------------------------------------------

class ArrowScrolling : public GridUse {
protected:
    void SetUp() override {
        open(330, 168);
        SetFirstVisibleCell(KORGRID_CELL(10, 100));
        told();
    }
};

TEST_F(ArrowScrolling, LeftOutOfTheViewScrollsOneColumn) {
    Select(10, 10, 105, 105);
    PressKey(grid, VK_LEFT);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 9-15 rows 100-111",
                             "sent GRIDN_CURRENTCELL J106"}));
}

TEST_F(ArrowScrolling, UpOutOfTheViewScrollsOneRow) {
    Select(12, 12, 100, 100);
    PressKey(grid, VK_UP);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 10-16 rows 99-110",
                             "sent GRIDN_CURRENTCELL M100"}));
}

TEST_F(ArrowScrolling, RightOutOfTheViewScrollsOneColumn) {
    Select(15, 15, 105, 105);  // the last visible one
    PressKey(grid, VK_RIGHT);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 11-17 rows 100-111",
                             "sent GRIDN_CURRENTCELL Q106"}));
}

TEST_F(ArrowScrolling, DownOutOfTheViewScrollsOneRow) {
    Select(12, 12, 110, 110);
    PressKey(grid, VK_DOWN);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 10-16 rows 101-112",
                             "sent GRIDN_CURRENTCELL M112"}));
}

TEST_F(ArrowScrolling, InsideTheViewNothingScrolls) {
    Select(14, 14, 109, 109);
    PressKey(grid, VK_RIGHT);  // to the partly visible column
    PressKey(grid, VK_DOWN);   // to the partly visible row
    EXPECT_EQ(told(), (Lines{"sent GRIDN_CURRENTCELL P110", "sent GRIDN_CURRENTCELL P111"}));
    Select(11, 11, 101, 101);
    PressKey(grid, VK_LEFT);
    PressKey(grid, VK_UP);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_CURRENTCELL K102", "sent GRIDN_CURRENTCELL K101"}));
}

TEST_F(ArrowScrolling, FarCellsAreApproachedOneLineAKey) {
    Select(100, 100, 105, 105);
    PressKey(grid, VK_RIGHT);
    EXPECT_EQ(VisibleRange().firstColumn, 11);
    Select(2, 2, 105, 105);
    PressKey(grid, VK_LEFT);
    EXPECT_EQ(VisibleRange().firstColumn, 10);
    PressKey(grid, VK_RIGHT);  // Right looks at the view's right end alone
    EXPECT_EQ(VisibleRange().firstColumn, 10);
}

TEST_F(ArrowScrolling, LastColumnAndRowScrollNoMore) {
    SetFirstVisibleCell(KORGRID_CELL(250, 16373));
    Select(255, 255, 16383, 16383);
    told();
    PressKey(grid, VK_RIGHT);
    PressKey(grid, VK_DOWN);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_CURRENTCELL IV16384", "sent GRIDN_CURRENTCELL IV16384"}));
}

TEST_F(ArrowScrolling, ScrollMessagesAreSentToTheGridBeforeTheHostIsTold) {
    host.alsoRecord(grid, "grid");
    host.leaveOut(WM_KEYDOWN);
    host.leaveOut(GRIDN_PAINTCELLS);
    Select(15, 15, 110, 110);
    told();
    PressKey(grid, VK_RIGHT);
    EXPECT_EQ(told(), (Lines{"grid sent WM_HSCROLL 1 0", "sent GRIDN_CURRENTCELL Q111"}));
    PressKey(grid, VK_DOWN);
    EXPECT_EQ(told(), (Lines{"grid sent WM_VSCROLL 1 0", "sent GRIDN_CURRENTCELL Q112"}));
    Select(11, 11, 101, 101);
    PressKey(grid, VK_UP);
    PressKey(grid, VK_LEFT);
    told();
    PressKey(grid, VK_UP);
    EXPECT_EQ(told(), (Lines{"grid sent WM_VSCROLL 0 0", "sent GRIDN_CURRENTCELL K100"}));
    PressKey(grid, VK_LEFT);
    EXPECT_EQ(told(), (Lines{"grid sent WM_HSCROLL 0 0", "sent GRIDN_CURRENTCELL J100"}));
}

}  // namespace
}  // namespace kortest
