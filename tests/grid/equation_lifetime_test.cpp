// All functions before the grid's window exists and after it is gone.
#include "grid/equation_fixture.h"

namespace kortest {
namespace {

// Calls that mean the desktop, the whole thread or all windows when their window is null.
constexpr const char* kDangerousWithoutAWindow[] = {
    "InvalidateRect", "GetDC",     "ReleaseDC",  "SetFocus",      "PostMessageW",
    "SetTimer",       "KillTimer", "SetCapture", "GetClientRect", "SetWindowPos"};

// Calls that draw into the DC that is their first argument.
constexpr const char* kDrawing[] = {"PatBlt",    "BitBlt",       "FillRect",     "Polyline",
                                    "DrawTextW", "SelectObject", "SetTextColor", "SetBkColor"};

class GridLifetime : public GuardedGridUse {
protected:
    void watchDangerousCalls() {
        for (const char* name : kDangerousWithoutAWindow) spy.watchAll({name});
        for (const char* name : kDrawing) spy.watchAll({name});
        spy.clearCalls();
    }

    void expectNoCallWithoutAWindow() {
        for (const char* name : kDangerousWithoutAWindow) {
            for (const ImportCall& call : spy.callsOf(name)) {
                EXPECT_NE(ArgumentsOf(call)[0], 0u) << name;
            }
        }
    }

    // The number of a deleted DC may be another's by now.
    void expectNoDrawingIntoTheDeletedImage() {
        const auto deleted = static_cast<DWORD>(reinterpret_cast<ULONG_PTR>(imageDC));
        for (const char* name : kDrawing) {
            for (const ImportCall& call : spy.callsOf(name)) {
                EXPECT_NE(ArgumentsOf(call)[0], deleted) << name;
            }
        }
    }

    static void callEveryExport() {
        const CellIndex cell = KORGRID_CELL(1, 1);
        GridVisibleRange range{};
        GridSelection selection{};
        GridCellPair pair{};
        SetCellBackGroundColor(cell, static_cast<HBRUSH>(GetStockObject(BLACK_BRUSH)));
        SetCellBorder(cell, static_cast<HPEN>(GetStockObject(BLACK_PEN)), 1, 1, 1, 1);
        SetCellValue(cell, L"text", nullptr, 0, 0, 0, 0, 0, 0, 0);
        GetVisibleRange(&range);
        GetNumberOfVisibleColumns();
        GetNumberOfVisibleRows();
        IsIndexVisible(cell);
        IsIndexCompletelyVisible(cell);
        Select(1, 2, 3, 4);
        Select(0, 0, 0, 0);
        GetSelectedRanged(&selection);
        GetCurrentSelectedCell(&pair);
        SetFirstVisibleCell(KORGRID_CELL(3, 3000));
        SetFirstVisibleCell(0);
        SetColumnWidth(0, 70);
        SetRowHeight(0, 20);
        ToggleGridLines();
        ToggleGridLines();
        ToggleHorizontalScrollBar();
        ToggleHorizontalScrollBar();
        ToggleVerticalScrollBar();
        ToggleVerticalScrollBar();
        ToggleViewStateOfHeaders();
        ToggleViewStateOfHeaders();
        SetGridZoomLevel(2);
        SetGridZoomLevel(4);
        SetHorizontalDataRange(30);
        SetVerticalDataRange(300);
        SetFunctionButtonMessageID(5);
        GetControlWithFocus();
        GetHandleToEquationControl();
        PressOKButton();
        ResetGrid();
    }
};

TEST_F(GridLifetime, BeforeItsWindowExistsTheGridAnswersFromItsState) {
    EXPECT_EQ(VisibleRange(), Range(0, 0, 0, 0));
    EXPECT_EQ(GetNumberOfVisibleColumns(), 0u);
    EXPECT_EQ(GetNumberOfVisibleRows(), 0u);
    EXPECT_EQ(IsIndexVisible(0), 0u);
    EXPECT_EQ(IsIndexCompletelyVisible(0), 0u);
    EXPECT_EQ(Selection(), Block(0, 0, 0, 0));
    GridCellPair cell{9, 9};
    EXPECT_EQ(GetCurrentSelectedCell(&cell), 1u);
    EXPECT_EQ(cell.column, 0);
    EXPECT_EQ(GetControlWithFocus(), nullptr);
    EXPECT_EQ(GetHandleToEquationControl(), nullptr);
    EXPECT_EQ(PressOKButton(), 1);
    EXPECT_EQ(SetHorizontalDataRange(30), 0);
    EXPECT_EQ(SetVerticalDataRange(300), 0);
}

TEST_F(GridLifetime, BeforeItsWindowExistsTheGridKeepsWhatItIsTold) {
    EXPECT_NE(Select(1, 2, 3, 4), 0u);
    EXPECT_EQ(Select(2, 1, 3, 4), 0u);
    EXPECT_EQ(Selection(), Block(1, 2, 3, 4));
    SetFirstVisibleCell(KORGRID_CELL(5, 60));
    EXPECT_EQ(VisibleRange(), Range(5, 5, 60, 60));
    open(330, 168);
    EXPECT_EQ(VisibleRange(), Range(5, 11, 60, 71));
    EXPECT_EQ(Selection(), Block(1, 2, 3, 4));
}

TEST_F(GridLifetime, RangesFromBeforeReachTheBarsWhenTheyAreShown) {
    SetHorizontalDataRange(30);
    SetVerticalDataRange(300);
    open(330, 168);
    ToggleHorizontalScrollBar();
    ToggleHorizontalScrollBar();
    ToggleVerticalScrollBar();
    ToggleVerticalScrollBar();
    EXPECT_EQ(bar(SB_HORZ).nMax, 30);
    EXPECT_EQ(bar(SB_VERT).nMax, 300);
}

TEST_F(GridLifetime, BeforeItsWindowExistsNothingReachesOtherWindows) {
    const HWND focused = GetFocus();
    ValidateRect(host.window(), nullptr);
    watchDangerousCalls();
    callEveryExport();
    expectNoCallWithoutAWindow();
    EXPECT_EQ(GetFocus(), focused);
    EXPECT_FALSE(TakeInvalid(host.window()));
    MSG message{};
    while (PeekMessageW(&message, nullptr, 0, 0, PM_REMOVE)) {
        EXPECT_NE(message.message, static_cast<UINT>(WM_COMMAND));
        DispatchMessageW(&message);
    }
    EXPECT_EQ(told(), Lines{});
}

TEST_F(GridLifetime, AfterItsWindowIsGoneNothingIsDrawn) {
    open(330, 168);
    SetColumnWidth(0, 90);
    SetRowHeight(0, 30);
    pressCell(2, 2);
    DestroyWindow(grid);
    host.pump();
    told();
    ValidateRect(host.window(), nullptr);
    watchDangerousCalls();
    callEveryExport();
    expectNoCallWithoutAWindow();
    expectNoDrawingIntoTheDeletedImage();
    EXPECT_FALSE(TakeInvalid(host.window()));
}

TEST_F(GridLifetime, AfterItsWindowIsGoneTheGridAnswersFromItsState) {
    open(330, 168);
    SetFocus(edit);
    Select(1, 2, 3, 4);
    SetFirstVisibleCell(KORGRID_CELL(5, 60));
    const HWND oldEdit = edit;
    DestroyWindow(grid);
    EXPECT_EQ(VisibleRange(), Range(5, 11, 60, 71));
    EXPECT_EQ(IsIndexVisible(KORGRID_CELL(5, 60)), 1u);
    EXPECT_EQ(IsIndexVisible(KORGRID_CELL(11, 60)), 0u);
    EXPECT_EQ(Selection(), Block(1, 2, 3, 4));
    EXPECT_EQ(GetHandleToEquationControl(), oldEdit);
    EXPECT_EQ(GetControlWithFocus(), oldEdit);
    EXPECT_EQ(PressOKButton(), 1);
    EXPECT_NE(Select(0, 0, 0, 0), 0u);
    ResetGrid();
    EXPECT_EQ(VisibleRange().firstColumn, 0);
    EXPECT_EQ(VisibleRange().firstRow, 0);
}

// Whether the edit still loses the focus, and so commits, is the platform's affair.
TEST_F(GridLifetime, GridCanGoWhileItsEditHasTheFocus) {
    open(330, 168);
    SetFocus(edit);
    SetWindowTextW(edit, L"5");
    SendMessageW(edit, EM_SETMODIFY, TRUE, 0);
    DestroyWindow(grid);
    host.pump();
    watchDangerousCalls();
    callEveryExport();
    expectNoCallWithoutAWindow();
    expectNoDrawingIntoTheDeletedImage();
}

TEST_F(GridLifetime, ChildrenThatOutliveTheGridsDestructionDoNoHarm) {
    open(330, 168);
    SetFocus(edit);
    SetWindowTextW(edit, L"5");
    // What a child may still get between the grid's WM_DESTROY and its own.
    SendMessageW(grid, WM_DESTROY, 0, 0);
    watchDangerousCalls();
    SendMessageW(edit, EM_SETMODIFY, TRUE, 0);
    PressKey(edit, VK_RETURN);
    SetFocus(edit);
    PressKey(edit, VK_ESCAPE);
    TypeCharacter(grid, L'7');
    for (HWND button : {OkButtonOf(grid), FunctionButtonOf(grid), CancelButtonOf(grid)}) {
        ClickAt(button, 5, 5);
    }
    ClickAt(CornerButtonOf(grid), 3, 3);
    press(middleX(1), middleY(1));
    move(middleX(2), middleY(2));
    timer();
    release();
    scrollColumns(SB_LINEDOWN);
    scrollRows(SB_PAGEDOWN);
    clickHeader(columnHeader, 0, 1);
    SendResized(grid, columnHeader, 0, 30);
    SendResizing(grid, rowHeader, 30);
    send(GRIDM_REDRAW);
    host.pump();
    callEveryExport();
    expectNoCallWithoutAWindow();
    expectNoDrawingIntoTheDeletedImage();
    DestroyWindow(grid);
    host.pump();
}

TEST_F(GridLifetime, SecondGridWorksAfterTheFirst) {
    open(330, 168);
    SetColumnWidth(1, 90);
    SetRowHeight(1, 30);
    SetFirstVisibleCell(KORGRID_CELL(1, 1));
    Select(2, 2, 2, 2);
    DestroyWindow(grid);
    ResetGrid();
    open(330, 168);
    told();
    model.setSelection(Block(2, 2, 2, 2));
    EXPECT_TRUE(isAsModel());
    EXPECT_EQ(highlight(), expectedHighlight());
    EXPECT_EQ(GetHandleToEquationControl(), edit);
    pressCell(3, 3);
    PressKey(grid, VK_RIGHT);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_CELLCLICKED D4", "sent GRIDN_SELECTIONDONE D4:D4",
                             "sent GRIDN_CURRENTCELL E4"}));
}

TEST_F(GridLifetime, SecondGridWithoutAReset) {
    open(330, 168);
    SetColumnWidth(1, 90);
    SetRowHeight(1, 30);
    DestroyWindow(grid);
    open(330, 168);
    EXPECT_TRUE(isAsModel());  // the sizes went with the first window
    EXPECT_EQ(SetColumnWidth(2, 40), 1u);
    EXPECT_EQ(SetRowHeight(2, 40), 1u);
    model.setColumnWidth(2, 40);
    model.setRowHeight(2, 40);
    send(GRIDM_REDRAW);
    model.toggleGridLines();
    EXPECT_TRUE(isAsModel());
}

TEST_F(GridLifetime, NothingStaysOnTheHeap) {
    open(330, 168);
    const int before = heap.live();
    SetColumnWidth(1, 90);
    SetRowHeight(1, 30);
    SetFirstVisibleCell(KORGRID_CELL(1, 1));
    EXPECT_GE(heap.live(), before);
    DestroyWindow(grid);
    EXPECT_EQ(heap.live(), 0) << heap.liveReport();
}

}  // namespace
}  // namespace kortest
