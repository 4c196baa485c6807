// Items of tree views.
#include <korcontrols/listhelpers.h>

#include "listhelpers/item_text.h"

extern "C" HTREEITEM KORCONTROLS_API KorTreeView_AddItem(HWND tree, HTREEITEM parent, LPCWSTR text,
                                                         LONG image, LPARAM param,
                                                         HTREEITEM insertAfter, BOOL hasChildren) {
    if (!text || !IsWindow(tree)) return nullptr;
    TVINSERTSTRUCTW insertion = {};
    insertion.hParent = parent;
    insertion.hInsertAfter = insertAfter;
    TVITEMW& item = insertion.item;
    item.mask = TVIF_TEXT | TVIF_IMAGE | TVIF_PARAM | TVIF_SELECTEDIMAGE;
    item.pszText = kor::WritableText(text);
    item.cchTextMax = kor::TextLength(text);
    item.iImage = image;
    item.iSelectedImage = image;
    item.lParam = param;
    if (hasChildren) {
        item.mask |= TVIF_CHILDREN;
        item.cChildren = 1;
    }
    return reinterpret_cast<HTREEITEM>(
        SendMessageW(tree, TVM_INSERTITEMW, 0, reinterpret_cast<LPARAM>(&insertion)));
}
