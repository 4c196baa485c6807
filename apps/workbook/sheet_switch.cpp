#include "sheet_switch.h"

#include "chart_view.h"
#include "equation_bar.h"
#include "model/survey.h"
#include "selection.h"
#include "sizes.h"
#include "view_commands.h"
#include "workbook.h"
#include "workbook_window.h"

namespace workbook {

void LeaveSheet(Workbook& workbook) {
    CommitTyping(workbook);
    SheetView& view = workbook.sheetView();
    view.selection = SelectedBlock();
    view.firstVisible = FirstVisibleCell();
}

void ShowSheet(Workbook& workbook) {
    const SheetView& view = workbook.sheetView();
    ResetGrid();
    ApplySizes(workbook);
    SetFirstVisibleCell(KORGRID_CELL(view.firstVisible.column, view.firstVisible.row));
    UpdateScrollRanges(workbook);
    Select(workbook, view.selection);
    workbook.shown.notice.clear();
    ShowTitle(workbook);
    ShowChartOfSheet(workbook);
}

void ShowSheetFirstTime(Workbook& workbook) {
    ResetGrid();
    workbook.sheetView() = {};
    workbook.sheetView().titleRow = FirstRowIsHeader(workbook.sheet());
    FitSizes(workbook);
    ShowSheet(workbook);
}

void SelectSheet(Workbook& workbook, size_t index) {
    if (index >= workbook.sheets.count() || index == workbook.sheets.currentIndex()) return;
    LeaveSheet(workbook);
    workbook.sheets.select(index);
    ShowSheet(workbook);
}

void StepToSheet(Workbook& workbook, int step) {
    const size_t count = workbook.sheets.count();
    const size_t forward = step > 0 ? 1 : count - 1;
    SelectSheet(workbook, (workbook.sheets.currentIndex() + forward) % count);
}

void AddNewSheet(Workbook& workbook) {
    LeaveSheet(workbook);
    workbook.sheets.addNew();
    ShowSheet(workbook);
}

}  // namespace workbook
