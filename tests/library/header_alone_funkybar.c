/* The first and only thing that this file includes. */
#include <korcontrols/funkybar.h>

LONG useFunkyBarHeaderAlone(HWND bar, HIMAGELIST images);

LONG useFunkyBarHeaderAlone(HWND bar, HIMAGELIST images)
{
    FunkyBarItemDesc item = {FBIF_TEXT | FBIF_IMAGE | FBIF_COLOURS | FBIF_USERDATA,
                             KORFUNKYBAR_APPEND, 0, 0, 0, 0, 0, 0};
    WCHAR text[8];
    item.text = text;
    InitFunkyControl(0);
    KorFunkyBar_InsertItem(bar, &item);
    KorFunkyBar_GetItem(bar, &item);
    KorFunkyBar_GetItemText(bar, 0, text, 8);
    if (KorFunkyBar_SetImageList(bar, images) == KorFunkyBar_GetImageList(bar)) return -1;
    KorFunkyBar_DeleteItem(bar, 0);
    KorFunkyBar_DeleteAll(bar);
    KorFunkyBar_SetCurrent(bar, 0);
    return KorFunkyBar_GetCurrent(bar) + KorFunkyBar_GetCount(bar);
}
