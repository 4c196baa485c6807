/* The first and only thing that this file includes. */
#include <korcontrols/legend.h>

HWND useLegendHeaderAlone(HWND graph);

HWND useLegendHeaderAlone(HWND graph)
{
    const WCHAR *name = KORLEGEND_CLASS;
    return name[0] ? GetDlgItem(graph, KORLEGEND_ID) : 0;
}
