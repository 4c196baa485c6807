// What the grid does while and after a header border is dragged.
#pragma once

#include "platform/platform.h"

namespace kor {

// HCN_ITEMRESIZING: draws the tracking line. `position` is where the item would end,
// along the strip.
LRESULT OnHeaderResizing(HWND header, int position);

// HCN_ITEMRESIZED: stores the new size, redraws what moved and notifies the parent. `item` counts
// from the first visible column or row.
LRESULT OnHeaderResized(HWND header, int item, int units);

// The drag of a border of this strip was cancelled: removes the line and gives the strip its old
// sizes again.
void OnHeaderResizeLost(HWND header);

}  // namespace kor
