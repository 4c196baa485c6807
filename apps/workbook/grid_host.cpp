#include "grid_host.h"

#include <korcontrols/header.h>

#include "cell_painter.h"
#include "edit_commands.h"
#include "equation_bar.h"
#include "selection.h"
#include "status_line.h"
#include "workbook.h"

namespace workbook {

namespace {

bool IsShiftDown() { return GetKeyState(VK_SHIFT) < 0; }

// The equation messages carry the cell the other way round than a CellIndex does.
CellAddress CellOfCommit(LPARAM lParam) {
    const auto packed = static_cast<DWORD>(lParam);
    return {KORGRID_EQUATIONCOLUMN(packed), KORGRID_EQUATIONROW(packed)};
}

void OnCellClicked(Workbook& workbook, const GridCellPair& cell) {
    OnPressed(workbook, {cell.column, cell.row}, IsShiftDown());
    workbook.shown.notice.clear();
    ShowCurrentCell(workbook);
}

void OnSelecting(Workbook& workbook) {
    workbook.press.dragged = true;
    workbook.shown.statusIsStale = true;
}

void OnSelectionDone(Workbook& workbook) {
    OnReleased(workbook, IsShiftDown());
    ShowCurrentCell(workbook);
}

// Keys moved the current cell, or typing was given up. A single cell is kept in view: the grid
// scrolls by at most one step, which is too little after the view was scrolled away. (A block that
// grows scrolls on its other side.)
void OnCurrentCell(Workbook& workbook) {
    RepairSelection();
    workbook.shown.notice.clear();
    ShowCurrentCell(workbook);
    const Block block = SelectedBlock();
    const CellAddress current = CurrentCell();
    if (block != BlockOf(current)) return;
    workbook.press.origin = current;
    MakeVisible(workbook, current);
}

// The grid drew before it told the new width, which numbers and overhanging texts depend on, and it
// drew too little at other zooms than 100 %.
void OnColumnResized(Workbook& workbook, DWORD sizeAndColumn) {
    const int column = KORGRID_RESIZEDINDEX(sizeAndColumn);
    if (column < kColumnCount)
        workbook.sheetView().widths.set(column, KORGRID_RESIZEDSIZE(sizeAndColumn));
    KorGrid_Redraw(workbook.grid);
}

void OnRowResized(Workbook& workbook, DWORD sizeAndRow) {
    const int row = KORGRID_RESIZEDINDEX(sizeAndRow);
    if (row < kRowCount) workbook.sheetView().heights[row] = KORGRID_RESIZEDSIZE(sizeAndRow);
    KorGrid_Redraw(workbook.grid);
}

// A press on the very beginning of a header takes the capture and never gives it back, so that the
// next click anywhere would be the header's.
void FreeMouseFromHeader(const Workbook& workbook) {
    const HWND capture = GetCapture();
    const bool isPressed = GetKeyState(VK_LBUTTON) < 0;
    if (capture && !isPressed && IsGridHeader(workbook, capture)) ReleaseCapture();
}

}  // namespace

bool IsGridHeader(const Workbook& workbook, HWND window) {
    wchar_t name[32] = {};
    return GetParent(window) == workbook.grid && GetClassNameW(window, name, ARRAYSIZE(name)) &&
           lstrcmpW(name, KORHEADER_CLASS) == 0;
}

bool OnGridNotify(Workbook& workbook, UINT code, LPARAM lParam) {
    switch (code) {
    case GRIDN_PAINTCELLS:
        PaintCells(workbook, *reinterpret_cast<const GridVisibleRange*>(lParam));
        return true;
    case GRIDN_CELLCLICKED:
        OnCellClicked(workbook, *reinterpret_cast<const GridCellPair*>(lParam));
        return true;
    case GRIDN_COLUMNRESIZED: OnColumnResized(workbook, static_cast<DWORD>(lParam)); return true;
    case GRIDN_ROWRESIZED: OnRowResized(workbook, static_cast<DWORD>(lParam)); return true;
    case GRIDN_CURRENTCELL: OnCurrentCell(workbook); return true;
    case GRIDN_SELECTING: OnSelecting(workbook); return true;
    case GRIDN_SELECTIONDONE: OnSelectionDone(workbook); return true;
    case GRIDN_EDITFOCUS:
    case GRIDN_EDITKILLFOCUS: workbook.shown.statusIsStale = true; return true;
    default: return false;
    }
}

void OnEquationEntered(Workbook& workbook, const wchar_t* text, LPARAM cell) {
    StoreText(workbook, CellOfCommit(cell), CommittedText(text));
}

void OnEquationEmptied(Workbook& workbook, LPARAM cell) {
    // The grid leaves the flag set, and every later loss of focus would empty the then current
    // cell.
    SendMessageW(GetHandleToEquationControl(), EM_SETMODIFY, FALSE, 0);
    StoreText(workbook, CellOfCommit(cell), {});
}

void OnDeleteKey(Workbook& workbook) { ClearSelection(workbook); }

void CatchUpWithGrid(Workbook& workbook) {
    FreeMouseFromHeader(workbook);
    TakeFocusFromButtons(workbook);
    const Block block = SelectedBlock();
    if (block != workbook.shown.selection && !IsTyping()) {
        workbook.shown.notice.clear();
        ShowCurrentCell(workbook);
    }
    if (workbook.shown.statusIsStale || block != workbook.shown.selection) {
        UpdateStatusBar(workbook);
    }
}

}  // namespace workbook
