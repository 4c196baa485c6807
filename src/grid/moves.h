// Where each arrow and page key takes a selection: rules over numbers, without a window.
//
// The four arrows are not mirror images of each other. Hosts and their users know them as they are;
// each is a rule of its own.
#pragma once

#include "grid/block.h"

namespace kor {

// With the anchor of a Shift-extension; without one the single cell moves.
CellBlock MoveLeft(CellBlock block, Anchor anchor);
CellBlock MoveUp(CellBlock block, Anchor anchor);
CellBlock MoveRight(CellBlock block, Anchor anchor);
CellBlock MoveDown(CellBlock block, Anchor anchor);

// By a page of `rows` rows; the block becomes one cell.
CellBlock MovePageUp(CellBlock block, int rows);
CellBlock MovePageDown(CellBlock block, int rows);

}  // namespace kor
