// What the grid does while and after a header border is dragged.
#pragma once

#include "platform/platform.h"

namespace kor {

// HCN_ITEMRESIZING: draws the tracking line. `position` is the pointer along the header strip.
LRESULT OnHeaderResizing(HWND header, int position);

// HCN_ITEMRESIZED: keeps the new size, redraws what moved and tells the parent. `item` counts from
// the first visible column or row.
LRESULT OnHeaderResized(HWND header, int item, int units);

// A border of this strip was being dragged and will not be let go: the line goes, and the strip has
// its old sizes again.
void OnHeaderResizeLost(HWND header);

}  // namespace kor
