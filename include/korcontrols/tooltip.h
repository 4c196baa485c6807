/* The tooltip: a small framed text just above a point. The chart creates one as a child of its own
 * parent to show the value under the pointer. The tooltip outlives the chart and is destroyed with
 * the parent. The class is registered when the first chart is created; a host may then create
 * tooltips of its own, under the chart's instance. */
#ifndef KORCONTROLS_TOOLTIP_H
#define KORCONTROLS_TOOLTIP_H

#include <korcontrols/korcontrols.h>

#ifdef __cplusplus
extern "C" {
#endif

#define KORTOOLTIP_CLASS L"KORVANE Corporation ToolTipControl"
#define KORTOOLTIP_ID 10 /* among the children of the chart's parent */

/* What to show and where, in client coordinates of the tooltip's parent. 16 bytes on 32-bit
 * systems, 24 on 64-bit ones. */
typedef struct ToolTipRequest {
    LPCWSTR text; /* may have line breaks; of more than 128 characters only 127 are shown */
    LONG x;       /* left edge */
    LONG y;       /* bottom edge */
    LONG limit;   /* the right edge stays below this */
} ToolTipRequest;

/* TIPM_SHOW: sets the text, sizes and positions the tooltip, and shows it.
 *   wParam  0
 *   lParam  const ToolTipRequest*; null does nothing
 *   result  0 */
#define TIPM_SHOW (WM_USER + 5000)

/* TIPM_HIDE: hides the tooltip.
 *   wParam, lParam  0
 *   result          0 */
#define TIPM_HIDE (WM_USER + 5001)

static __inline void KorToolTip_Show(HWND toolTip, const ToolTipRequest* request) {
    SendMessageW(toolTip, TIPM_SHOW, 0, (LPARAM)request);
}

static __inline void KorToolTip_Hide(HWND toolTip) { SendMessageW(toolTip, TIPM_HIDE, 0, 0); }

#ifdef __cplusplus
}
#endif

#endif /* KORCONTROLS_TOOLTIP_H */
