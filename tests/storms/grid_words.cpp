#include "storms/window_words.h"
#include "storms/words.h"

#include <algorithm>

namespace kortest {
namespace {

// Any format but those that end the process in the platform itself: texts of the host are
// constants, which DT_MODIFYSTRING would write to, and Wine's DrawTextW asserts that a path
// ellipsis is alone.
UINT BearableFormat(int32_t number) {
    constexpr UINT kOtherEllipses = DT_WORD_ELLIPSIS | DT_END_ELLIPSIS;
    const UINT format = static_cast<UINT>(number) & ~static_cast<UINT>(DT_MODIFYSTRING);
    return format & DT_PATH_ELLIPSIS ? format & ~kOtherEllipses : format;
}

HWND Grid(Stage& stage) { return stage.ensure(kGrid, 0); }

CellIndex CellOf(int column, int row) { return KORGRID_CELL(column, row); }

void Redraw(Stage& stage, const Arguments& a) {
    stage.send(stage.ensure(kGrid, a[0]), GRIDM_REDRAW, 0, 0);
}

void EquationText(Stage& stage, const Arguments& a) {
    stage.send(Grid(stage), GRIDM_SETEQUATIONTEXT, 0, reinterpret_cast<LPARAM>(TextOf(a[0])));
}

void Zoom(Stage&, const Arguments& a) { SetGridZoomLevel(static_cast<DWORD>(a[0])); }
void UsualZoom(Stage&, const Arguments&) { SetGridZoomLevel(4); }
void ColumnSize(Stage&, const Arguments& a) { SetColumnWidth(a[0], a[1]); }
void RowSize(Stage&, const Arguments& a) { SetRowHeight(a[0], a[1]); }
void FirstCell(Stage&, const Arguments& a) { SetFirstVisibleCell(CellOf(a[0], a[1])); }
void Home(Stage&, const Arguments&) { SetFirstVisibleCell(0); }
void Headers(Stage&, const Arguments&) { ToggleViewStateOfHeaders(); }
void Lines(Stage&, const Arguments&) { ToggleGridLines(); }
void HorizontalBar(Stage&, const Arguments&) { ToggleHorizontalScrollBar(); }
void VerticalBar(Stage&, const Arguments&) { ToggleVerticalScrollBar(); }
void Columns(Stage&, const Arguments& a) { SetHorizontalDataRange(a[0]); }
void Rows(Stage&, const Arguments& a) { SetVerticalDataRange(a[0]); }
void Reset(Stage&, const Arguments&) { ResetGrid(); }
void Commit(Stage&, const Arguments&) { PressOKButton(); }
void FunctionId(Stage&, const Arguments& a) {
    SetFunctionButtonMessageID(static_cast<DWORD>(a[0]));
}

void Select(Stage&, const Arguments& a) {
    SetSelectedRanged(KORGRID_PAIR(a[0], WrappedSum(a[0], a[2])),
                      KORGRID_PAIR(a[1], WrappedSum(a[1], a[3])));
}

void Nulls(Stage&, const Arguments&) {
    GetVisibleRange(nullptr);
    GetSelectedRanged(nullptr);
    GetCurrentSelectedCell(nullptr);
}

void Questions(Stage&, const Arguments& a) {
    IsIndexVisible(CellOf(a[0], a[1]));
    IsIndexCompletelyVisible(CellOf(a[0], a[1]));
    GetControlWithFocus();
    GetHandleToEquationControl();
}

// Drawing outside of the notification that asks for it, and with odd arguments.
void Cell(Stage&, const Arguments& a) {
    SetCellValue(CellOf(a[0], a[1]), TextOf(a[2]), nullptr, RGB(200, 0, 0), RGB(255, 255, 255),
                 BearableFormat(a[3]), a[4], a[5], static_cast<DWORD>(a[3] >> 5),
                 static_cast<DWORD>(a[3] >> 7));
}

void CellFill(Stage&, const Arguments& a) {
    SetCellBackGroundColor(CellOf(a[0], a[1]),
                           a[2] ? static_cast<HBRUSH>(GetStockObject(GRAY_BRUSH)) : nullptr);
    SetCellBorder(CellOf(a[0], a[1]), static_cast<HPEN>(GetStockObject(BLACK_PEN)), 1,
                  static_cast<DWORD>(a[3]), 0x10000, 1);
}

void Key(Stage& stage, const Arguments& a) {
    stage.send(Grid(stage), WM_KEYDOWN, WideWord(a[0]), 1);
}

void Character(Stage& stage, const Arguments& a) {
    stage.send(Grid(stage), WM_CHAR, WideWord(a[0]), 1);
}

void Timer(Stage& stage, const Arguments& a) {
    stage.send(Grid(stage), WM_TIMER, a[0] ? 10101 : WideWord(a[1]), 0);
}

void HorizontalScroll(Stage& stage, const Arguments& a) {
    stage.send(Grid(stage), WM_HSCROLL, static_cast<WPARAM>(MAKELONG(a[0], a[1])), 0);
}

void VerticalScroll(Stage& stage, const Arguments& a) {
    stage.send(Grid(stage), WM_VSCROLL, static_cast<WPARAM>(MAKELONG(a[0], a[1])), 0);
}

void Command(Stage& stage, const Arguments& a) {
    stage.send(Grid(stage), WM_COMMAND, WideWord(a[0]), 0);
}

// What a strip posts, from the grid's own strips, strangers and nobody.
void StripNotice(Stage& stage, const Arguments& a) {
    HWND grid = Grid(stage);
    HWND senders[] = {GetDlgItem(grid, 2), GetDlgItem(grid, 3), stage.window(kStrip, 0), nullptr};
    stage.send(grid, HCN_ITEMCLICK + static_cast<UINT>(std::clamp(a[1], 0, 2)),
               reinterpret_cast<WPARAM>(senders[a[0] & 3]), PairOf(a[2], a[3]));
}

// The pointer and keys over the grid's children: strips, edit and buttons.
HWND Child(Stage& stage, int number) {
    static constexpr int kIds[] = {2, 3, 6, 7, 8, 1, 2, 3};
    return GetDlgItem(Grid(stage), kIds[number & 7]);
}

void ChildPress(Stage& stage, const Arguments& a) {
    stage.send(Child(stage, a[0]), WM_LBUTTONDOWN, MK_LBUTTON, PairOf(a[1], a[2]));
}

void ChildMove(Stage& stage, const Arguments& a) {
    stage.send(Child(stage, a[0]), WM_MOUSEMOVE, MK_LBUTTON, PairOf(a[1], a[2]));
}

void ChildRelease(Stage& stage, const Arguments& a) {
    stage.send(Child(stage, a[0]), WM_LBUTTONUP, 0, PairOf(a[1], a[2]));
}

void ChildKey(Stage& stage, const Arguments& a) {
    stage.send(Child(stage, a[0]), WM_KEYDOWN, WideWord(a[1]), 1);
    stage.send(Child(stage, a[0]), WM_CHAR, WideWord(a[1]), 1);
}

void ChildDestroy(Stage& stage, const Arguments& a) { DestroyWindow(Child(stage, a[0])); }

void EditText(Stage& stage, const Arguments& a) {
    HWND edit = GetHandleToEquationControl();
    if (!IsWindow(edit)) return;
    SetFocus(edit);
    SendMessageW(edit, WM_SETTEXT, 0, reinterpret_cast<LPARAM>(TextOf(a[0])));
    SendMessageW(edit, EM_SETMODIFY, static_cast<WPARAM>(a[1]), 0);
    if (a[2]) stage.send(Grid(stage), WM_COMMAND, 7, 0);
}

constexpr Word kWords[] = {
    KORTEST_WINDOW_WORDS(kGrid, "grid."),
    {"grid.redraw", 20, "s", Redraw},
    {"grid.equation_text", 10, "t", EquationText},
    {"grid.zoom", 12, "q", Zoom},
    {"grid.usual_zoom", 10, "", UsualZoom},
    {"grid.column_width", 50, "cz", ColumnSize},
    {"grid.row_height", 50, "rz", RowSize},
    {"grid.first_cell", 25, "cr", FirstCell},
    {"grid.home", 10, "", Home},
    {"grid.headers", 6, "", Headers},
    {"grid.lines", 6, "", Lines},
    {"grid.horizontal_bar", 6, "", HorizontalBar},
    {"grid.vertical_bar", 6, "", VerticalBar},
    {"grid.columns", 10, "g", Columns},
    {"grid.rows", 10, "g", Rows},
    {"grid.reset", 5, "", Reset},
    {"grid.commit", 10, "", Commit},
    {"grid.function_id", 4, "n", FunctionId},
    {"grid.select", 50, "crii", Select},
    {"grid.nulls", 4, "", Nulls},
    {"grid.questions", 40, "cr", Questions},
    {"grid.cell", 60, "crtnii", Cell},
    {"grid.cell_fill", 30, "crbn", CellFill},
    {"grid.key", 90, "k", Key},
    {"grid.character", 20, "h", Character},
    {"grid.timer", 30, "bn", Timer},
    {"grid.horizontal_scroll", 30, "oc", HorizontalScroll},
    {"grid.vertical_scroll", 30, "or", VerticalScroll},
    {"grid.command", 15, "i", Command},
    {"grid.strip_notice", 50, "siii", StripNotice},
    {"grid.child_press", 50, "ixx", ChildPress},
    {"grid.child_move", 50, "ixx", ChildMove},
    {"grid.child_release", 40, "ixx", ChildRelease},
    {"grid.child_key", 25, "ik", ChildKey},
    {"grid.child_destroy", 1, "i", ChildDestroy},
    {"grid.edit_text", 20, "tbb", EditText},
};

}  // namespace

void AddGridWords(Vocabulary& vocabulary) { vocabulary.add(kWords); }

}  // namespace kortest
