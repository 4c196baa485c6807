// Layout of the grid's children.
#pragma once

#include "platform/platform.h"

namespace kor {

// WM_SIZE: creates a new image of the client's size, places the children, fills the headers and
// redraws everything. A client area without width changes nothing.
LRESULT OnGridSize();

// Sends the grid WM_SIZE, as if its own size had changed.
void LayOutAgain(LPARAM size);

// GRIDM_REDRAW: fills the headers again and redraws the cell area.
void RedrawHeadersAndCells();

// Fits the row header to the row numbers that a new first row brings into view. A new width causes
// a new layout.
void FitRowHeaderTo(int firstRow);

}  // namespace kor
