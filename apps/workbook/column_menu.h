// The menu that opens over the list of columns.
#pragma once

#include <windows.h>

namespace workbook {

// Opens it at the pointer.
//   result  the chosen command, IDM_COLUMN_..., or 0
UINT AskColumnMenu(HWND owner, bool isOnRow, bool areSomeHidden);

}  // namespace workbook
