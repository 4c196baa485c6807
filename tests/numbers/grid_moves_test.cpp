// The rules of the arrow and page keys, none of which mirrors another.
#include "grid/moves.h"

#include <gtest/gtest.h>

#include <ostream>

namespace kor {

void PrintTo(const CellBlock& block, std::ostream* stream) {
    *stream << "columns " << block.left << "-" << block.right << " rows " << block.top << "-"
            << block.bottom;
}

namespace {

constexpr Anchor kNone{-1, -1};

constexpr CellBlock Block(int left, int right, int top, int bottom) {
    return {static_cast<uint16_t>(left), static_cast<uint16_t>(right), static_cast<uint16_t>(top),
            static_cast<uint16_t>(bottom)};
}
constexpr CellBlock OneCell(int column, int row) { return Block(column, column, row, row); }

TEST(GridMoves, MoveASingleCell) {
    EXPECT_EQ(MoveLeft(OneCell(5, 7), kNone), OneCell(4, 7));
    EXPECT_EQ(MoveUp(OneCell(5, 7), kNone), OneCell(5, 6));
    EXPECT_EQ(MoveRight(OneCell(5, 7), kNone), OneCell(6, 7));
    EXPECT_EQ(MoveDown(OneCell(5, 7), kNone), OneCell(5, 8));
}

TEST(GridMoves, MakeACellOfABlock) {
    const CellBlock block = Block(5, 8, 7, 9);
    EXPECT_EQ(MoveLeft(block, kNone), OneCell(4, 7));
    EXPECT_EQ(MoveUp(block, kNone), OneCell(5, 6));
    EXPECT_EQ(MoveRight(block, kNone), OneCell(6, 7));
    EXPECT_EQ(MoveDown(block, kNone), OneCell(5, 8));
}

TEST(GridMoves, StopAtTheSheetsEdges) {
    EXPECT_EQ(MoveLeft(OneCell(0, 7), kNone), OneCell(0, 7));
    EXPECT_EQ(MoveUp(OneCell(5, 0), kNone), OneCell(5, 0));
    EXPECT_EQ(MoveRight(OneCell(255, 7), kNone), OneCell(255, 7));
    EXPECT_EQ(MoveDown(OneCell(5, 16383), kNone), OneCell(5, 16383));
}

TEST(GridMoves, NeedBothHalvesOfAnAnchor) {
    EXPECT_EQ(MoveRight(OneCell(5, 7), (Anchor{5, -1})), OneCell(6, 7));
    EXPECT_EQ(MoveRight(OneCell(5, 7), (Anchor{-1, 7})), OneCell(6, 7));
}

TEST(GridMovesLeft, ExtendFromAnAnchorAtTheRightEdge) {
    EXPECT_EQ(MoveLeft(Block(5, 5, 7, 9), (Anchor{5, 7})), Block(4, 5, 7, 9));
    EXPECT_EQ(MoveLeft(Block(4, 5, 7, 9), (Anchor{5, 7})), Block(3, 5, 7, 9));
    EXPECT_EQ(MoveLeft(Block(0, 5, 7, 9), (Anchor{5, 7})), Block(0, 5, 7, 9));
}

TEST(GridMovesLeft, ShrinkTowardsAnAnchorFurtherLeft) {
    EXPECT_EQ(MoveLeft(Block(5, 8, 7, 9), (Anchor{5, 7})), Block(5, 7, 7, 9));
    EXPECT_EQ(MoveLeft(Block(4, 8, 7, 9), (Anchor{6, 7})), Block(6, 7, 7, 9));
}

TEST(GridMovesRight, ExtendFromAnAnchorAtTheLeftEdge) {
    EXPECT_EQ(MoveRight(Block(5, 5, 7, 9), (Anchor{5, 7})), Block(5, 6, 7, 9));
    EXPECT_EQ(MoveRight(Block(5, 255, 7, 9), (Anchor{5, 7})), Block(5, 255, 7, 9));
}

TEST(GridMovesRight, ShrinkTowardsAnyOtherAnchor) {
    EXPECT_EQ(MoveRight(Block(3, 5, 7, 9), (Anchor{5, 7})), Block(4, 5, 7, 9));
    EXPECT_EQ(MoveRight(Block(3, 9, 7, 9), (Anchor{5, 7})), Block(4, 5, 7, 9));
    EXPECT_EQ(MoveRight(Block(6, 9, 7, 9), (Anchor{5, 7})), Block(6, 5, 7, 9));  // turned round
}

TEST(GridMovesUp, ExtendFromAnAnchorAtTheBottomEdge) {
    EXPECT_EQ(MoveUp(Block(5, 6, 7, 7), (Anchor{5, 7})), Block(5, 6, 6, 7));
    EXPECT_EQ(MoveUp(Block(5, 6, 0, 7), (Anchor{5, 7})), Block(5, 6, 0, 7));
}

TEST(GridMovesUp, ShrinkTowardsAnAnchorFurtherUp) {
    EXPECT_EQ(MoveUp(Block(5, 6, 7, 9), (Anchor{5, 7})), Block(5, 6, 7, 8));
    EXPECT_EQ(MoveUp(Block(5, 6, 3, 9), (Anchor{5, 7})), Block(5, 6, 7, 8));
}

// What would be the bottom row is put into the right column.
TEST(GridMovesUp, RestoreTheRightColumnWhenABlockIsTurnedRound) {
    EXPECT_EQ(MoveUp(Block(250, 300, 7, 9), (Anchor{250, 7})), Block(250, 9, 7, 8));
}

TEST(GridMovesDown, ExtendFromAnAnchorAtTheTopEdge) {
    EXPECT_EQ(MoveDown(Block(5, 6, 7, 7), (Anchor{5, 7})), Block(5, 6, 7, 8));
    EXPECT_EQ(MoveDown(Block(5, 6, 7, 16383), (Anchor{5, 7})), Block(5, 6, 7, 16383));
}

TEST(GridMovesDown, ShrinkTowardsAnyOtherAnchor) {
    EXPECT_EQ(MoveDown(Block(5, 6, 3, 7), (Anchor{5, 7})), Block(5, 6, 4, 7));
    EXPECT_EQ(MoveDown(Block(5, 6, 3, 9), (Anchor{5, 7})), Block(5, 6, 4, 7));
}

TEST(GridPages, MoveOneCellByAPage) {
    EXPECT_EQ(MovePageDown(Block(5, 8, 7, 9), 20), OneCell(5, 27));
    EXPECT_EQ(MovePageUp(Block(5, 8, 27, 29), 20), OneCell(5, 7));
}

TEST(GridPages, StopAtTheTopAndRunPastTheBottom) {
    EXPECT_EQ(MovePageUp(OneCell(5, 7), 20), OneCell(5, 0));
    EXPECT_EQ(MovePageDown(OneCell(5, 16370), 20), OneCell(5, 16384));
    EXPECT_EQ(MovePageDown(OneCell(5, 16363), 20), OneCell(5, 16383));
    EXPECT_EQ(MovePageDown(OneCell(5, 16364), 20), OneCell(5, 16384));
}

}  // namespace
}  // namespace kor
