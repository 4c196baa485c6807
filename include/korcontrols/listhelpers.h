/* Helpers for the platform's list view and tree view: setting all texts of a row, finding the row
 * under the pointer, deleting rows, finding the first selected row, adding a tree item.
 *
 * They keep no state and use only SendMessageW with the list view's and tree view's own messages,
 * so the controls notify their parents as usual. For a null or destroyed window each function
 * returns its failure result. */
#ifndef KORCONTROLS_LISTHELPERS_H
#define KORCONTROLS_LISTHELPERS_H

#include <korcontrols/korcontrols.h>

#include <commctrl.h> /* HTREEITEM */

#ifdef __cplusplus
extern "C" {
#endif

/* Replaces a row of a report-style list, or appends one.
 *   list       a list view
 *   index      the row to replace; a negative index appends a row
 *   texts      one text per column, at least one; the list copies them. A null pointer among them
 *              means an empty text; LPSTR_TEXTCALLBACKW is passed on.
 *   columns    number of columns in the low 8 bits; higher bits are ignored. Column 0 is always
 *              set: 0 means the same as 1.
 *   param      the row's lParam
 *   image      the row's index into the list's image lists
 *   state      LVIS_... bits, of which those in stateMask are set or cleared
 *   stateMask  LVIS_... bits
 *   result     the row's index (a sorted list may not have put it at the end), or -1 for a null
 *              array or a row that could not be set or inserted. A failure to set the texts of
 *              columns 1 and up is not reported. */
LONG KORCONTROLS_API KorListView_UpdateItem(HWND list, LONG index, const LPCWSTR* texts,
                                            DWORD columns, LPARAM param, LONG image, DWORD state,
                                            DWORD stateMask);

/* The row at the pointer's position when the last message was taken from the queue, as the platform
 * hit-tests it.
 *   list    a list view
 *   result  the row's index, or -1 for none */
LONG KORCONTROLS_API KorListView_GetIndexFromCurrentPosition(HWND list);

/* Deletes rows, from the last to the first.
 *   list          a list view
 *   selectedOnly  nonzero: deletes only selected rows
 *   freeParams    nonzero: each deleted row's lParam points to an object of the host and is
 *                 released before the row is deleted; an lParam of 0 is skipped. LVN_DELETEITEM is
 *                 sent after the release and must not read the object.
 *   result        nonzero when row 0 was deleted, else 0 (including for an empty list)
 *
 * Objects are released with the global operator delete on a pointer of unknown type. No destructor
 * runs, so the object must not need one. It must come from `new` (not `new[]`), from the heap that
 * the library deletes from. On Windows CE that is the core library's heap. On a desktop it is the
 * malloc heap of msvcrt.dll; a program built with mingw-w64 for msvcrt allocates there, both with
 * `new` and with malloc. A host with another runtime (ucrtbase.dll and a Visual C++ runtime of its
 * own have heaps of their own) or with a replaced operator new must pass 0 and release its objects
 * in LVN_DELETEITEM. */
LONG KORCONTROLS_API KorListView_DeleteAll(HWND list, BOOL selectedOnly, BOOL freeParams);

/* Finds the first selected row.
 *   list    a list view
 *   result  its index, or -1 when none is selected */
LONG KORCONTROLS_API KorListView_GetSelection(HWND list);

/* Inserts an item into a tree.
 *   tree         a tree view
 *   parent       the item above it; null or TVI_ROOT for the top level
 *   text         copied; LPSTR_TEXTCALLBACKW is passed on
 *   image        index into the tree's image list, for the normal and the selected state
 *   param        the item's lParam
 *   insertAfter  a sibling, or TVI_FIRST, TVI_LAST or TVI_SORT
 *   hasChildren  nonzero: the item shows an expand button even before it has children
 *   result       the item's handle, or null for a null text or if the item could not be inserted */
HTREEITEM KORCONTROLS_API KorTreeView_AddItem(HWND tree, HTREEITEM parent, LPCWSTR text, LONG image,
                                              LPARAM param, HTREEITEM insertAfter,
                                              BOOL hasChildren);

#ifdef __cplusplus
}
#endif

#endif /* KORCONTROLS_LISTHELPERS_H */
