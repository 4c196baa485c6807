#include "grid/selection.h"

#include <algorithm>

#include "base/windows_helpers.h"
#include "grid/drawing.h"
#include "grid/state.h"

namespace kor {

namespace {

constexpr CellBlock kFirstCell = {0, 0, 0, 0};
constexpr CellBlock kWholeSheet = {0, kColumnLimit - 1, 0, kRowLimit - 1};

void FocusGrid() {
    if (grid.hwndGrid) SetFocus(grid.hwndGrid);
}

}  // namespace

bool IsAnchored() { return grid.anchorColumn != kNoAnchor && grid.anchorRow != kNoAnchor; }

void ClearAnchor() {
    grid.anchorColumn = kNoAnchor;
    grid.anchorRow = kNoAnchor;
}

bool HasCurrentCell() { return grid.firstVisibleColumn >= 0 && grid.firstVisibleRow >= 0; }

void ShowSelection(const CellBlock& block) {
    InvertSelection(Invalidate::yes);
    grid.selection = block;
    InvertSelection(Invalidate::yes);
}

LRESULT OnHeaderClick(HWND header, int itemA, int itemB) {
    CellBlock block = kWholeSheet;
    if (header == grid.hwndRowHeader) {
        block.top = static_cast<uint16_t>(grid.firstVisibleRow + std::min(itemA, itemB));
        block.bottom = static_cast<uint16_t>(grid.firstVisibleRow + std::max(itemA, itemB));
    } else if (header == grid.hwndColumnHeader) {
        block.left = static_cast<uint16_t>(grid.firstVisibleColumn + std::min(itemA, itemB));
        block.right = static_cast<uint16_t>(grid.firstVisibleColumn + std::max(itemA, itemB));
    } else {
        return 0;
    }
    InvertSelection(Invalidate::no);
    grid.selection = block;
    InvertSelection(Invalidate::no);
    RECT cells = ClientRectOf(grid.hwndGrid);
    cells.left += grid.cellsLeft;
    cells.top += grid.cellsTop;
    InvalidateArea(grid.hwndGrid, cells);
    return 0;
}

LRESULT SelectAll() {
    // Compatibility: one past the whole sheet, which the branch below never selects. So a second
    // press on the corner button selects everything once more.
    constexpr CellBlock kUnselectable = {0, kColumnLimit, 0, kRowLimit};
    if (grid.selection == kUnselectable) {
        InvertSelection(Invalidate::yes);
        grid.selection = kFirstCell;
    } else {
        InvertSelection(Invalidate::no);
        grid.selection = kWholeSheet;
        InvertSelection(Invalidate::yes);
    }
    FocusGrid();
    return 0;
}

}  // namespace kor

using namespace kor;

extern "C" DWORD KORCONTROLS_API SetSelectedRanged(DWORD columns, DWORD rows) {
    const CellBlock block = {LOWORD(columns), HIWORD(columns), LOWORD(rows), HIWORD(rows)};
    if (!IsValidRange(block)) return 0;
    ShowSelection(block);
    return 1;
}

extern "C" void KORCONTROLS_API GetSelectedRanged(GridSelection* selection) {
    const CellBlock& block = grid.selection;
    if (selection) *selection = {block.left, block.right, block.top, block.bottom};
}

extern "C" DWORD KORCONTROLS_API GetCurrentSelectedCell(GridCellPair* cell) {
    if (!cell || !HasCurrentCell()) return 0;
    *cell = {grid.selection.left, grid.selection.top};
    return 1;
}
