// Making an item the current one.
#pragma once

#include "platform/platform.h"

namespace kor {

// Invalidates the whole bar and paints it at once.
void RepaintBar(HWND hwnd);

// Makes the item at `index` the current one, notifies the parent and repaints. Returns 1, or 0
// without a notification when there is no such item. The parent may have destroyed the window when
// this returns.
// Compatibility: an index of -2 or below leaves no current item; pinned by
// BarSelection.BelowMinusOneLeavesNoCurrentItem.
int32_t SelectItem(HWND hwnd, int32_t index);

}  // namespace kor
