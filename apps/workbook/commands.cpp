#include "commands.h"

#include <string>

#include "chart_commands.h"
#include "chart_output.h"
#include "clipboard.h"
#include "dialogs.h"
#include "edit_commands.h"
#include "equation_bar.h"
#include "file_commands.h"
#include "function_menu.h"
#include "menu_marks.h"
#include "resource.h"
#include "sheet_switch.h"
#include "view_commands.h"
#include "workbook.h"

namespace workbook {

namespace {

// While text is being typed, the menu's cut, copy and paste are about that text.
void RunOnText(UINT message) { SendMessageW(GetHandleToEquationControl(), message, 0, 0); }

void Cut(Workbook& workbook) { IsTyping() ? RunOnText(WM_CUT) : CutSelection(workbook); }
void Copy(Workbook& workbook) { IsTyping() ? RunOnText(WM_COPY) : CopySelection(workbook); }
void Paste(Workbook& workbook) { IsTyping() ? RunOnText(WM_PASTE) : PasteAtCurrentCell(workbook); }

UINT ZoomCommand(DWORD quarters) {
    switch (quarters) {
    case 2: return IDM_VIEW_ZOOM_50;
    case 3: return IDM_VIEW_ZOOM_75;
    case 6: return IDM_VIEW_ZOOM_150;
    case 8: return IDM_VIEW_ZOOM_200;
    default: return IDM_VIEW_ZOOM_100;
    }
}

void Rename(HMENU menu, UINT command, const std::wstring& text) {
    // Entries of other menus are left alone: this runs for each menu that opens.
    if (GetMenuState(menu, command, MF_BYCOMMAND) == static_cast<UINT>(-1)) return;
    ModifyMenuW(menu, command, MF_BYCOMMAND | MF_STRING, command, text.c_str());
}

void PrepareEditMenu(const Document& document, HMENU menu) {
    Rename(menu, IDM_EDIT_UNDO, L"&" + document.undoText() + L"\tCtrl+Z");
    Rename(menu, IDM_EDIT_REDO, L"&" + document.redoText() + L"\tCtrl+Y");
    Enable(menu, IDM_EDIT_UNDO, document.canUndo());
    Enable(menu, IDM_EDIT_REDO, document.canRedo());
    Enable(menu, IDM_EDIT_PASTE, CanPaste());
}

void PrepareViewMenu(const ViewOptions& view, bool titleRow, HMENU menu) {
    CheckMenuRadioItem(menu, IDM_VIEW_ZOOM_50, IDM_VIEW_ZOOM_200, ZoomCommand(view.zoom),
                       MF_BYCOMMAND);
    Check(menu, IDM_VIEW_HEADERS, view.headers);
    Check(menu, IDM_VIEW_GRID_LINES, view.gridLines);
    Check(menu, IDM_VIEW_HORIZONTAL_SCROLL_BAR, view.horizontalScrollBar);
    Check(menu, IDM_VIEW_VERTICAL_SCROLL_BAR, view.verticalScrollBar);
    Check(menu, IDM_VIEW_TITLE_ROW, titleRow);
}

}  // namespace

void RunCommand(Workbook& workbook, UINT command) {
    switch (command) {
    case IDM_FILE_NEW: return AddNewSheet(workbook);
    case IDM_FILE_OPEN: return OpenWithDialog(workbook);
    case IDM_FILE_SAVE: Save(workbook); return;
    case IDM_FILE_SAVE_AS: SaveAs(workbook); return;
    case IDM_FILE_CLOSE: return CloseSheet(workbook);
    case IDM_FILE_PRINT: return PrintChart(workbook);
    case IDM_FILE_EXIT: PostMessageW(workbook.window, WM_CLOSE, 0, 0); return;

    case IDM_EDIT_UNDO: return Undo(workbook);
    case IDM_EDIT_REDO: return Redo(workbook);
    case IDM_EDIT_CUT: return Cut(workbook);
    case IDM_EDIT_COPY: return Copy(workbook);
    case IDM_EDIT_PASTE: return Paste(workbook);
    case IDM_EDIT_CLEAR: return ClearSelection(workbook);
    case IDM_EDIT_SELECT_ALL: return SelectAllCells(workbook);
    case IDM_EDIT_CELL: return EditCurrentCell();
    case IDM_EDIT_GOTO: return GoToWithDialog(workbook);
    case IDM_EDIT_FIRST_CELL: return GoToFirstCell(workbook);
    case IDM_EDIT_LAST_CELL: return GoToLastCell(workbook);

    case IDM_VIEW_ZOOM_50: return SetZoom(workbook, 2);
    case IDM_VIEW_ZOOM_75: return SetZoom(workbook, 3);
    case IDM_VIEW_ZOOM_100: return SetZoom(workbook, 4);
    case IDM_VIEW_ZOOM_150: return SetZoom(workbook, 6);
    case IDM_VIEW_ZOOM_200: return SetZoom(workbook, 8);
    case IDM_VIEW_HEADERS: return ToggleHeaders(workbook);
    case IDM_VIEW_GRID_LINES: return ToggleLines(workbook);
    case IDM_VIEW_HORIZONTAL_SCROLL_BAR: return ToggleHorizontalBar(workbook);
    case IDM_VIEW_VERTICAL_SCROLL_BAR: return ToggleVerticalBar(workbook);
    case IDM_VIEW_TITLE_ROW: return ToggleTitleRow(workbook);
    case IDM_VIEW_FIT_SIZES: return FitSizesAndRedraw(workbook);
    case IDM_VIEW_SIDE_PANEL: return ToggleSidePanel(workbook);
    case IDM_VIEW_NEXT_PANE: return StepFocus(workbook);
    case IDM_VIEW_NEXT_SHEET: return StepToSheet(workbook, 1);
    case IDM_VIEW_PREVIOUS_SHEET: return StepToSheet(workbook, -1);

    case IDM_HELP_KEYS: return ShowKeys(workbook);
    case IDM_HELP_ABOUT: return ShowAbout(workbook);
    case IDM_FUNCTIONS: return ShowFunctionMenu(workbook);
    default:
        if (command >= IDM_FUNCTION_FIRST && command <= IDM_FUNCTION_LAST) {
            InsertFunction(workbook, command);
        }
        if (command >= IDM_CHART_FIRST && command <= IDM_CHART_LAST) {
            RunChartCommand(workbook, command);
        }
    }
}

void PrepareMenu(const Workbook& workbook, HMENU menu) {
    PrepareEditMenu(workbook.document(), menu);
    PrepareViewMenu(workbook.view, workbook.sheetView().titleRow, menu);
    PrepareChartMenu(workbook, menu);
    Enable(menu, IDM_FILE_PRINT, CanPrintChart(workbook));
    Check(menu, IDM_VIEW_SIDE_PANEL, workbook.panel.isShown);
}

}  // namespace workbook
