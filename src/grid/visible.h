// Which cells are visible.
#pragma once

#include <korcontrols/grid.h>

#include "grid/block.h"
#include "platform/platform.h"

namespace kor {

GridVisibleRange VisibleRange();

// Whether a column and row lie in the visible range, a partly visible last one included.
bool IsCellVisible(int column, int row);

// Whether the cell lies whole inside the client area. Only cells of the last visible column and
// row are measured.
bool IsCellCompletelyVisible(int column, int row);

// A cell's box in client coordinates: right and bottom are the next cells' left and top. The cell
// is a visible one.
RECT CellBox(int column, int row);

// Client x of a column, or y of a row, from the first visible one on.
int ColumnLeft(int column);
int RowTop(int row);

// The cell at a client position: `x` is read unsigned, so left of the window is far to the right.
Cell CellFromPoint(int x, int y);

}  // namespace kor
