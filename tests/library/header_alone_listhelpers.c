/* The first and only thing that this file includes. */
#include <korcontrols/listhelpers.h>

LONG useListHelpersHeaderAlone(HWND list, HWND tree);

LONG useListHelpersHeaderAlone(HWND list, HWND tree)
{
    LPCWSTR texts[1];
    texts[0] = L"text";
    KorListView_UpdateItem(list, -1, texts, 1, 0, 0, 0, 0);
    KorListView_DeleteAll(list, TRUE, FALSE);
    KorTreeView_AddItem(tree, TVI_ROOT, L"text", 0, 0, TVI_LAST, FALSE);
    return KorListView_GetSelection(list) + KorListView_GetIndexFromCurrentPosition(list);
}
