// Where each arrow and page key takes a selection: rules over numbers, without a window.
//
// The four arrows are not mirror images of each other. Hosts and their users know them as they are;
// each is a rule of its own.
#pragma once

#include "grid/state.h"

namespace kor {

// With the anchor of a Shift-extension; both -1 moves the single cell.
struct Anchor {
    int column;
    int row;
};

GridSelection MoveLeft(GridSelection block, Anchor anchor);
GridSelection MoveUp(GridSelection block, Anchor anchor);
GridSelection MoveRight(GridSelection block, Anchor anchor);
GridSelection MoveDown(GridSelection block, Anchor anchor);

// By a page of `rows` rows; the block becomes one cell.
GridSelection MovePageUp(GridSelection block, int rows);
GridSelection MovePageDown(GridSelection block, int rows);

}  // namespace kor
