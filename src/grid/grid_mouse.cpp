// A press sets the anchor and starts a timer; moves span the block from the anchor to the pointer;
// the release stops the timer and clears the anchor. The anchor alone says that a drag is under
// way: after a release with Shift held, moves without a button go on extending.
#include "grid/grid_mouse.h"

#include <algorithm>

#include "grid/grid_drawing.h"
#include "grid/grid_notify.h"
#include "grid/grid_scrolling.h"
#include "grid/grid_selection.h"
#include "grid/grid_sizes.h"
#include "platform/windows_helpers.h"

namespace kor {

namespace {

constexpr UINT kAutoScrollInterval = 500;  // milliseconds
constexpr int kAutoScrollMargin = 10;

void FocusGridByMouse() {
    grid.focusByMouse = true;
    SetFocus(grid.hwndGrid);
    grid.focusByMouse = false;
}

GridSelection BlockFromAnchor(GridCellPair hit) {
    return BlockBetween(grid.anchorColumn, grid.anchorRow, hit.column, hit.row);
}

}  // namespace

LRESULT OnGridButtonDown(WPARAM keys, int x, int y) {
    const RECT client = ClientRectOf(grid.hwndGrid);
    if (x > client.right && y > client.bottom) return 0;
    FocusGridByMouse();
    SetCapture(grid.hwndGrid);
    const GridCellPair hit = CellFromPoint(x, y);
    grid.lastMouseX = x;
    grid.lastMouseY = y;
    SetTimer(grid.hwndGrid, kAutoScrollTimerId, kAutoScrollInterval, nullptr);
    InvertSelection(Invalidate::yes);
    if ((keys & MK_SHIFT) && IsAnchored()) {
        grid.selection = BlockFromAnchor(hit);
    } else {
        grid.selection = {hit.column, hit.column, hit.row, hit.row};
        grid.anchorColumn = hit.column;
        grid.anchorRow = hit.row;
    }
    NotifyCellClicked(hit);  // before the new block is highlighted
    InvertSelection(Invalidate::yes);
    return 0;
}

LRESULT OnGridPointerMove(int x, int y) {
    grid.lastMouseX = x;
    grid.lastMouseY = std::max(y, 0);
    if (!IsAnchored()) return 0;
    const GridSelection block = BlockFromAnchor(CellFromPoint(x, grid.lastMouseY));
    if (IsSame(block, grid.selection)) return 0;
    ShowSelection(block);
    NotifySelecting();
    return 0;
}

LRESULT OnGridButtonUp(WPARAM keys) {
    if (!(keys & MK_SHIFT)) ClearAnchor();
    KillTimer(grid.hwndGrid, kAutoScrollTimerId);
    ReleaseCapture();
    grid.lastMouseX = 0;
    grid.lastMouseY = 0;
    NotifySelectionDone();
    return 0;
}

void OnAutoScroll() {
    const RECT client = ClientRectOf(grid.hwndGrid);
    if (grid.lastMouseX < client.left + grid.cellsLeft) ScrollHorizontally(SB_LINEUP);
    if (grid.lastMouseX > client.right - kAutoScrollMargin) ScrollHorizontally(SB_LINEDOWN);
    // Above the equation bar's edge, not the cells': the column header does not scroll.
    if (grid.lastMouseY < client.top + grid.equationBarHeight) ScrollVertically(SB_LINEUP);
    if (grid.lastMouseY > client.bottom - kAutoScrollMargin) ScrollVertically(SB_LINEDOWN);
}

}  // namespace kor
