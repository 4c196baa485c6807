#include "grid/drawing.h"

#include "base/gdi_scopes.h"
#include "base/windows_helpers.h"
#include "grid/notify.h"
#include "grid/sizes.h"
#include "grid/state.h"
#include "grid/visible.h"
#include "zoom/zoom.h"

namespace kor {

namespace {

// The column at which skipping ends even if columns have no width.
constexpr int kSkipLimit = 2 * kColumnLimit;

void DrawLine(HDC dc, int fromX, int fromY, int toX, int toY) {
    const POINT ends[] = {{fromX, fromY}, {toX, toY}};
    Polyline(dc, ends, 2);
}

// Client y where the vertical lines end, and x where the horizontal ones do: at the edge of the
// area or, when the sheet's last row or column is visible, at its edge.
int VerticalLinesEnd(const RECT& area) {
    const int endRow = grid.firstVisibleRow + grid.visibleRowCount;
    return endRow == kRowLimit ? RowTop(endRow) : area.bottom;
}

int HorizontalLinesEnd(const RECT& area) {
    const int endColumn = grid.firstVisibleColumn + grid.visibleColumnCount;
    return endColumn == kColumnLimit ? ColumnLeft(endColumn) : area.right;
}

// Columns that end left of the area are skipped; past the sheet's end columns have the default
// width.
void DrawVerticalLines(HDC dc, const RECT& area) {
    const int end = VerticalLinesEnd(area);
    int column = grid.firstVisibleColumn;
    int x = grid.cellsLeft;
    while (column < kSkipLimit && x + ColumnWidth(column) < area.left) x += ColumnWidth(column++);
    for (int lines = 0; lines <= grid.visibleColumnCount && x < area.right; ++lines) {
        DrawLine(dc, x, area.top, x, end);
        x += ColumnWidth(column++);
    }
}

void DrawHorizontalLines(HDC dc, const RECT& area) {
    const int end = HorizontalLinesEnd(area);
    const int endRow = grid.firstVisibleRow + grid.visibleRowCount;
    int row = grid.firstVisibleRow;
    int y = grid.cellsTop;
    while (y + RowHeight(row) < area.top) {
        if (row == endRow) return;  // nothing visible lies in the area
        y += RowHeight(row++);
    }
    for (int lines = 0; lines <= grid.visibleRowCount && y < area.bottom; ++lines) {
        DrawLine(dc, area.left, y, end, y);
        y += RowHeight(row++);
    }
}

}  // namespace

void DrawGridLines(HDC dc, HPEN pen, const RECT& area) {
    PatBlt(dc, area.left, area.top, area.right - area.left, area.bottom - area.top, WHITENESS);
    if (grid.gridLinesHidden) return;
    SelectScope linePen(dc, pen);
    DrawVerticalLines(dc, area);
    DrawHorizontalLines(dc, area);
}

void InvertBlock(const CellBlock& block, Invalidate invalidate) {
    const VisibleSpan columns =
        SelectedSpan(ColumnAxis(), block.left, block.right, grid.firstVisibleColumn,
                     grid.visibleColumnCount, zoomLevel);
    const VisibleSpan rows = SelectedSpan(RowAxis(), block.top, block.bottom, grid.firstVisibleRow,
                                          grid.visibleRowCount, zoomLevel);
    if (!columns.touches || !rows.touches) return;
    const int left = grid.cellsLeft + columns.offset;
    const int top = grid.cellsTop + rows.offset;
    PatBlt(grid.memoryDC, left, top, columns.length, rows.length, DSTINVERT);
    if (invalidate == Invalidate::yes) {
        InvalidateArea(grid.hwndGrid, {left, top, left + columns.length, top + rows.length});
    }
}

void InvertSelection(Invalidate invalidate) { InvertBlock(grid.selection, invalidate); }

void RedrawCells(const RECT& area) {
    InvertSelection(Invalidate::no);
    DrawGridLines(grid.memoryDC, grid.gridLinePen, area);
    NotifyPaintCells();
    InvertSelection(Invalidate::no);
    InvalidateArea(grid.hwndGrid, area);
}

void RedrawClient() { RedrawCells(ClientRectOf(grid.hwndGrid)); }

}  // namespace kor
