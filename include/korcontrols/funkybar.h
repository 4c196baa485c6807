/* The function bar: one line that shows the current item of a list and offers all items in a menu.
 *
 * The bar shows the current item's image, its text in a bold font, and a small arrow. A click opens
 * a popup menu with all items below the bar. Choosing one makes it current and notifies the parent
 * (FBN_SELECTED). Create the bar as a child window of class KORFUNKYBAR_CLASS after
 * InitFunkyControl, set an image list if items have images, and insert items. The first item
 * becomes current automatically.
 *
 * There is one list of items, one image list and one current item per process, so create only one
 * bar. Further bars show the same items. The first bar to be destroyed takes the items, the font
 * and the arrow of all bars with it; the remaining bars draw later items in the system font.
 *
 * Indexes start at 0 and are signed. "The count" is the number of items. */
#ifndef KORCONTROLS_FUNKYBAR_H
#define KORCONTROLS_FUNKYBAR_H

#include <korcontrols/korcontrols.h>

#include <commctrl.h> /* HIMAGELIST */

#ifdef __cplusplus
extern "C" {
#endif

#define KORFUNKYBAR_CLASS L"FunkyBarControl"

/* ---- Types ---- */

/* Which members of a FunkyBarItemDesc are used. Combine them with bitwise or. */
#define FBIF_TEXT 0x1
#define FBIF_IMAGE 0x2
#define FBIF_COLOURS 0x4 /* both colours */
#define FBIF_USERDATA 0x8

/* The index that inserts at the end, whatever the count is. */
#define KORFUNKYBAR_APPEND 0x7FFFFFFF

/* An item as messages carry it. 32 bytes on 32-bit systems, 40 on 64-bit ones. */
typedef struct FunkyBarItemDesc {
    DWORD mask;                /* FBIF_...; other bits are ignored */
    LONG index;                /* insert: the position; get: the item */
    LPWSTR text;               /* insert: the text, which is copied ("&" underlines the next
                                  character); get: a buffer to fill */
    LONG textCapacity;         /* get: size of the buffer in characters */
    LONG image;                /* index into the image list */
    COLORREF textColour;       /* of the text in the bar and in the menu */
    COLORREF backgroundColour; /* behind the text in the bar; not used in the menu */
    DWORD userData;            /* for the host's own use */
} FunkyBarItemDesc;

/* What FBN_SELECTED points to. 16 bytes on 32-bit systems, 32 on 64-bit ones. */
typedef struct FunkyBarNotification {
    NMHDR header; /* hwndFrom the bar, idFrom its control id, code FBN_SELECTED */
    LONG index;   /* the item that is now current */
} FunkyBarNotification;

/* ---- Messages ---- */

/* FBM_INSERTITEM: inserts an item. Only the positions at both ends and after the first item can be
 * reached. If there is no current item, the first item becomes current; only then is the bar
 * repainted.
 *   wParam  0
 *   lParam  const FunkyBarItemDesc*, FBIF_TEXT among its bits. The text and the members named by
 *           the mask are copied. Index 0 inserts before the first item, 1 after it, and an index of
 *           the count or above after the last item. An empty bar accepts any index.
 *   result  the count before the insertion, or -1 for a null pointer, a mask without FBIF_TEXT, a
 *           null text, any other index (below 0; 2 to the count less 1) or lack of memory: nothing
 *           is inserted then */
#define FBM_INSERTITEM (WM_USER + 6050)

/* FBM_GETITEM: reads an item.
 *   wParam  0
 *   lParam  FunkyBarItemDesc*; mask says what to fill in, index which item to read. Members that
 *           the item was inserted without are 0. Up to textCapacity characters of the text are
 *           copied into the caller's buffer, and the rest of the buffer is filled with zeros. A
 *           text of that length or longer is NOT terminated (KorFunkyBar_GetItemText always
 *           terminates it). A capacity of 0 or less copies nothing.
 *   result  1, or 0 for a null pointer, a bad index, or FBIF_TEXT with a null text; nothing is
 *           filled in then */
#define FBM_GETITEM (WM_USER + 6051)

/* FBM_SETIMAGELIST: sets the list that the items' images come from. The host owns it: the list must
 * live as long as the bar, or until another one is set, and the bar never destroys it. It stays set
 * when the bar is destroyed, for the next bar. Nothing is repainted.
 *   wParam  0
 *   lParam  HIMAGELIST; null changes nothing
 *   result  the previous list, or null without one; null when lParam is null */
#define FBM_SETIMAGELIST (WM_USER + 6052)

/* FBM_GETIMAGELIST: reads the image list.
 *   wParam  0
 *   lParam  0
 *   result  HIMAGELIST, or null without one */
#define FBM_GETIMAGELIST (WM_USER + 6053)

/* FBM_DELETEITEM: removes an item. If it was current, the first of the remaining items becomes
 * current (none if the bar is empty now) and the bar is repainted. The parent is not notified. The
 * copy of the item's text stays allocated, so a host that changes its items repeatedly should use
 * FBM_DELETEALL.
 *   wParam  index; a bad index changes nothing
 *   lParam  0
 *   result  0 */
#define FBM_DELETEITEM (WM_USER + 6054)

/* FBM_DELETEALL: removes all items and repaints the bar.
 *   wParam  0
 *   lParam  0
 *   result  1, or 0 when there were no items */
#define FBM_DELETEALL (WM_USER + 6055)

/* FBM_GETCOUNT: counts the items.
 *   wParam  0
 *   lParam  0
 *   result  the count */
#define FBM_GETCOUNT (WM_USER + 6056)

/* FBM_SETCURSEL: makes an item current, notifies the parent (FBN_SELECTED, even if the item was
 * already current) and repaints the bar.
 *   wParam  index. An index of the count or above, or of -1, changes nothing. An index of -2 or
 *           below leaves the bar without a current item; the parent is not notified and nothing is
 *           repainted.
 *   lParam  0
 *   result  1, or 0 for an empty bar and for any index that is not that of an item */
#define FBM_SETCURSEL (WM_USER + 6057)

/* FBM_GETCURSEL: reads which item is current.
 *   wParam  0
 *   lParam  0
 *   result  index, or -1 without a current item */
#define FBM_GETCURSEL (WM_USER + 6058)

/* ---- Notification ---- */

/* FBN_SELECTED, sent to the parent as WM_NOTIFY: an item was chosen from the menu, or with
 * FBM_SETCURSEL. While handling it, the parent may change items or destroy the bar.
 *   wParam  the bar's control id
 *   lParam  const FunkyBarNotification*, valid until the parent returns
 *   result  ignored */
#define FBN_SELECTED 0x100

/* ---- Functions ---- */

/* Registers the bar's window class under the host's `instance`.
 *   result  the class atom; 0 for a null instance, and when the class could not be registered, for
 *           example in a second call with the same instance */
DWORD KORCONTROLS_API InitFunkyControl(HINSTANCE instance);

/* ---- The messages as functions ---- */

static __inline LONG KorFunkyBar_InsertItem(HWND bar, const FunkyBarItemDesc* item) {
    return (LONG)SendMessageW(bar, FBM_INSERTITEM, 0, (LPARAM)item);
}

static __inline BOOL KorFunkyBar_GetItem(HWND bar, FunkyBarItemDesc* item) {
    return (BOOL)SendMessageW(bar, FBM_GETITEM, 0, (LPARAM)item);
}

/* Reads an item's text into a buffer of `capacity` characters, truncated so that its terminator
 * fits.
 *   result  TRUE, or FALSE for a bad index, a null buffer or a capacity below 1 */
static __inline BOOL KorFunkyBar_GetItemText(HWND bar, LONG index, LPWSTR buffer, LONG capacity) {
    FunkyBarItemDesc item;
    if (!buffer || capacity < 1) return FALSE;
    item.mask = FBIF_TEXT;
    item.index = index;
    item.text = buffer;
    item.textCapacity = capacity - 1;
    buffer[capacity - 1] = 0;
    return (BOOL)SendMessageW(bar, FBM_GETITEM, 0, (LPARAM)&item);
}

static __inline HIMAGELIST KorFunkyBar_SetImageList(HWND bar, HIMAGELIST images) {
    return (HIMAGELIST)SendMessageW(bar, FBM_SETIMAGELIST, 0, (LPARAM)images);
}

static __inline HIMAGELIST KorFunkyBar_GetImageList(HWND bar) {
    return (HIMAGELIST)SendMessageW(bar, FBM_GETIMAGELIST, 0, 0);
}

static __inline void KorFunkyBar_DeleteItem(HWND bar, LONG index) {
    SendMessageW(bar, FBM_DELETEITEM, (WPARAM)index, 0);
}

static __inline BOOL KorFunkyBar_DeleteAll(HWND bar) {
    return (BOOL)SendMessageW(bar, FBM_DELETEALL, 0, 0);
}

static __inline LONG KorFunkyBar_GetCount(HWND bar) {
    return (LONG)SendMessageW(bar, FBM_GETCOUNT, 0, 0);
}

static __inline BOOL KorFunkyBar_SetCurrent(HWND bar, LONG index) {
    return (BOOL)SendMessageW(bar, FBM_SETCURSEL, (WPARAM)index, 0);
}

static __inline LONG KorFunkyBar_GetCurrent(HWND bar) {
    return (LONG)SendMessageW(bar, FBM_GETCURSEL, 0, 0);
}

#ifdef __cplusplus
}
#endif

#endif /* KORCONTROLS_FUNKYBAR_H */
