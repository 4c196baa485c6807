/* Helpers over the platform's list view and tree view: filling a row with all its texts, the row
 * under the pointer, deleting rows, the first selected row, adding a tree item.
 *
 * They keep no state and reach the controls by SendMessageW alone, with the list view's and tree
 * view's own messages; what those notify to their parents they notify here as well. A null window
 * or one that is gone gives each function's failure result. */
#ifndef KORCONTROLS_LISTHELPERS_H
#define KORCONTROLS_LISTHELPERS_H

#include <korcontrols/korcontrols.h>

#include <commctrl.h> /* HTREEITEM */

#ifdef __cplusplus
extern "C" {
#endif

/* Replaces a row of a report-style list, or appends one.
 *   list       a list view
 *   index      the row to replace; below 0 appends a row
 *   texts      one text per column, and at least one; the list copies them. A null one among them
 *              is an empty text; LPSTR_TEXTCALLBACKW is passed on.
 *   columns    number of columns in the low 8 bits, higher bits are ignored. Column 0 is always
 *              set: 0 means the same as 1.
 *   param      the row's lParam
 *   image      the row's index into the list's image lists
 *   state      LVIS_... bits, of which those in stateMask are set or cleared
 *   stateMask  LVIS_... bits
 *   result     the row's index (a sorted list may have put it elsewhere than at the end), or -1 for
 *              a null array or a row that could not be set or inserted. Whether the texts of
 *              columns 1 and up could be set is not told. */
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
 *   selectedOnly  nonzero: only those that are selected
 *   freeParams    nonzero: each deleted row's lParam is an object of the host's, and is released
 *                 before the row is deleted; 0 is left alone. LVN_DELETEITEM comes after that and
 *                 must not read it.
 *   result        nonzero when row 0 was deleted, else 0 (also for an empty list)
 *
 * Releasing means the global operator delete on a pointer of unknown type: no destructor runs, so
 * the object must not need one, and it must come from `new` (not `new[]`) of the heap that the
 * library deletes from. That is, on Windows CE, the core library's. On a desktop it is the malloc
 * heap of msvcrt.dll; `new` in a program of mingw-w64's for msvcrt allocates there, and so does
 * malloc in such a program. A host with another runtime (ucrtbase.dll and a Visual C++ runtime of
 * its own have heaps of their own) or with a replaced operator new passes 0, and releases its
 * objects when LVN_DELETEITEM tells it so. */
LONG KORCONTROLS_API KorListView_DeleteAll(HWND list, BOOL selectedOnly, BOOL freeParams);

/* The first selected row.
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
 *   hasChildren  nonzero: the item has a button to expand it before it has any child
 *   result       the item's handle, or null for a null text or when it could not be inserted */
HTREEITEM KORCONTROLS_API KorTreeView_AddItem(HWND tree, HTREEITEM parent, LPCWSTR text, LONG image,
                                              LPARAM param, HTREEITEM insertAfter,
                                              BOOL hasChildren);

#ifdef __cplusplus
}
#endif

#endif /* KORCONTROLS_LISTHELPERS_H */
