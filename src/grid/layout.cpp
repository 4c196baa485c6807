#include "grid/layout.h"

#include <algorithm>

#include "base/gdi_scopes.h"
#include "base/windows_helpers.h"
#include "grid/drawing.h"
#include "grid/headers.h"
#include "grid/state.h"
#include "zoom/zoom.h"

namespace kor {

namespace {

constexpr int kButtonWidth = 25;
// WM_SIZE's way of saying "some other window was maximised": what the grid sends itself.
constexpr WPARAM kLayOutAgain = SIZE_MAXSHOW;

// The new bitmap's contents are undefined; the redraw that follows paints all of it.
void ReplaceImage(int width, int height) {
    if (!grid.memoryDC) return;  // the window has received WM_DESTROY
    WindowDC screen(grid.hwndGrid);
    HBITMAP bitmap = CreateCompatibleBitmap(screen.get(), width, std::max(height, 1));
    if (!bitmap) return;  // the old image, too small or too large, is better than none
    HGDIOBJ previous = SelectObject(grid.memoryDC, bitmap);
    if (!grid.memoryBitmap) {
        grid.blankBitmap = previous;
    } else {
        DeleteObject(grid.memoryBitmap);
    }
    grid.memoryBitmap = bitmap;
}

void Place(HWND child, int x, int y, int width, int height) {
    SetWindowPos(child, nullptr, x, y, width, height, SWP_NOZORDER);
}

void PlaceChildren(int width, int height) {
    const int bar = grid.equationBarHeight;
    // Headers keep their height while hidden; they are just not shown.
    const int headerHeight = HeaderHeightAt(zoomLevel);
    Place(grid.hwndCancelButton, 0, 0, kButtonWidth, bar);
    Place(grid.hwndOkButton, kButtonWidth, 0, kButtonWidth, bar);
    Place(grid.hwndFunctionButton, 2 * kButtonWidth, 0, kButtonWidth, bar);
    Place(grid.hwndEquation, 3 * kButtonWidth, 0, width - 3 * kButtonWidth, bar);
    Place(grid.hwndCornerButton, 0, bar, grid.cellsLeft, headerHeight);
    Place(grid.hwndColumnHeader, grid.cellsLeft, bar, width - grid.cellsLeft, headerHeight);
    Place(grid.hwndRowHeader, 0, grid.cellsTop, grid.cellsLeft, height - grid.cellsTop);
}

}  // namespace

LRESULT OnGridSize() {
    const RECT client = ClientRectOf(grid.hwndGrid);
    if (client.right < 1) return 0;
    ReplaceImage(client.right, client.bottom);
    grid.cellsTop = grid.columnHeaderHeight + grid.equationBarHeight;
    PlaceChildren(client.right, client.bottom);
    UpdateColumnHeader(client.right - grid.cellsLeft);
    UpdateRowHeader(client.bottom - grid.cellsTop);
    RedrawCells(client);
    return 0;
}

void LayOutAgain(LPARAM size) { SendMessageW(grid.hwndGrid, WM_SIZE, kLayOutAgain, size); }

void RedrawHeadersAndCells() {
    UpdateColumnHeaderOverCells();
    UpdateRowHeaderOverCells();
    RECT area = ClientRectOf(grid.hwndGrid);
    area.left += grid.cellsLeft;
    area.top += grid.cellsTop;
    RedrawCells(area);
}

void FitRowHeaderTo(int firstRow) {
    const int width = RowHeaderWidthFor(firstRow + grid.visibleRowCount);
    if (width == grid.rowHeaderWidth) return;
    grid.rowHeaderWidth = width;
    grid.cellsLeft = grid.headersHidden ? 0 : width;
    LayOutAgain(0);
    if (!grid.hwndCornerButton) return;
    InvalidateRect(grid.hwndCornerButton, nullptr, TRUE);
    UpdateWindow(grid.hwndCornerButton);
}

}  // namespace kor
