#include "selection.h"

#include <algorithm>

#include "equation_bar.h"
#include "view_commands.h"
#include "workbook.h"

namespace workbook {

namespace {

CellIndex IndexOf(CellAddress cell) { return KORGRID_CELL(cell.column, cell.row); }

GridVisibleRange VisibleRange() {
    GridVisibleRange range = {};
    GetVisibleRange(&range);
    return range;
}

// Where a view of `count` columns or rows begins so that `target`, which lies behind it, comes into
// view: a third of the way in, and not so far that the sheet's end is left.
int OriginBefore(int target, int count, int limit) {
    return std::max(0, std::min(target - count / 3, limit - count + 1));
}

// The first visible cell with which `cell` comes into view. The view moves only as it must.
CellAddress OriginFor(CellAddress cell, const GridVisibleRange& range) {
    CellAddress origin = {range.firstColumn, range.firstRow};
    if (cell.column < range.firstColumn) origin.column = cell.column;
    if (cell.row < range.firstRow) origin.row = cell.row;
    if (cell.column >= range.endColumn) {
        const int count = static_cast<int>(GetNumberOfVisibleColumns());
        origin.column = OriginBefore(cell.column, count, kColumnCount);
    }
    if (cell.row >= range.endRow) {
        const int count = static_cast<int>(GetNumberOfVisibleRows());
        origin.row = OriginBefore(cell.row, count, kRowCount);
    }
    return origin;
}

void ScrollTo(CellAddress origin) { SetFirstVisibleCell(IndexOf(origin)); }

// The last visible column and row may be cut off; one step more shows them, unless they are wider
// or higher than the view.
void ShowWhole(CellAddress cell) {
    while (!IsIndexCompletelyVisible(IndexOf(cell))) {
        const GridVisibleRange range = VisibleRange();
        CellAddress origin = {range.firstColumn, range.firstRow};
        const CellAddress inFirstRow = {cell.column, range.firstRow};
        const CellAddress inFirstColumn = {range.firstColumn, cell.row};
        if (!IsIndexCompletelyVisible(IndexOf(inFirstRow)) && origin.column < cell.column) {
            ++origin.column;
        } else if (!IsIndexCompletelyVisible(IndexOf(inFirstColumn)) && origin.row < cell.row) {
            ++origin.row;
        } else {
            return;
        }
        ScrollTo(origin);
    }
}

bool IsWellFormed(const GridSelection& selection) {
    return selection.left <= selection.right && selection.right < KORGRID_COLUMNS &&
           selection.top <= selection.bottom && selection.bottom < KORGRID_ROWS;
}

}  // namespace

Block SelectedBlock() {
    GridSelection selection = {};
    GetSelectedRanged(&selection);
    const CellAddress first = {std::min<int>(selection.left, kColumnCount - 1),
                               std::min<int>(selection.top, kRowCount - 1)};
    const CellAddress last = {std::clamp<int>(selection.right, first.column, kColumnCount - 1),
                              std::clamp<int>(selection.bottom, first.row, kRowCount - 1)};
    return BlockBetween(first, last);
}

CellAddress CurrentCell() {
    GridCellPair cell = {};
    GetCurrentSelectedCell(&cell);
    return {std::min<int>(cell.column, kColumnCount - 1), std::min<int>(cell.row, kRowCount - 1)};
}

CellAddress FirstVisibleCell() {
    const GridVisibleRange range = VisibleRange();
    return {range.firstColumn, range.firstRow};
}

void Select(Workbook& workbook, const Block& block) {
    SetSelectedRanged(KORGRID_PAIR(block.left, block.right), KORGRID_PAIR(block.top, block.bottom));
    workbook.press.origin = {block.left, block.top};
    ShowCurrentCell(workbook);
}

void GoTo(Workbook& workbook, const Block& block) {
    Select(workbook, block);
    MakeVisible(workbook, {block.left, block.top});
}

void GoToColumn(Workbook& workbook, int column) {
    CommitTyping(workbook);
    Select(workbook, {column, 0, column, kRowCount - 1});
    MakeVisible(workbook, {column, FirstVisibleCell().row});
}

void MakeVisible(Workbook& workbook, CellAddress cell) {
    if (IsIndexCompletelyVisible(IndexOf(cell))) return;
    if (!IsIndexVisible(IndexOf(cell))) ScrollTo(OriginFor(cell, VisibleRange()));
    ShowWhole(cell);
    UpdateScrollRanges(workbook);
}

void RepairSelection() {
    GridSelection selection = {};
    GetSelectedRanged(&selection);
    if (IsWellFormed(selection)) return;
    const Block block = SelectedBlock();
    SetSelectedRanged(KORGRID_PAIR(block.left, block.left), KORGRID_PAIR(block.top, block.top));
}

void OnPressed(Workbook& workbook, CellAddress cell, bool withShift) {
    workbook.press.pressed = cell;
    workbook.press.dragged = false;
    if (!withShift) workbook.press.origin = cell;
}

void OnReleased(Workbook& workbook, bool withShift) {
    if (!withShift || workbook.press.dragged) return;
    const Block block = BlockBetween(workbook.press.origin, workbook.press.pressed);
    SetSelectedRanged(KORGRID_PAIR(block.left, block.right), KORGRID_PAIR(block.top, block.bottom));
}

}  // namespace workbook
