// Rows of list views.
#include <korcontrols/listhelpers.h>

#include <new>

#include "base/windows_helpers.h"
#include "listhelpers/item_text.h"

namespace kor {

namespace {

constexpr LONG kNoRow = -1;
constexpr DWORD kColumnMask = 0xFF;

LRESULT Send(HWND list, UINT message, LONG row, const void* argument) {
    return SendMessageW(list, message, static_cast<WPARAM>(row),
                        reinterpret_cast<LPARAM>(argument));
}

LONG RowCount(HWND list) { return static_cast<LONG>(SendMessageW(list, LVM_GETITEMCOUNT, 0, 0)); }

bool IsSelected(HWND list, LONG row) {
    return SendMessageW(list, LVM_GETITEMSTATE, static_cast<WPARAM>(row), LVIS_SELECTED) != 0;
}

// Sets a whole row, or appends it when its index is below 0. Returns the row's index, or kNoRow.
LONG PlaceRow(HWND list, LVITEMW& row) {
    if (row.iItem >= 0) return Send(list, LVM_SETITEMW, 0, &row) ? row.iItem : kNoRow;
    row.iItem = RowCount(list);
    return static_cast<LONG>(Send(list, LVM_INSERTITEMW, 0, &row));
}

void SetColumnText(HWND list, LONG row, LONG column, LPCWSTR text) {
    LVITEMW item = {};
    item.iSubItem = column;
    item.pszText = WritableText(text);
    Send(list, LVM_SETITEMTEXTW, row, &item);
}

// A row that cannot be read has nothing to release.
void ReleaseParam(HWND list, LONG row) {
    LVITEMW item = {};
    item.mask = LVIF_PARAM;
    item.iItem = row;
    Send(list, LVM_GETITEMW, 0, &item);
    ::operator delete(reinterpret_cast<void*>(item.lParam));
}

}  // namespace

}  // namespace kor

using namespace kor;

extern "C" LONG KORCONTROLS_API KorListView_UpdateItem(HWND list, LONG index, const LPCWSTR* texts,
                                                       DWORD columns, LPARAM param, LONG image,
                                                       DWORD state, DWORD stateMask) {
    if (!texts || !IsWindow(list)) return kNoRow;
    LVITEMW item = {};
    item.mask = LVIF_TEXT | LVIF_IMAGE | LVIF_PARAM | LVIF_STATE;
    item.iItem = index;
    item.pszText = WritableText(texts[0]);
    item.cchTextMax = TextLength(texts[0]);
    item.iImage = image;
    item.lParam = param;
    item.state = state;
    item.stateMask = stateMask;
    const LONG row = PlaceRow(list, item);
    if (row == kNoRow) return kNoRow;
    const auto columnCount = static_cast<LONG>(columns & kColumnMask);
    for (LONG column = 1; column < columnCount; ++column) {
        SetColumnText(list, row, column, texts[column]);
    }
    return row;
}

extern "C" LONG KORCONTROLS_API KorListView_GetIndexFromCurrentPosition(HWND list) {
    if (!IsWindow(list)) return kNoRow;
    const auto position = static_cast<LPARAM>(GetMessagePos());
    // On a desktop with several displays a position may be negative.
    LVHITTESTINFO hit = {};
    hit.pt = {SignedLowWord(position), SignedHighWord(position)};
    MapWindowPoints(nullptr, list, &hit.pt, 1);
    return static_cast<LONG>(Send(list, LVM_HITTEST, 0, &hit));
}

extern "C" LONG KORCONTROLS_API KorListView_DeleteAll(HWND list, BOOL selectedOnly,
                                                      BOOL freeParams) {
    if (!IsWindow(list)) return 0;
    LONG result = 0;
    for (LONG row = RowCount(list) - 1; row >= 0; --row) {
        result = 0;
        if (selectedOnly && !IsSelected(list, row)) continue;
        if (freeParams) ReleaseParam(list, row);
        result = static_cast<LONG>(SendMessageW(list, LVM_DELETEITEM, static_cast<WPARAM>(row), 0));
    }
    return result;
}

extern "C" LONG KORCONTROLS_API KorListView_GetSelection(HWND list) {
    if (!IsWindow(list)) return kNoRow;
    const LONG count = RowCount(list);
    for (LONG row = 0; row < count; ++row) {
        if (IsSelected(list, row)) return row;
    }
    return kNoRow;
}
