// Shift and the arrow keys with an anchor. The four keys have four rules that do not mirror each
// other: Left asks whether the anchor is at or right of the block's right end, Right whether it is
// the left end, Up whether it is at or below the bottom, Down whether it differs from the top.
#include "grid/use_grid.h"

namespace kortest {
namespace {

class ExtendingKeys : public GridUse {
protected:
    void SetUp() override {
        open(330, 168);
        host.leaveOut(GRIDN_PAINTCELLS);
        anchorAt(2, 3);  // C4
        told();
    }

    // The block after Shift and a key.
    GridSelection after(const GridSelection& block, WPARAM key) {
        EXPECT_NE(Select(block.left, block.right, block.top, block.bottom), 0u);
        KeyHeld shift(VK_SHIFT);
        EXPECT_EQ(PressKey(grid, key), 0);
        return Selection();
    }
};

TEST_F(ExtendingKeys, LeftWidensWhileTheAnchorIsAtOrRightOfTheBlock) {
    EXPECT_EQ(after(Block(2, 2, 3, 3), VK_LEFT), Block(1, 2, 3, 3));
    EXPECT_EQ(after(Block(1, 2, 3, 5), VK_LEFT), Block(0, 2, 3, 5));
    EXPECT_EQ(after(Block(0, 1, 3, 3), VK_LEFT), Block(0, 2, 3, 3));  // stops, snaps to the anchor
    EXPECT_EQ(after(Block(0, 2, 3, 3), VK_LEFT), Block(0, 2, 3, 3));
    EXPECT_EQ(after(Block(1, 1, 3, 3), VK_LEFT), Block(0, 2, 3, 3));
}

TEST_F(ExtendingKeys, LeftNarrowsWhileTheBlockReachesRightOfTheAnchor) {
    EXPECT_EQ(after(Block(2, 5, 3, 4), VK_LEFT), Block(2, 4, 3, 4));
    EXPECT_EQ(after(Block(2, 3, 3, 3), VK_LEFT), Block(2, 2, 3, 3));
    EXPECT_EQ(after(Block(4, 5, 3, 3), VK_LEFT), Block(2, 4, 3, 3));
    EXPECT_EQ(after(Block(0, 5, 3, 3), VK_LEFT), Block(2, 4, 3, 3));
}

TEST_F(ExtendingKeys, RightWidensWhileTheAnchorIsTheLeftEnd) {
    EXPECT_EQ(after(Block(2, 2, 3, 3), VK_RIGHT), Block(2, 3, 3, 3));
    EXPECT_EQ(after(Block(2, 4, 3, 5), VK_RIGHT), Block(2, 5, 3, 5));
    EXPECT_EQ(after(Block(2, 254, 3, 3), VK_RIGHT), Block(2, 255, 3, 3));
    EXPECT_EQ(after(Block(2, 255, 3, 3), VK_RIGHT), Block(2, 255, 3, 3));
}

TEST_F(ExtendingKeys, RightNarrowsTowardsTheAnchorOtherwise) {
    EXPECT_EQ(after(Block(0, 2, 3, 4), VK_RIGHT), Block(1, 2, 3, 4));
    EXPECT_EQ(after(Block(1, 2, 3, 3), VK_RIGHT), Block(2, 2, 3, 3));
    EXPECT_EQ(after(Block(0, 7, 3, 3), VK_RIGHT), Block(1, 2, 3, 3));
}

// Right of the anchor there is no block to narrow: the left end stays, the right end goes back to
// the anchor, and the block is turned round.
TEST_F(ExtendingKeys, RightBeyondTheAnchorTurnsTheBlockRound) {
    EXPECT_EQ(after(Block(4, 6, 3, 3), VK_RIGHT), Block(4, 2, 3, 3));
    PressKey(grid, VK_RIGHT);
    EXPECT_EQ(Selection(), Block(0, 0, 0, 0));
}

TEST_F(ExtendingKeys, UpGrowsWhileTheAnchorIsAtOrBelowTheBlock) {
    EXPECT_EQ(after(Block(2, 2, 3, 3), VK_UP), Block(2, 2, 2, 3));
    EXPECT_EQ(after(Block(2, 4, 1, 3), VK_UP), Block(2, 4, 0, 3));
    EXPECT_EQ(after(Block(2, 2, 0, 3), VK_UP), Block(2, 2, 0, 3));
    EXPECT_EQ(after(Block(2, 2, 1, 1), VK_UP), Block(2, 2, 0, 3));
    EXPECT_EQ(after(Block(2, 2, 0, 1), VK_UP), Block(2, 2, 0, 3));
}

TEST_F(ExtendingKeys, UpShrinksWhileTheBlockReachesBelowTheAnchor) {
    EXPECT_EQ(after(Block(2, 3, 3, 6), VK_UP), Block(2, 3, 3, 5));
    EXPECT_EQ(after(Block(2, 2, 3, 4), VK_UP), Block(2, 2, 3, 3));
    EXPECT_EQ(after(Block(2, 2, 5, 7), VK_UP), Block(2, 2, 3, 6));
    EXPECT_EQ(after(Block(2, 2, 0, 9), VK_UP), Block(2, 2, 3, 8));
}

TEST_F(ExtendingKeys, DownGrowsWhileTheAnchorIsTheTop) {
    EXPECT_EQ(after(Block(2, 2, 3, 3), VK_DOWN), Block(2, 2, 3, 4));
    EXPECT_EQ(after(Block(2, 4, 3, 6), VK_DOWN), Block(2, 4, 3, 7));
    EXPECT_EQ(after(Block(2, 2, 3, 16382), VK_DOWN), Block(2, 2, 3, 16383));
    EXPECT_EQ(after(Block(2, 2, 3, 16383), VK_DOWN), Block(2, 2, 3, 16383));
}

TEST_F(ExtendingKeys, DownShrinksTowardsTheAnchorOtherwise) {
    EXPECT_EQ(after(Block(2, 3, 0, 3), VK_DOWN), Block(2, 3, 1, 3));
    EXPECT_EQ(after(Block(2, 2, 2, 3), VK_DOWN), Block(2, 2, 3, 3));
    EXPECT_EQ(after(Block(2, 2, 0, 8), VK_DOWN), Block(2, 2, 1, 3));
    EXPECT_EQ(after(Block(2, 2, 5, 8), VK_DOWN), Block(2, 2, 5, 3));  // turned round
}

TEST_F(ExtendingKeys, HostHearsOfTheBlocksTopLeft) {
    after(Block(2, 2, 3, 3), VK_LEFT);
    after(Block(2, 2, 3, 3), VK_UP);
    after(Block(2, 2, 3, 3), VK_RIGHT);
    after(Block(2, 2, 3, 3), VK_DOWN);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_CURRENTCELL B4", "sent GRIDN_CURRENTCELL C3",
                             "sent GRIDN_CURRENTCELL C4", "sent GRIDN_CURRENTCELL C4"}));
}

TEST_F(ExtendingKeys, WalkOutAndBackAroundTheAnchor) {
    Select(2, 2, 3, 3);
    KeyHeld shift(VK_SHIFT);
    Lines blocks;
    for (const WPARAM key : {VK_RIGHT, VK_RIGHT, VK_LEFT, VK_LEFT, VK_LEFT, VK_RIGHT, VK_DOWN,
                             VK_UP, VK_UP, VK_DOWN}) {
        PressKey(grid, key);
        blocks.push_back(BlockName(Selection()));
    }
    EXPECT_EQ(blocks, (Lines{"C4:D4", "C4:E4", "C4:D4", "C4:C4", "B4:C4", "C4:C4", "C4:C5", "C4:C4",
                             "C3:C4", "C4:C4"}));
}

// Only Shift keeps the anchor: the keys that move by a cell leave it, Tab and Enter clear it.
TEST_F(ExtendingKeys, AnchorSurvivesPlainArrowKeys) {
    PressKey(grid, VK_RIGHT);
    PressKey(grid, VK_DOWN);
    EXPECT_EQ(after(Block(4, 4, 3, 3), VK_LEFT), Block(2, 3, 3, 3));
}

TEST_F(ExtendingKeys, AnchorSurvivesPageKeys) {
    PressKey(grid, VK_NEXT);
    PressKey(grid, VK_PRIOR);
    EXPECT_EQ(after(Block(4, 4, 3, 3), VK_LEFT), Block(2, 3, 3, 3));
}

TEST_F(ExtendingKeys, TabAndEnterClearTheAnchor) {
    PressKey(grid, VK_TAB);
    EXPECT_EQ(after(Block(4, 4, 3, 3), VK_LEFT), Block(3, 3, 3, 3));
    anchorAt(2, 3);
    PressKey(grid, VK_RETURN);
    EXPECT_EQ(after(Block(4, 4, 3, 3), VK_LEFT), Block(3, 3, 3, 3));
}

TEST_F(ExtendingKeys, ReleaseWithoutShiftClearsTheAnchor) {
    pressCell(2, 3);
    EXPECT_EQ(after(Block(4, 4, 3, 3), VK_LEFT), Block(3, 3, 3, 3));
}

TEST_F(ExtendingKeys, ExtendingPastTheViewScrolls) {
    Select(2, 5, 3, 10);
    KeyHeld shift(VK_SHIFT);
    PressKey(grid, VK_RIGHT);
    EXPECT_EQ(VisibleRange(), Range(1, 7, 0, 11));
    PressKey(grid, VK_DOWN);
    EXPECT_EQ(VisibleRange(), Range(1, 7, 1, 12));
    EXPECT_EQ(Selection(), Block(2, 6, 3, 11));
    // Narrowing looks at the same ends: the block still reaches the view's end.
    Select(1, 8, 3, 3);
    PressKey(grid, VK_RIGHT);
    EXPECT_EQ(Selection(), Block(2, 2, 3, 3));
    EXPECT_EQ(VisibleRange().firstColumn, 1);
}

TEST_F(ExtendingKeys, LeftLooksAtTheBlocksLeftEndForScrolling) {
    SetFirstVisibleCell(KORGRID_CELL(4, 0));
    Select(2, 6, 3, 3);
    told();
    KeyHeld shift(VK_SHIFT);
    PressKey(grid, VK_LEFT);  // the right end moves, the left end is out of the view
    EXPECT_EQ(Selection(), Block(2, 5, 3, 3));
    EXPECT_EQ(VisibleRange().firstColumn, 3);
}

TEST_F(ExtendingKeys, HighlightFollows) {
    model.selection = Block(2, 2, 3, 3);
    model.anchorColumn = 2;
    model.anchorRow = 3;
    KeyHeld shift(VK_SHIFT);
    for (const WPARAM key :
         {VK_RIGHT, VK_DOWN, VK_DOWN, VK_LEFT, VK_LEFT, VK_UP, VK_UP, VK_UP, VK_RIGHT, VK_RIGHT}) {
        PressKey(grid, key);
        model.key(static_cast<int>(key), true);
        EXPECT_EQ(highlight(), expectedHighlight());
        EXPECT_TRUE(isAsModel());
    }
}

}  // namespace
}  // namespace kortest
