// The menu of all items. Each entry carries its item's address, which is looked up in the list
// before it is used: items may be deleted while the menu is open.
#pragma once

#include "platform/platform.h"

namespace kor {

// Opens the menu below the bar, waits for a choice and selects it. Returns 0. The window may have
// been destroyed when this returns. Does nothing while a menu is open.
LRESULT OpenItemMenu(HWND hwnd);

// WM_MEASUREITEM and WM_DRAWITEM of an entry: 1, or 0 for a null pointer.
LRESULT OnMeasureEntry(HWND hwnd, MEASUREITEMSTRUCT* entry);
LRESULT OnDrawEntry(const DRAWITEMSTRUCT* entry);

}  // namespace kor
