#include "funkybar/menu.h"

#include "funkybar/drawing.h"
#include "funkybar/items.h"
#include "funkybar/layout.h"
#include "funkybar/selection.h"

namespace kor {

namespace {

// An entry's command is its item's index plus 1: 0 means that nothing was chosen.
void AppendEntries(HMENU menu) {
    UINT_PTR command = 1;
    for (const FunkyBarItem* item = funkyBar.first; item; item = item->next, ++command) {
        AppendMenuW(menu, MF_OWNERDRAW, command, reinterpret_cast<LPCWSTR>(item));
    }
}

// The item of an entry's data; null when it is no longer in the list.
const FunkyBarItem* ItemOfEntry(ULONG_PTR data) {
    return ItemAt(IndexOfItem(reinterpret_cast<const void*>(data)));
}

// The chosen command, 0 for none.
int32_t TrackMenu(HWND hwnd, HMENU menu, int top) {
    funkyBar.menuOpen = true;
    const BOOL command = TrackPopupMenuEx(menu, TPM_RETURNCMD, kMenuLeft, top, hwnd, nullptr);
    funkyBar.menuOpen = false;
    return command;
}

}  // namespace

LRESULT OpenItemMenu(HWND hwnd) {
    if (funkyBar.menuOpen) return 0;
    RECT bar = {};
    GetWindowRect(hwnd, &bar);
    HMENU menu = CreatePopupMenu();
    if (!menu) return 0;
    AppendEntries(menu);
    const int32_t command = TrackMenu(hwnd, menu, bar.bottom);
    if (command > 0 && IsWindow(hwnd)) SelectItem(hwnd, command - 1);
    DestroyMenu(menu);
    return 0;
}

LRESULT OnMeasureEntry(HWND hwnd, MEASUREITEMSTRUCT* entry) {
    if (!entry) return 0;
    const FunkyBarItem* item = ItemOfEntry(entry->itemData);
    const Size size = item ? MeasureEntry(hwnd, *item) : Size{};
    entry->itemWidth = static_cast<UINT>(size.width);
    entry->itemHeight = static_cast<UINT>(size.height);
    return 1;
}

LRESULT OnDrawEntry(const DRAWITEMSTRUCT* entry) {
    if (!entry) return 0;
    const bool selected = (entry->itemState & ODS_SELECTED) != 0;
    DrawEntry(entry->hDC, entry->rcItem, ItemOfEntry(entry->itemData), selected);
    return 1;
}

}  // namespace kor
