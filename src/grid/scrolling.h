// Scrolling by whole columns and rows.
#pragma once

#include "platform/platform.h"

namespace kor {

// WM_HSCROLL and WM_VSCROLL with the scroll code and the thumb's position. The result is 0, or 1
// for a code that is not handled.
// Compatibility: the two directions differ in small ways, such as the length of a page back; pinned
// by ColumnScrolling.PageUpKeepsOneColumnOfThePage and RowScrolling.PageUpGoesAWholePage.
LRESULT OnHorizontalScroll(int code, int thumbPosition);
LRESULT OnVerticalScroll(int code, int thumbPosition);

// Sends the grid one scroll step, as its scroll bar would.
void ScrollHorizontally(int code);
void ScrollVertically(int code);

}  // namespace kor
