// The selected block and its anchor.
#pragma once

#include "grid/block.h"
#include "platform/platform.h"

namespace kor {

bool IsAnchored();
void ClearAnchor();

// Whether there is a current cell: always, unless the view's origin is negative.
bool HasCurrentCell();

// Moves the selection and its highlight to `block`; the screen follows at the next paint.
void ShowSelection(const CellBlock& block);

// HCN_ITEMCLICK: selects the whole columns or rows between two items of a header; items count from
// the first visible one. The parent is not notified, and the anchor stays.
LRESULT OnHeaderClick(HWND header, int itemA, int itemB);

// The corner button.
LRESULT SelectAll();

}  // namespace kor
