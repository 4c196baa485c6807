// A press sets the anchor and starts a timer; moves span the block from the anchor to the pointer;
// the release stops the timer and clears the anchor. A host may take the capture away at any time,
// with a message box for example; that ends a drag as well.
// Compatibility: only the anchor says that moves extend the block, so after a release with Shift
// held, moves without a button go on extending it; pinned by
// MouseDrag.GoesOnAfterAReleaseWithShift.
#include "grid/mouse.h"

#include <algorithm>

#include "base/windows_helpers.h"
#include "grid/drawing.h"
#include "grid/keyboard.h"
#include "grid/notify.h"
#include "grid/scrolling.h"
#include "grid/selection.h"
#include "grid/state.h"
#include "grid/visible.h"

namespace kor {

namespace {

constexpr UINT kAutoScrollInterval = 500;  // milliseconds
constexpr int kAutoScrollMargin = 10;

void FocusGridByMouse() {
    grid.focusByMouse = true;
    SetFocus(grid.hwndGrid);
    grid.focusByMouse = false;
}

void SetAnchor(Cell cell) {
    grid.anchorColumn = cell.column;
    grid.anchorRow = cell.row;
}

void EndDrag(bool keepAnchor) {
    grid.isDragging = false;
    if (!keepAnchor) ClearAnchor();
    KillTimer(grid.hwndGrid, kAutoScrollTimerId);
    grid.lastMouseX = 0;
    grid.lastMouseY = 0;
}

CellBlock BlockFromAnchor(Cell hit) {
    return BlockBetween(grid.anchorColumn, grid.anchorRow, hit.column, hit.row);
}

}  // namespace

LRESULT OnGridButtonDown(WPARAM keys, int x, int y) {
    const RECT client = ClientRectOf(grid.hwndGrid);
    if (x > client.right && y > client.bottom) return 0;
    FocusGridByMouse();
    grid.isDragging = true;
    SetCapture(grid.hwndGrid);
    const Cell hit = CellFromPoint(x, y);
    grid.lastMouseX = x;
    grid.lastMouseY = y;
    // The window that had the capture may have taken it back at once: then there is no drag.
    if (grid.isDragging) {
        SetTimer(grid.hwndGrid, kAutoScrollTimerId, kAutoScrollInterval, nullptr);
    }
    InvertSelection(Invalidate::yes);
    if ((keys & MK_SHIFT) && IsAnchored()) {
        grid.selection = BlockFromAnchor(hit);
    } else {
        grid.selection = {hit.column, hit.column, hit.row, hit.row};
        if (grid.isDragging) SetAnchor(hit);
    }
    NotifyCellClicked(hit);  // before the new block is highlighted
    InvertSelection(Invalidate::yes);
    return 0;
}

LRESULT OnGridPointerMove(int x, int y) {
    grid.lastMouseX = x;
    grid.lastMouseY = std::max(y, 0);
    if (!IsAnchored()) return 0;
    const CellBlock block = BlockFromAnchor(CellFromPoint(x, grid.lastMouseY));
    if (block == grid.selection) return 0;
    ShowSelection(block);
    NotifySelecting();
    return 0;
}

LRESULT OnGridButtonUp(WPARAM keys) {
    EndDrag((keys & MK_SHIFT) != 0);
    ReleaseCapture();
    NotifySelectionDone();
    return 0;
}

void LoseGridDrag() {
    if (grid.isDragging) EndDrag(IsShiftDown());
}

void OnAutoScroll() {
    const RECT client = ClientRectOf(grid.hwndGrid);
    if (grid.lastMouseX < client.left + grid.cellsLeft) ScrollHorizontally(SB_LINEUP);
    if (grid.lastMouseX > client.right - kAutoScrollMargin) ScrollHorizontally(SB_LINEDOWN);
    // The equation bar's edge, not the cells': over the column header nothing scrolls.
    if (grid.lastMouseY < client.top + grid.equationBarHeight) ScrollVertically(SB_LINEUP);
    if (grid.lastMouseY > client.bottom - kAutoScrollMargin) ScrollVertically(SB_LINEDOWN);
}

}  // namespace kor
