#include "grid/visible.h"

#include <algorithm>

#include "base/windows_helpers.h"
#include "grid/geometry.h"
#include "grid/sizes.h"
#include "grid/state.h"
#include "zoom/zoom.h"

namespace kor {

GridVisibleRange VisibleRange() {
    return {static_cast<WORD>(grid.firstVisibleColumn),
            static_cast<WORD>(grid.firstVisibleColumn + grid.visibleColumnCount),
            static_cast<WORD>(grid.firstVisibleRow),
            static_cast<WORD>(grid.firstVisibleRow + grid.visibleRowCount)};
}

bool IsCellVisible(int column, int row) {
    return column >= grid.firstVisibleColumn &&
           column < grid.firstVisibleColumn + grid.visibleColumnCount &&
           row >= grid.firstVisibleRow && row < grid.firstVisibleRow + grid.visibleRowCount;
}

bool IsCellCompletelyVisible(int column, int row) {
    if (!IsCellVisible(column, row)) return false;
    const bool inLastColumn = column == grid.firstVisibleColumn + grid.visibleColumnCount - 1;
    const bool inLastRow = row == grid.firstVisibleRow + grid.visibleRowCount - 1;
    if (!inLastColumn && !inLastRow) return true;
    const RECT client = ClientRectOf(grid.hwndGrid);
    const RECT box = CellBox(column, row);
    return box.right <= client.right && box.bottom <= client.bottom;
}

int ColumnLeft(int column) {
    return grid.cellsLeft + ColumnsWidth(grid.firstVisibleColumn, column);
}

int RowTop(int row) { return grid.cellsTop + RowsHeight(grid.firstVisibleRow, row); }

RECT CellBox(int column, int row) {
    const int left = ColumnLeft(column);
    const int top = RowTop(row);
    return {left, top, left + ColumnWidth(column), top + RowHeight(row)};
}

Cell CellFromPoint(int x, int y) {
    const RECT client = ClientRectOf(grid.hwndGrid);
    if (x < client.left || y < client.top) return {0, 0};
    const int column = IndexAt(ColumnAxis(), grid.firstVisibleColumn, grid.visibleColumnCount,
                               grid.cellsLeft, std::min<int>(x, client.right), zoomLevel);
    const int row = IndexAt(RowAxis(), grid.firstVisibleRow, grid.visibleRowCount, grid.cellsTop,
                            std::min<int>(y, client.bottom), zoomLevel);
    return {static_cast<uint16_t>(column), static_cast<uint16_t>(row)};
}

}  // namespace kor

extern "C" void KORCONTROLS_API GetVisibleRange(GridVisibleRange* range) {
    if (range) *range = kor::VisibleRange();
}

extern "C" DWORD KORCONTROLS_API GetNumberOfVisibleColumns(void) {
    return kor::grid.visibleColumnCount;
}

extern "C" DWORD KORCONTROLS_API GetNumberOfVisibleRows(void) { return kor::grid.visibleRowCount; }

extern "C" DWORD KORCONTROLS_API IsIndexVisible(CellIndex cell) {
    return kor::IsCellVisible(KORGRID_CELLCOLUMN(cell), KORGRID_CELLROW(cell));
}

extern "C" DWORD KORCONTROLS_API IsIndexCompletelyVisible(CellIndex cell) {
    return kor::IsCellCompletelyVisible(KORGRID_CELLCOLUMN(cell), KORGRID_CELLROW(cell));
}
