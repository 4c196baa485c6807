// The view's switches: zoom, headers and grid lines.
#include <korcontrols/grid.h>

#include "base/windows_helpers.h"
#include "grid/layout.h"
#include "grid/state.h"
#include "zoom/zoom.h"

using namespace kor;

extern "C" DWORD KORCONTROLS_API ToggleViewStateOfHeaders(void) {
    grid.headersHidden = !grid.headersHidden;
    const int show = grid.headersHidden ? SW_HIDE : SW_SHOW;
    ShowWindow(grid.hwndColumnHeader, show);
    ShowWindow(grid.hwndRowHeader, show);
    ShowWindow(grid.hwndCornerButton, show);
    grid.cellsLeft = grid.headersHidden ? 0 : grid.rowHeaderWidth;
    grid.columnHeaderHeight = grid.headersHidden ? 0 : HeaderHeightAt(zoomLevel);
    grid.cellsTop = grid.equationBarHeight + grid.columnHeaderHeight;
    const RECT client = ClientRectOf(grid.hwndGrid);
    LayOutAgain(WordPair(client.right - grid.cellsLeft, client.bottom - grid.cellsTop));
    return grid.headersHidden;
}

extern "C" DWORD KORCONTROLS_API SetGridZoomLevel(DWORD level) {
    if (level == 0) return grid.headersHidden;
    zoomLevel = level;
    grid.headersHidden = !grid.headersHidden;  // the toggle below inverts it again
    return ToggleViewStateOfHeaders();
}

extern "C" DWORD KORCONTROLS_API ToggleGridLines(void) {
    grid.gridLinesHidden = !grid.gridLinesHidden;
    RedrawHeadersAndCells();
    return 1;
}
