#include "edit_commands.h"

#include <algorithm>
#include <utility>

#include "equation_bar.h"
#include "selection.h"
#include "view_commands.h"
#include "workbook.h"
#include "workbook_window.h"

namespace workbook {

namespace {

// What changes with every edit, besides the cells.
void AfterEdit(Workbook& workbook, EditResult result) {
    workbook.shown.notice = EditMessage(result);
    workbook.shown.statusIsStale = true;
    // Storing usually moves on to another cell at once, so a notice would hardly be seen.
    if (result == EditResult::NoMemory) workbook.isOutOfMemory = true;
    if (result != EditResult::Done) return;
    workbook.chart.isStale = true;
    workbook.panel.isStale = true;
    ShowTitle(workbook);
    UpdateScrollRanges(workbook);
}

void ShowChangedCells(Workbook& workbook) {
    KorGrid_Redraw(workbook.grid);
    ShowCurrentCell(workbook);
}

void ShowStep(Workbook& workbook, const std::optional<Block>& changed) {
    if (!changed) return;
    AfterEdit(workbook, EditResult::Done);
    KorGrid_Redraw(workbook.grid);
    GoTo(workbook, *changed);
}

}  // namespace

void StoreText(Workbook& workbook, CellAddress cell, std::wstring text) {
    AfterEdit(workbook, workbook.document().setCell(cell, std::move(text)));
}

void StoreCells(Workbook& workbook, std::vector<CellText> cells, std::wstring what) {
    AfterEdit(workbook, workbook.document().setCells(std::move(cells), std::move(what)));
    ShowChangedCells(workbook);
}

void ClearSelection(Workbook& workbook) {
    CommitTyping(workbook);
    AfterEdit(workbook, workbook.document().clear(SelectedBlock()));
    ShowChangedCells(workbook);
}

void Undo(Workbook& workbook) {
    CommitTyping(workbook);
    ShowStep(workbook, workbook.document().undo());
}

void Redo(Workbook& workbook) {
    CommitTyping(workbook);
    ShowStep(workbook, workbook.document().redo());
}

void SelectAllCells(Workbook& workbook) {
    CommitTyping(workbook);
    Select(workbook, {0, 0, kColumnCount - 1, kRowCount - 1});
}

void GoToFirstCell(Workbook& workbook) {
    CommitTyping(workbook);
    GoTo(workbook, BlockOf({0, 0}));
}

void GoToLastCell(Workbook& workbook) {
    CommitTyping(workbook);
    const SheetExtent extent = workbook.sheet().extent();
    GoTo(workbook, BlockOf({std::max(0, extent.columns - 1), std::max(0, extent.rows - 1)}));
}

}  // namespace workbook
