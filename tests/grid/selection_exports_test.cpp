// SetSelectedRanged, GetSelectedRanged and GetCurrentSelectedCell.
#include "grid/use_grid.h"

namespace kortest {
namespace {

class SelectionCalls : public GridUse {
protected:
    void SetUp() override {
        open(330, 168);
        told();
    }
};

TEST_F(SelectionCalls, StartsAtA1) {
    EXPECT_EQ(Selection(), Block(0, 0, 0, 0));
    GridCellPair cell{9, 9};
    EXPECT_EQ(GetCurrentSelectedCell(&cell), 1u);
    EXPECT_EQ(cell.column, 0);
    EXPECT_EQ(cell.row, 0);
}

TEST_F(SelectionCalls, BlockIsStored) {
    EXPECT_NE(Select(2, 5, 7, 300), 0u);
    EXPECT_EQ(Selection(), Block(2, 5, 7, 300));
    GridCellPair cell{};
    EXPECT_EQ(GetCurrentSelectedCell(&cell), 1u);
    EXPECT_EQ(cell.column, 2);
    EXPECT_EQ(cell.row, 7);
}

// Every combination of the values around each limit; what is refused changes nothing.
TEST_F(SelectionCalls, AcceptBlocksInsideTheSheetAlone) {
    const int columns[] = {0, 1, 128, 254, 255, 256, 257, 511, 32767, 32768, 65535};
    const int rows[] = {0, 1, 255, 256, 8192, 16382, 16383, 16384, 16385, 32768, 65535};
    GridSelection last = Block(0, 0, 0, 0);
    int wrong = 0;
    for (const int left : columns) {
        for (const int right : columns) {
            for (const int top : rows) {
                for (const int bottom : rows) {
                    const bool isInside =
                        left <= right && right <= 255 && top <= bottom && bottom <= 16383;
                    if (isInside) last = Block(left, right, top, bottom);
                    if ((Select(left, right, top, bottom) != 0) != isInside) ++wrong;
                    if (!(Selection() == last)) ++wrong;
                }
            }
        }
    }
    EXPECT_EQ(wrong, 0);
    EXPECT_EQ(told(), Lines{});
}

TEST_F(SelectionCalls, RefusedBlocksRepaintNothing) {
    TakeInvalid(grid);
    EXPECT_EQ(Select(3, 2, 0, 0), 0u);
    EXPECT_EQ(Select(0, 0, 5, 4), 0u);
    EXPECT_EQ(Select(0, 256, 0, 0), 0u);
    EXPECT_EQ(Select(0, 0, 0, 16384), 0u);
    EXPECT_FALSE(TakeInvalid(grid));
    EXPECT_EQ(Selection(), Block(0, 0, 0, 0));
}

TEST_F(SelectionCalls, HighlightMovesToTheNewBlock) {
    const GridSelection blocks[] = {
        Block(1, 1, 1, 1),   Block(0, 3, 2, 6),       Block(2, 5, 4, 10),  Block(0, 255, 3, 3),
        Block(4, 4, 0, 999), Block(0, 255, 0, 16383), Block(20, 30, 0, 9), Block(0, 2, 200, 300)};
    for (const GridSelection& block : blocks) {
        Select(block.left, block.right, block.top, block.bottom);
        ASSERT_TRUE(model.setSelection(block));
        EXPECT_EQ(highlight(), expectedHighlight()) << BlockName(block);
    }
}

TEST_F(SelectionCalls, OldAndNewBlockAreInvalidated) {
    Select(1, 1, 1, 1);
    TakeInvalid(grid);
    spy.watch("InvalidateRect");
    std::vector<RECT> rectangles;
    spy.replace("InvalidateRect", [&](ULONG_PTR* arguments) {
        EXPECT_EQ(reinterpret_cast<HWND>(arguments[0]), grid);
        EXPECT_EQ(static_cast<DWORD>(arguments[2]), 0u);
        rectangles.push_back(*reinterpret_cast<const RECT*>(arguments[1]));
        return spy.callReal("InvalidateRect", arguments);
    });
    Select(3, 4, 5, 7);
    const int top = cellsTop();
    ASSERT_EQ(rectangles.size(), 2u);
    EXPECT_EQ(rectangles[0], (RECT{90, top + 16, 150, top + 32}));
    EXPECT_EQ(rectangles[1], (RECT{210, top + 80, 330, top + 128}));
}

TEST_F(SelectionCalls, NothingIsTold) {
    Select(1, 2, 3, 4);
    Select(1, 2, 3, 4);
    host.pump();
    EXPECT_EQ(told(), Lines{});
}

TEST_F(SelectionCalls, AnchorStays) {
    anchorAt(2, 2);
    Select(4, 4, 4, 4);
    KeyHeld shift(VK_SHIFT);
    PressKey(grid, VK_LEFT);  // from the anchor at column 2: 4 to 2 shrinks to 2 to 3
    EXPECT_EQ(Selection(), Block(2, 3, 4, 4));
}

TEST_F(SelectionCalls, ViewStays) {
    Select(100, 100, 1000, 1000);
    EXPECT_EQ(VisibleRange(), Range(0, 6, 0, 11));
}

TEST_F(SelectionCalls, NullPointersAreRefused) {
    GetSelectedRanged(nullptr);
    EXPECT_EQ(GetCurrentSelectedCell(nullptr), 0u);
}

TEST_F(SelectionCalls, WriteTheirWordsAndNoMore) {
    Select(1, 2, 3, 4);
    WORD words[6] = {0xAAAA, 0xAAAA, 0xAAAA, 0xAAAA, 0xAAAA, 0xAAAA};
    GetSelectedRanged(reinterpret_cast<GridSelection*>(words + 1));
    EXPECT_EQ(std::vector<WORD>(words, words + 6), (std::vector<WORD>{0xAAAA, 1, 2, 3, 4, 0xAAAA}));
    WORD pair[4] = {0xAAAA, 0xAAAA, 0xAAAA, 0xAAAA};
    GetCurrentSelectedCell(reinterpret_cast<GridCellPair*>(pair + 1));
    EXPECT_EQ(std::vector<WORD>(pair, pair + 4), (std::vector<WORD>{0xAAAA, 1, 3, 0xAAAA}));
}

TEST_F(SelectionCalls, ResetGridKeepsTheSelection) {
    Select(1, 2, 3, 4);
    SetFirstVisibleCell(KORGRID_CELL(1, 3));
    ResetGrid();
    EXPECT_EQ(Selection(), Block(1, 2, 3, 4));
}

}  // namespace
}  // namespace kortest
