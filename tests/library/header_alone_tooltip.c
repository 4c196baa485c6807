/* The first and only thing that this file includes. */
#include <korcontrols/tooltip.h>

HWND useToolTipHeaderAlone(HWND parent);

HWND useToolTipHeaderAlone(HWND parent)
{
    const WCHAR *name = KORTOOLTIP_CLASS;
    HWND toolTip = GetDlgItem(parent, KORTOOLTIP_ID);
    ToolTipRequest request;
    request.text = name;
    request.x = 0;
    request.y = 0;
    request.limit = 100;
    KorToolTip_Show(toolTip, &request);
    KorToolTip_Hide(toolTip);
    return toolTip;
}
