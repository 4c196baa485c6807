#include "column_menu.h"

#include "resource.h"

namespace workbook {

UINT AskColumnMenu(HWND owner, bool isOnRow, bool areSomeHidden) {
    const HMENU menu = CreatePopupMenu();
    if (!menu) return 0;
    const UINT onRow = isOnRow ? MF_ENABLED : MF_GRAYED;
    AppendMenuW(menu, MF_STRING | onRow, IDM_COLUMN_GO, L"&Go to Column");
    AppendMenuW(menu, MF_STRING | onRow, IDM_COLUMN_REMOVE, L"&Remove from List\tDelete");
    AppendMenuW(menu, MF_SEPARATOR, 0, nullptr);
    AppendMenuW(menu, MF_STRING | (areSomeHidden ? MF_ENABLED : MF_GRAYED), IDM_COLUMN_SHOW_ALL,
                L"Show &All Columns");
    POINT place = {};
    GetCursorPos(&place);
    const BOOL command =
        TrackPopupMenuEx(menu, TPM_RETURNCMD | TPM_RIGHTBUTTON, place.x, place.y, owner, nullptr);
    DestroyMenu(menu);
    return static_cast<UINT>(command);
}

}  // namespace workbook
