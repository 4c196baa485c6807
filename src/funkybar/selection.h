// Making an item the current one.
#pragma once

#include "platform/platform.h"

namespace kor {

// Invalidates the whole bar and paints it at once.
void RepaintBar(HWND hwnd);

// Makes the item at `index` the current one, tells the parent and repaints: 1. Without such an item
// 0, and the parent is not told; an index of -2 or below leaves no item the current one then. The
// parent may have destroyed the window when this returns.
int32_t SelectItem(HWND hwnd, int32_t index);

}  // namespace kor
