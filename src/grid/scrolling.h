// Scrolling by whole columns and rows.
#pragma once

#include "platform/platform.h"

namespace kor {

// WM_HSCROLL and WM_VSCROLL with the scroll code and the thumb's position. The result is 0, or 1
// for a code that is not handled. The two directions differ in small ways that hosts rely on.
LRESULT OnHorizontalScroll(int code, int thumbPosition);
LRESULT OnVerticalScroll(int code, int thumbPosition);

// The grid sends itself one scroll step, as its scroll bar would.
void ScrollHorizontally(int code);
void ScrollVertically(int code);

}  // namespace kor
