// Where each arrow and page key moves a selection: pure calculations, without a window.
//
// Compatibility: the four arrows are not mirror images of each other; each is a rule of its own;
// pinned by GridMovesLeft.ShrinkTowardsAnAnchorFurtherLeft and
// GridMovesRight.ShrinkTowardsAnyOtherAnchor.
#pragma once

#include "grid/block.h"

namespace kor {

// With an anchor they extend the block; without one the single cell moves.
CellBlock MoveLeft(CellBlock block, Anchor anchor);
CellBlock MoveUp(CellBlock block, Anchor anchor);
CellBlock MoveRight(CellBlock block, Anchor anchor);
CellBlock MoveDown(CellBlock block, Anchor anchor);

// Move by a page of `rows` rows; the block becomes one cell.
CellBlock MovePageUp(CellBlock block, int rows);
CellBlock MovePageDown(CellBlock block, int rows);

}  // namespace kor
