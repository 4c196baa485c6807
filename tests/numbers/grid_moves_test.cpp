// The rules of the arrow and page keys, none of which mirrors another.
#include "grid/moves.h"

#include <gtest/gtest.h>

#include <ostream>

bool operator==(const GridSelection& a, const GridSelection& b) {
    return a.left == b.left && a.right == b.right && a.top == b.top && a.bottom == b.bottom;
}

void PrintTo(const GridSelection& block, std::ostream* stream) {
    *stream << "columns " << block.left << "-" << block.right << " rows " << block.top << "-"
            << block.bottom;
}

namespace kor {
namespace {

constexpr Anchor kNone{-1, -1};

constexpr GridSelection Block(int left, int right, int top, int bottom) {
    return {static_cast<WORD>(left), static_cast<WORD>(right), static_cast<WORD>(top),
            static_cast<WORD>(bottom)};
}
constexpr GridSelection Cell(int column, int row) { return Block(column, column, row, row); }

TEST(GridMoves, MoveASingleCell) {
    EXPECT_EQ(MoveLeft(Cell(5, 7), kNone), Cell(4, 7));
    EXPECT_EQ(MoveUp(Cell(5, 7), kNone), Cell(5, 6));
    EXPECT_EQ(MoveRight(Cell(5, 7), kNone), Cell(6, 7));
    EXPECT_EQ(MoveDown(Cell(5, 7), kNone), Cell(5, 8));
}

TEST(GridMoves, MakeACellOfABlock) {
    const GridSelection block = Block(5, 8, 7, 9);
    EXPECT_EQ(MoveLeft(block, kNone), Cell(4, 7));
    EXPECT_EQ(MoveUp(block, kNone), Cell(5, 6));
    EXPECT_EQ(MoveRight(block, kNone), Cell(6, 7));
    EXPECT_EQ(MoveDown(block, kNone), Cell(5, 8));
}

TEST(GridMoves, StopAtTheSheetsEdges) {
    EXPECT_EQ(MoveLeft(Cell(0, 7), kNone), Cell(0, 7));
    EXPECT_EQ(MoveUp(Cell(5, 0), kNone), Cell(5, 0));
    EXPECT_EQ(MoveRight(Cell(255, 7), kNone), Cell(255, 7));
    EXPECT_EQ(MoveDown(Cell(5, 16383), kNone), Cell(5, 16383));
}

TEST(GridMoves, NeedBothHalvesOfAnAnchor) {
    EXPECT_EQ(MoveRight(Cell(5, 7), (Anchor{5, -1})), Cell(6, 7));
    EXPECT_EQ(MoveRight(Cell(5, 7), (Anchor{-1, 7})), Cell(6, 7));
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
    EXPECT_EQ(MovePageDown(Block(5, 8, 7, 9), 20), Cell(5, 27));
    EXPECT_EQ(MovePageUp(Block(5, 8, 27, 29), 20), Cell(5, 7));
}

TEST(GridPages, StopAtTheTopAndRunPastTheBottom) {
    EXPECT_EQ(MovePageUp(Cell(5, 7), 20), Cell(5, 0));
    EXPECT_EQ(MovePageDown(Cell(5, 16370), 20), Cell(5, 16384));
    EXPECT_EQ(MovePageDown(Cell(5, 16363), 20), Cell(5, 16383));
    EXPECT_EQ(MovePageDown(Cell(5, 16364), 20), Cell(5, 16384));
}

}  // namespace
}  // namespace kor
