// While a border is dragged, an inverted line follows it. It is drawn on the window itself, so the
// next copy from the image removes what is left of it.
#include "grid/resize.h"

#include "base/gdi_scopes.h"
#include "base/windows_helpers.h"
#include "grid/drawing.h"
#include "grid/headers.h"
#include "grid/notify.h"
#include "grid/sizes.h"
#include "grid/state.h"
#include "zoom/zoom.h"

namespace kor {

namespace {

void InvertColumnLine(HDC dc, const RECT& client) {
    if (grid.resizeLinePos == kNoResizeLine) return;
    PatBlt(dc, grid.resizeLinePos, client.top, 1, client.bottom - client.top, DSTINVERT);
}

void InvertRowLine(HDC dc, const RECT& client) {
    if (grid.resizeLinePos == kNoResizeLine) return;
    PatBlt(dc, client.left, grid.resizeLinePos, client.right - client.left, 1, DSTINVERT);
}

void ResizeColumn(int item, uint16_t units) {
    const int column = grid.firstVisibleColumn + item;
    if (item >= grid.visibleColumnCount) {
        StoreColumnWidth(column, units);
        return;
    }
    RECT area = ClientRectOf(grid.hwndGrid);
    InvertColumnLine(grid.memoryDC, area);
    StoreColumnWidth(column, units);
    UpdateColumnHeader(area.right);
    grid.resizeLinePos = kNoResizeLine;
    // Compatibility: a distance from the first cell's edge is used as a client position, so the
    // area begins a header's width too early; pinned by
    // GridResizeEndPicture.RedrawsFromTheColumnsOffset.
    area.left = RoughDistance(ColumnAxis(), grid.firstVisibleColumn, column, zoomLevel);
    RedrawCells(area);
}

// Compatibility: the row after the visible ones is redrawn as well, the column after them is not;
// pinned by GridResizeEndPicture.RowsAndColumnsDifferAtTheCount.
void ResizeRow(int item, uint16_t units) {
    const int row = grid.firstVisibleRow + item;
    if (item > grid.visibleRowCount) {
        StoreRowHeight(row, units);
        return;
    }
    RECT area = ClientRectOf(grid.hwndGrid);
    InvertRowLine(grid.memoryDC, area);
    StoreRowHeight(row, units);
    UpdateRowHeaderOverCells();
    area.top = RoughDistance(RowAxis(), grid.firstVisibleRow, row, zoomLevel);
    grid.resizeLinePos = kNoResizeLine;
    RedrawCells(area);
}

}  // namespace

LRESULT OnHeaderResizing(HWND header, int position) {
    const bool isColumn = header == grid.hwndColumnHeader;
    if (!isColumn && header != grid.hwndRowHeader) return 0;
    const RECT client = ClientRectOf(grid.hwndGrid);
    const auto invertLine = isColumn ? InvertColumnLine : InvertRowLine;
    WindowDC window(grid.hwndGrid);
    invertLine(window.get(), client);
    grid.resizeLinePos = (isColumn ? grid.cellsLeft : grid.cellsTop) + position;
    invertLine(window.get(), client);
    return 0;
}

void OnHeaderResizeLost(HWND header) {
    const bool isColumn = header == grid.hwndColumnHeader;
    if (!isColumn && header != grid.hwndRowHeader) return;
    {
        WindowDC window(grid.hwndGrid);
        (isColumn ? InvertColumnLine : InvertRowLine)(window.get(), ClientRectOf(grid.hwndGrid));
    }
    grid.resizeLinePos = kNoResizeLine;
    if (isColumn) {
        FillColumnHeader();
    } else {
        FillRowHeader();
    }
}

LRESULT OnHeaderResized(HWND header, int item, int units) {
    const auto size = static_cast<uint16_t>(units);
    if (header == grid.hwndColumnHeader) {
        ResizeColumn(item, size);
        NotifyColumnResized(grid.firstVisibleColumn + item, units);
    } else if (header == grid.hwndRowHeader) {
        ResizeRow(item, size);
        NotifyRowResized(grid.firstVisibleRow + item, units);
    }
    return 0;
}

}  // namespace kor
