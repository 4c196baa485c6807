/* The first and only thing that this file includes. */
#include <korcontrols/header.h>

int useHeaderHeaderAlone(HWND header);

int useHeaderHeaderAlone(HWND header)
{
    HeaderItemDesc item;
    item.text = 0;
    item.size = 20;
    KorHeader_InsertItem(header, -1, &item);
    KorHeader_SetItem(header, 0, &item);
    KorHeader_GetItem(header, 0, &item);
    KorHeader_SetItemState(header, 0, HIS_SELECTED | HIS_FRAMED);
    KorHeader_DeleteItem(header, 0);
    return KorHeader_GetItemCount(header) + KorHeader_GetItemSize(header, 0);
}
