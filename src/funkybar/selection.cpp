#include "funkybar/selection.h"

#include "funkybar/items.h"

namespace kor {

namespace {

// The host may do anything inside the notification: change items, select another one, destroy the
// window.
void NotifySelected(HWND hwnd, int32_t index) {
    HWND parent = GetParent(hwnd);
    if (!parent) return;
    const LONG id = GetWindowLongW(hwnd, GWL_ID);
    FunkyBarNotification notification = {};
    notification.header.hwndFrom = hwnd;
    notification.header.idFrom = static_cast<UINT_PTR>(id);
    notification.header.code = FBN_SELECTED;
    notification.index = index;
    SendMessageW(parent, WM_NOTIFY, static_cast<WPARAM>(id),
                 reinterpret_cast<LPARAM>(&notification));
}

}  // namespace

void RepaintBar(HWND hwnd) {
    InvalidateRect(hwnd, nullptr, TRUE);
    UpdateWindow(hwnd);
}

int32_t SelectItem(HWND hwnd, int32_t index) {
    if (!funkyBar.first || index == kNoItem || index > funkyBar.count - 1) return 0;
    funkyBar.current = ItemAt(index);
    if (!funkyBar.current) return 0;
    NotifySelected(hwnd, index);
    if (IsWindow(hwnd)) RepaintBar(hwnd);
    return 1;
}

}  // namespace kor
