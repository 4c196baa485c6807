#include "storms/stand_ins.h"

#include "storms/library.h"

#include <windows.h>

namespace kortest {
namespace {

int menus = 0;

UINT_PTR WINAPI NoTimer(HWND, UINT_PTR id, UINT, TIMERPROC) { return id; }

BOOL WINAPI NoTimerToKill(HWND, UINT_PTR) { return TRUE; }

ULONG_PTR DataOfEntry(HMENU menu, int place) {
    MENUITEMINFOW info = {};
    info.cbSize = sizeof info;
    info.fMask = MIIM_DATA;
    GetMenuItemInfoW(menu, static_cast<UINT>(place), TRUE, &info);
    return info.dwItemData;
}

// Each entry's address is what the library gave when it made the menu, whatever has become of the
// item since.
void ShowEntry(HWND owner, ULONG_PTR data, bool isSelected) {
    MEASUREITEMSTRUCT measure = {};
    measure.CtlType = ODT_MENU;
    measure.itemData = data;
    SendMessageW(owner, WM_MEASUREITEM, 0, reinterpret_cast<LPARAM>(&measure));
    DRAWITEMSTRUCT draw = {};
    draw.CtlType = ODT_MENU;
    draw.itemState = isSelected ? ODS_SELECTED : 0;
    draw.hDC = GetDC(nullptr);
    draw.rcItem = {0, 0, 80, 20};
    draw.itemData = data;
    SendMessageW(owner, WM_DRAWITEM, 0, reinterpret_cast<LPARAM>(&draw));
    ReleaseDC(nullptr, draw.hDC);
}

BOOL WINAPI ChooseFromMenu(HMENU menu, UINT, int, int, HWND owner, LPTPMPARAMS) {
    const int count = GetMenuItemCount(menu);
    const int chosen = menus++ % (count + 2);
    for (int i = 0; i < count; ++i) ShowEntry(owner, DataOfEntry(menu, i), i == chosen);
    return IsWindow(owner) && chosen <= count ? chosen : 0;
}

}  // namespace

void ReplaceWaiting() {
    ReplaceImport("SetTimer", reinterpret_cast<void*>(&NoTimer));
    ReplaceImport("KillTimer", reinterpret_cast<void*>(&NoTimerToKill));
    ReplaceImport("TrackPopupMenuEx", reinterpret_cast<void*>(&ChooseFromMenu));
}

}  // namespace kortest
