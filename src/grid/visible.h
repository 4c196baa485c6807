// Which cells are visible.
#pragma once

#include <korcontrols/grid.h>

#include "grid/block.h"
#include "platform/platform.h"

namespace kor {

GridVisibleRange VisibleRange();

// Whether a column and row lie in the visible range, a partly visible last one included.
bool IsCellVisible(int column, int row);

// Whether the whole cell lies inside the client area.
// Compatibility: only cells of the last visible column and row are measured, all others count as
// whole; pinned by Visibility.CutColumnBeforeTheLastCountsAsComplete.
bool IsCellCompletelyVisible(int column, int row);

// A cell's box in client coordinates; right and bottom are the next cells' left and top. The cell
// must be visible.
RECT CellBox(int column, int row);

// Client x of a column's left edge, or y of a row's top edge; not for indexes before the first
// visible one.
int ColumnLeft(int column);
int RowTop(int row);

// The cell at a client position.
// Compatibility: `x` is read unsigned, so left of the window counts as far right of it; pinned by
// GridHitTest.LeftOfTheClientAreaWrapsToTheRightEdge.
Cell CellFromPoint(int x, int y);

}  // namespace kor
