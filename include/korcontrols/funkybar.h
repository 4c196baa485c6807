/* The function bar: one line that shows the current one of some items and offers all of them in a
 * menu.
 *
 * The bar shows the current item's image, its text in a bold font, and a small arrow. A tap opens a
 * popup menu with all items below the bar; choosing one makes it the current one and tells the
 * parent (FBN_SELECTED). Create it as a child window of class KORFUNKYBAR_CLASS after
 * InitFunkyControl, set an image list if items have images, and insert items. The first item
 * becomes the current one by itself.
 *
 * Items, the image list and the current item are one per process, and so should the bar be. Further
 * bars would show the same items; the first one that is destroyed takes the items, the font and the
 * arrow of all with it, and those that stay draw the items of later in the system's font.
 *
 * Indexes count from 0 and are signed. The count is the number of items. */
#ifndef KORCONTROLS_FUNKYBAR_H
#define KORCONTROLS_FUNKYBAR_H

#include <korcontrols/korcontrols.h>

#include <commctrl.h> /* HIMAGELIST */

#ifdef __cplusplus
extern "C" {
#endif

#define KORFUNKYBAR_CLASS L"FunkyBarControl"

/* ---- Types ---- */

/* Which members of a FunkyBarItemDesc count, combined by "or". */
#define FBIF_TEXT 0x1
#define FBIF_IMAGE 0x2
#define FBIF_COLOURS 0x4 /* both colours */
#define FBIF_USERDATA 0x8

/* The index that inserts at the end, whatever the count is. */
#define KORFUNKYBAR_APPEND 0x7FFFFFFF

/* An item as messages carry it. 32 bytes on 32-bit systems, 40 on 64-bit ones. */
typedef struct FunkyBarItemDesc {
    DWORD mask;                /* FBIF_...; other bits mean nothing */
    LONG index;                /* where to insert; which item to get */
    LPWSTR text;               /* insert: the text, which is copied ("&" underlines the next
                                  character); get: a buffer to fill */
    LONG textCapacity;         /* get: characters that the buffer has room for */
    LONG image;                /* index into the image list */
    COLORREF textColour;       /* of the text in the bar and in the menu */
    COLORREF backgroundColour; /* behind the text in the bar; the menu shows none */
    DWORD userData;            /* the host's own */
} FunkyBarItemDesc;

/* What FBN_SELECTED points to. 16 bytes on 32-bit systems, 32 on 64-bit ones. */
typedef struct FunkyBarNotification {
    NMHDR header; /* hwndFrom the bar, idFrom its control id, code FBN_SELECTED */
    LONG index;   /* of the item that is the current one now */
} FunkyBarNotification;

/* ---- Messages ---- */

/* FBM_INSERTITEM: inserts an item; only the places at both ends and behind the first item can be
 * reached. Without a current item the first one becomes it, and only then the bar is repainted.
 *   wParam  0
 *   lParam  const FunkyBarItemDesc*, FBIF_TEXT among its bits. Text and members named by the mask
 *           are copied. Index 0 inserts before the first item, 1 behind it, and an index of the
 *           count or above behind the last one; into an empty bar any index does.
 *   result  the count before the insertion, or -1 for a null pointer, a mask without FBIF_TEXT, a
 *           null text, another index (below 0; 2 to the count less 1) or no memory: nothing is
 *           inserted then */
#define FBM_INSERTITEM (WM_USER + 6050)

/* FBM_GETITEM: reads an item.
 *   wParam  0
 *   lParam  FunkyBarItemDesc*; mask says what to fill in, index which item. What the item was
 *           inserted without is 0. The text is copied into the caller's buffer up to textCapacity
 *           characters, the rest of the buffer is filled with zeros; a text of that length or more
 *           has NO terminator in it (KorFunkyBar_GetItemText sees to one). A capacity of 0 or below
 *           copies nothing.
 *   result  1, or 0 for a null pointer, a bad index, or FBIF_TEXT with a null text; nothing is
 *           filled in then */
#define FBM_GETITEM (WM_USER + 6051)

/* FBM_SETIMAGELIST: sets the list that the items' images come from. The host keeps it: it must live
 * as long as the bar, or until another one is set, and is never destroyed by the bar. It is kept
 * when the bar goes, for the next one. Nothing is repainted.
 *   wParam  0
 *   lParam  HIMAGELIST; null changes nothing
 *   result  the list before, null without one; null when lParam is null */
#define FBM_SETIMAGELIST (WM_USER + 6052)

/* FBM_GETIMAGELIST: reads it.
 *   wParam  0
 *   lParam  0
 *   result  HIMAGELIST, null without one */
#define FBM_GETIMAGELIST (WM_USER + 6053)

/* FBM_DELETEITEM: removes an item. When it was the current one, the first of those left becomes the
 * current one (none when there is none left) and the bar is repainted; the parent is not told. The
 * copy of the item's text stays allocated, so a host that changes its items again and again uses
 * FBM_DELETEALL.
 *   wParam  index; a bad one changes nothing
 *   lParam  0
 *   result  0 */
#define FBM_DELETEITEM (WM_USER + 6054)

/* FBM_DELETEALL: removes all items and repaints the bar.
 *   wParam  0
 *   lParam  0
 *   result  1, or 0 when there were none */
#define FBM_DELETEALL (WM_USER + 6055)

/* FBM_GETCOUNT: counts the items.
 *   wParam  0
 *   lParam  0
 *   result  the count */
#define FBM_GETCOUNT (WM_USER + 6056)

/* FBM_SETCURSEL: makes an item the current one, tells the parent (FBN_SELECTED, also when it was
 * the current one before) and repaints the bar.
 *   wParam  index. The count and above, and -1, change nothing. -2 and below leave the bar without
 *           a current item; the parent is not told and nothing is repainted.
 *   lParam  0
 *   result  1, or 0 for an empty bar and for any index that is not an item's */
#define FBM_SETCURSEL (WM_USER + 6057)

/* FBM_GETCURSEL: reads which item is the current one.
 *   wParam  0
 *   lParam  0
 *   result  index, -1 without a current item */
#define FBM_GETCURSEL (WM_USER + 6058)

/* ---- Notification ---- */

/* FBN_SELECTED, sent to the parent as WM_NOTIFY: an item was chosen from the menu, or with
 * FBM_SETCURSEL. The parent may change items or destroy the bar inside.
 *   wParam  the bar's control id
 *   lParam  const FunkyBarNotification*, valid until the parent returns
 *   result  ignored */
#define FBN_SELECTED 0x100

/* ---- Functions ---- */

/* Registers the bar's window class under `instance`, the host's own.
 *   result  the class atom; 0 for a null instance, and when the class could not be registered, as
 *           for the second call with one instance */
DWORD KORCONTROLS_API InitFunkyControl(HINSTANCE instance);

/* ---- The messages as functions ---- */

static __inline LONG KorFunkyBar_InsertItem(HWND bar, const FunkyBarItemDesc* item) {
    return (LONG)SendMessageW(bar, FBM_INSERTITEM, 0, (LPARAM)item);
}

static __inline BOOL KorFunkyBar_GetItem(HWND bar, FunkyBarItemDesc* item) {
    return (BOOL)SendMessageW(bar, FBM_GETITEM, 0, (LPARAM)item);
}

/* Reads an item's text into a buffer of `capacity` characters, cut so that its terminator fits.
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
