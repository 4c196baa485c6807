// The menu of all items. Its entries carry their item's address, which is looked up in the list
// before it is used: items may go while the menu is open.
#pragma once

#include "platform/platform.h"

namespace kor {

// Opens the menu below the bar, waits for the choice and selects it. Always 0. The window may be
// gone when this returns. While a menu is open this does nothing.
LRESULT OpenItemMenu(HWND hwnd);

// WM_MEASUREITEM and WM_DRAWITEM of an entry: 1, or 0 for a null pointer.
LRESULT OnMeasureEntry(HWND hwnd, MEASUREITEMSTRUCT* entry);
LRESULT OnDrawEntry(const DRAWITEMSTRUCT* entry);

}  // namespace kor
