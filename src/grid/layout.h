// Where the grid's children stand, and laying them out again.
#pragma once

#include "platform/platform.h"

namespace kor {

// WM_SIZE: makes the image anew in the client's size, places the children, fills the headers and
// redraws all. A client area without width changes nothing.
LRESULT OnGridSize();

// Sends the grid WM_SIZE, as if its own size had changed.
void LayOutAgain(LPARAM size);

// GRIDM_REDRAW: fills the headers again and redraws the cell area.
void RedrawHeadersAndCells();

// Follows the row numbers that a new first row brings on screen: a wider or narrower row header,
// and then a new layout.
void FitRowHeaderTo(int firstRow);

}  // namespace kor
