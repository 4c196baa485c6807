/* The header strip: a row or a column of labelled, resizable items.
 *
 * The grid creates two strips and controls them with the messages below; a host seldom needs them.
 * The class is registered when the first grid is created, under the instance that the grid was
 * created with, and stays registered when that grid is destroyed. A strip stores labels, sizes and
 * states, paints its items as raised buttons at the grid's zoom, and reports presses and border
 * drags to its parent. It never repaints after a message: whoever changes items must invalidate the
 * window after all changes.
 *
 * Positions and sizes are pixels along the strip, from its client origin: x for a horizontal strip,
 * y for a vertical one.
 *
 * A valid index is 0 to the item count, the count itself included: one spare item past the last can
 * be set and read but is not painted. Use indexes below the count. */
#ifndef KORCONTROLS_HEADER_H
#define KORCONTROLS_HEADER_H

#include <korcontrols/korcontrols.h>

#ifdef __cplusplus
extern "C" {
#endif

#define KORHEADER_CLASS L"korvane Header"

/* Window style: items run from top to bottom. Without it they run from left to right. */
#define HCS_VERTICAL 0x0002

/* Item states. Combine them with bitwise or. */
#define HIS_SELECTED 0x01 /* dark face, white text */
#define HIS_FRAMED 0x02   /* white line above or left, black lines below and right */

/* What a strip stores of an item: 8 bytes on 32-bit systems, 16 on 64-bit ones. */
typedef struct HeaderItemDesc {
    LPWSTR text; /* label; copied when set; a null pointer then means an empty label. "&"
                    underlines the next character */
    WORD size;   /* pixels along the strip */
} HeaderItemDesc;

/* HCM_INSERTITEM: inserts an item; later items move up by one.
 *   wParam  index; below 0 (or above the strip's allocated capacity) appends. Do not pass an index
 *           above the item count: the item would lie after a gap of empty items and would not be
 *           counted
 *   lParam  const HeaderItemDesc*; label and size are copied
 *   result  index of the new item, or -1 for a null pointer, lack of memory, or a strip without a
 *           record. If only the label could not be copied, the item is inserted with an empty
 *           label. */
#define HCM_INSERTITEM (WM_USER + 1)

/* HCM_DELETEITEM: removes an item; later items move down by one.
 *   wParam  index; the item count itself removes the last item
 *   lParam  0
 *   result  1, or 0 for a bad index, an empty strip, or a strip without a record */
#define HCM_DELETEITEM (WM_USER + 2)

/* HCM_SETITEM: replaces an item's label and size. Its state stays.
 *   wParam  index
 *   lParam  const HeaderItemDesc*; label and size are copied
 *   result  1, or 0 for a bad index, a null pointer, lack of memory (the item is unchanged then),
 *           or a strip without a record */
#define HCM_SETITEM (WM_USER + 3)

/* HCM_SETITEMSTATE: adds state bits, or clears them all.
 *   wParam  index
 *   lParam  HIS_SELECTED, HIS_FRAMED or both: added to those already set; 0 clears both
 *   result  1, or 0 for a bad index or a strip without a record */
#define HCM_SETITEMSTATE (WM_USER + 4)

/* HCM_GETITEMCOUNT: counts the items.
 *   wParam  0
 *   lParam  0
 *   result  the count, or -1 for a strip without a record */
#define HCM_GETITEMCOUNT (WM_USER + 5)

/* HCM_GETITEM: reads one item.
 *   wParam  index
 *   lParam  HeaderItemDesc* to fill; its text receives a LocalAlloc copy that the caller frees
 *           with LocalFree (an empty text for an item without a label)
 *   result  1, or 0 for a bad index, a null pointer, lack of memory, or a strip without a record;
 *           the structure is unchanged then */
#define HCM_GETITEM (WM_USER + 6)

/* HCM_GETITEMSIZE: reads one item's size.
 *   wParam  index
 *   lParam  0
 *   result  pixels along the strip, or -1 for a bad index or a strip without a record */
#define HCM_GETITEMSIZE (WM_USER + 7)

/* HCN_ITEMCLICK (posted to the parent): an item was pressed, or the pointer moved, with the button
 * still down, onto an item other than the one last reported for a move. The first move within the
 * pressed item therefore usually reports it a second time.
 *   wParam  the strip's window handle
 *   lParam  low word: index of the pressed item; high word: index of the item under the pointer */
#define HCN_ITEMCLICK (WM_USER + 587)

/* HCN_ITEMRESIZING (posted to the parent): an item's border is being dragged.
 *   wParam  the strip's window handle
 *   lParam  low word: position where the item begins; high word: position where it now ends */
#define HCN_ITEMRESIZING (WM_USER + 588)

/* HCN_ITEMRESIZED (posted to the parent): the border was released.
 *   wParam  the strip's window handle
 *   lParam  low word: index of the item; high word: its size in units (pixels at 100 % zoom) */
#define HCN_ITEMRESIZED (WM_USER + 589)

/* The messages as functions. */

static __inline int KorHeader_InsertItem(HWND header, int index, const HeaderItemDesc* item) {
    return (int)SendMessageW(header, HCM_INSERTITEM, (WPARAM)index, (LPARAM)item);
}

static __inline BOOL KorHeader_DeleteItem(HWND header, int index) {
    return (BOOL)SendMessageW(header, HCM_DELETEITEM, (WPARAM)index, 0);
}

static __inline BOOL KorHeader_SetItem(HWND header, int index, const HeaderItemDesc* item) {
    return (BOOL)SendMessageW(header, HCM_SETITEM, (WPARAM)index, (LPARAM)item);
}

static __inline BOOL KorHeader_SetItemState(HWND header, int index, DWORD state) {
    return (BOOL)SendMessageW(header, HCM_SETITEMSTATE, (WPARAM)index, (LPARAM)state);
}

static __inline int KorHeader_GetItemCount(HWND header) {
    return (int)SendMessageW(header, HCM_GETITEMCOUNT, 0, 0);
}

static __inline BOOL KorHeader_GetItem(HWND header, int index, HeaderItemDesc* item) {
    return (BOOL)SendMessageW(header, HCM_GETITEM, (WPARAM)index, (LPARAM)item);
}

static __inline int KorHeader_GetItemSize(HWND header, int index) {
    return (int)SendMessageW(header, HCM_GETITEMSIZE, (WPARAM)index, 0);
}

#ifdef __cplusplus
}
#endif

#endif /* KORCONTROLS_HEADER_H */
