// The selected block and its anchor.
#pragma once

#include "grid/block.h"
#include "platform/platform.h"

namespace kor {

bool IsAnchored();
void ClearAnchor();

// Whether there is a current cell; there always is, unless the view's origin has become negative.
bool HasCurrentCell();

// Takes the highlight from the old block and gives it to the new one, on screen at the next paint.
void ShowSelection(const CellBlock& block);

// HCN_ITEMCLICK: selects the whole columns or rows between two items of a header, which count from
// the first visible one. The parent is not told, and the anchor stays.
LRESULT OnHeaderClick(HWND header, int itemA, int itemB);

// The corner button.
LRESULT SelectAll();

}  // namespace kor
