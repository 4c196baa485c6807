// Before the grid's window, its end, a second one after it, and ResetGrid.
#include "grid/grid_fixture.h"

namespace kortest {
namespace {

using GridLifetime = GridTest;
using GridReset = GridTest;
using GuardedGridLifetime = GuardedGridTest;

int CountCalls(const ImportSpy& spy, const std::string& name, const void* first) {
    int count = 0;
    for (const auto& call : spy.callsOf(name))
        count += call.arguments[0] == reinterpret_cast<ULONG_PTR>(first);
    return count;
}

// ---- Before there is a window ---------------------------------------------------------------

TEST_F(GridLifetime, NothingIsVisibleAtLoad) {
    EXPECT_EQ(VisibleRange(), (GridVisibleRange{0, 0, 0, 0}));
    EXPECT_EQ(GetNumberOfVisibleColumns(), 0u);
    EXPECT_EQ(GetNumberOfVisibleRows(), 0u);
    EXPECT_EQ(Selection(), (GridSelection{0, 0, 0, 0}));
    EXPECT_EQ(GetControlWithFocus(), nullptr);
    EXPECT_EQ(GetHandleToEquationControl(), nullptr);
    EXPECT_EQ(IsIndexVisible(0), 0u);
}

TEST_F(GridLifetime, ExportsBeforeTheWindowFailSilently) {
    SetCellValue(0, L"text", nullptr, 0, 0, 0, 0, 0, 0, 0);
    SetCellBackGroundColor(0, static_cast<HBRUSH>(GetStockObject(BLACK_BRUSH)));
    SetCellBorder(0, static_cast<HPEN>(GetStockObject(BLACK_PEN)), 1, 1, 1, 1);
    EXPECT_EQ(ToggleGridLines(), 1u);
    EXPECT_EQ(ToggleGridLines(), 1u);
    EXPECT_EQ(ToggleViewStateOfHeaders(), 1u);
    EXPECT_EQ(ToggleViewStateOfHeaders(), 0u);
    EXPECT_EQ(SetGridZoomLevel(8), 0u);
    EXPECT_EQ(SetGridZoomLevel(4), 0u);
    ResetGrid();
    SetFirstVisibleCell(0);
    EXPECT_EQ(host.transcript(), Lines{});
    create(400, 300);
    EXPECT_EQ(VisibleRange(), expected.visibleRange());
    EXPECT_EQ(HeaderSizes(columnHeader), ExpectedColumnSizes(expected));
}

TEST_F(GridLifetime, SettingsBeforeTheWindowAreKept) {
    EXPECT_EQ(SetColumnWidth(1, 100), 1u);
    EXPECT_EQ(SetRowHeight(2, 40), 1u);
    SetGridZoomLevel(8);
    ToggleViewStateOfHeaders();
    ToggleGridLines();
    create(400, 300);
    expected.columns[1] = 100;
    expected.rows[2] = 40;
    expected.zoom = 8;
    expected.headersHidden = true;
    expected.linesHidden = true;
    expected.fit();
    EXPECT_EQ(HeaderSizes(columnHeader), ExpectedColumnSizes(expected));
    EXPECT_EQ(HeaderSizes(rowHeader), ExpectedRowSizes(expected));
    Canvas canvas(400, 300, RGB(255, 255, 255));
    InvertExpectedSelection(canvas.dc(), expected);
    EXPECT_TRUE(SamePicture(canvas.picture(), image()));
}

// ---- The end ----------------------------------------------------------------------------------

TEST_F(GridLifetime, EndDeletesImageDCAndPenOnce) {
    spy.watchAll({"CreatePen", "DeleteObject", "DeleteDC", "CreateFontIndirectW", "LocalFree"});
    create(400, 300);
    destroy();
    create(400, 300);
    destroy();

    HPEN pen = nullptr;
    HFONT font = nullptr;
    spy.replace("CreatePen", [&](ULONG_PTR* arguments) {
        const ULONG_PTR made = spy.callReal("CreatePen", arguments);
        if (static_cast<COLORREF>(arguments[2]) == 0xB0B0B0) pen = reinterpret_cast<HPEN>(made);
        return made;
    });
    spy.replace("CreateFontIndirectW", [&](ULONG_PTR* arguments) {
        const ULONG_PTR made = spy.callReal("CreateFontIndirectW", arguments);
        if (!font) font = reinterpret_cast<HFONT>(made);
        return made;
    });
    create(400, 300);
    ASSERT_NE(pen, nullptr);
    ASSERT_NE(font, nullptr);
    const HGDIOBJ bitmap = GetCurrentObject(imageDC, OBJ_BITMAP);
    DestroyWindow(grid);
    EXPECT_EQ(CountCalls(spy, "DeleteObject", bitmap), 1);
    EXPECT_EQ(CountCalls(spy, "DeleteObject", pen), 1);
    EXPECT_EQ(CountCalls(spy, "DeleteObject", font), 0) << "the headers' font stays";
    EXPECT_EQ(CountCalls(spy, "DeleteDC", imageDC), 1);
    LOGFONTW description{};
    EXPECT_NE(GetObjectW(font, sizeof description, &description), 0);
}

// What the first grid had is gone, and its handles may be somebody else's by now.
TEST_F(GridLifetime, SecondGridDeletesNothingOfTheFirst) {
    create(400, 300);
    const HGDIOBJ bitmap = GetCurrentObject(imageDC, OBJ_BITMAP);
    const HDC dc = imageDC;
    spy.watchAll({"DeleteObject", "DeleteDC", "SelectObject"});
    DestroyWindow(grid);
    EXPECT_EQ(CountCalls(spy, "DeleteObject", bitmap), 1);
    EXPECT_EQ(CountCalls(spy, "DeleteDC", dc), 1);
    spy.clearCalls();
    grid = host.createGrid(400, 300);
    resize(300, 200);
    DestroyWindow(grid);
    EXPECT_EQ(CountCalls(spy, "DeleteObject", bitmap), 0);
    EXPECT_EQ(CountCalls(spy, "SelectObject", dc), 0);
    EXPECT_EQ(CountCalls(spy, "DeleteDC", dc), 0);
}

// A host that lays out its windows while they end: the next grid must not inherit this image.
TEST_F(GridLifetime, SizeAfterTheEndMakesNoImage) {
    create(400, 300);
    spy.watchAll({"CreateCompatibleBitmap"});
    SendMessageW(grid, WM_DESTROY, 0, 0);
    SendMessageW(grid, WM_SIZE, SIZE_RESTORED, MAKELPARAM(400, 300));
    EXPECT_EQ(spy.count("CreateCompatibleBitmap"), 0);
    ASSERT_NE(host.createGrid(300, 200), nullptr);
    EXPECT_EQ(spy.count("CreateCompatibleBitmap"), 1);
}

TEST_F(GridLifetime, EndAnswersZero) {
    create(400, 300);
    EXPECT_EQ(SendMessageW(grid, WM_DESTROY, 0, 0), 0);
}

TEST_F(GridLifetime, EndFreesTheSizes) {
    spy.watchAll({"LocalAlloc", "LocalFree"});
    create(400, 300);
    SetColumnWidth(0, 70);
    const auto columnCalls = spy.callsOf("LocalAlloc");
    ASSERT_EQ(columnCalls.size(), 1u);
    SetRowHeight(0, 20);
    const auto rowCalls = spy.callsOf("LocalAlloc");
    ASSERT_EQ(rowCalls.size(), 2u);
    DestroyWindow(grid);
    for (const auto& call : rowCalls)
        EXPECT_EQ(CountCalls(spy, "LocalFree", reinterpret_cast<void*>(call.result)), 1);
}

TEST_F(GridLifetime, EndWithoutAnySizeFreesNoNull) {
    spy.watchAll({"LocalFree", "DeleteObject", "DeleteDC"});
    create(0, 0);
    DestroyWindow(grid);
    EXPECT_EQ(CountCalls(spy, "LocalFree", nullptr), 0);
    EXPECT_EQ(CountCalls(spy, "DeleteObject", nullptr), 0);
    EXPECT_EQ(CountCalls(spy, "DeleteDC", nullptr), 0);
}

TEST_F(GuardedGridLifetime, SizesAreFreedOnceWhateverFollows) {
    create(400, 300);
    const int atRest = heap.live();
    SetColumnWidth(0, 70);
    SetRowHeight(0, 30);
    EXPECT_EQ(heap.live(), atRest + 2);
    SendMessageW(grid, WM_DESTROY, 0, 0);
    EXPECT_EQ(heap.live(), atRest);
    ResetGrid();
    SendMessageW(grid, WM_DESTROY, 0, 0);
    destroy();
    ResetGrid();
    EXPECT_EQ(heap.live(), 0) << heap.liveReport();
    EXPECT_EQ(heap.report(), "");
}

TEST_F(GuardedGridLifetime, ExportsAfterTheEndAreHarmless) {
    create(400, 300);
    for (int i = 0; i < 20; ++i) SetColumnWidth(i, 70 + i);
    const HWND oldEdit = edit;
    destroy();
    EXPECT_EQ(GetHandleToEquationControl(), oldEdit) << "handles are not forgotten";
    SetCellValue(0, L"text", nullptr, 0, 0, 0, 0, 0, 1, 0);
    SetCellBackGroundColor(0, static_cast<HBRUSH>(GetStockObject(BLACK_BRUSH)));
    SetCellBorder(0, static_cast<HPEN>(GetStockObject(BLACK_PEN)), 1, 1, 1, 1);
    ToggleGridLines();
    ToggleGridLines();
    ToggleViewStateOfHeaders();
    ToggleViewStateOfHeaders();
    SetGridZoomLevel(8);
    SetGridZoomLevel(4);
    SetFirstVisibleCell(KORGRID_CELL(3, 3));
    IsIndexVisible(0);
    IsIndexCompletelyVisible(0);
    PressOKButton();
    EXPECT_FALSE(IsWindow(grid));
}

// The counts of the sizes outlive the blocks; a missing block is an empty one all the same.
TEST_F(GuardedGridLifetime, SecondGridStartsWithoutTheFirstOnesSizes) {
    create(400, 300);
    for (int i = 0; i < 20; ++i) {
        SetColumnWidth(i, 70 + i);
        SetRowHeight(i, 20 + i);
    }
    destroy();
    create(400, 300);
    EXPECT_EQ(HeaderSizes(columnHeader), ExpectedColumnSizes(expected));
    EXPECT_EQ(HeaderSizes(rowHeader), ExpectedRowSizes(expected));
    for (int i = 0; i < 40; ++i) {
        const int item = i % 5;
        EXPECT_EQ(SetColumnWidth(item, 40 + i), 1u);
        expected.columns[item] = static_cast<unsigned>(40 + i);
    }
    for (int i = 39; i >= 0; --i) {
        EXPECT_EQ(SetRowHeight(i, 20 + i), 1u);
        expected.rows[i] = static_cast<unsigned>(20 + i);
    }
    SetFirstVisibleCell(0);
    expected.fitColumns(400);
    expected.fitRows(300 - expected.cellsTop());
    EXPECT_EQ(HeaderSizes(columnHeader), ExpectedColumnSizes(expected));
    EXPECT_EQ(HeaderSizes(rowHeader), ExpectedRowSizes(expected));
}

TEST_F(GridLifetime, SecondGridKeepsViewAndSelection) {
    create(400, 300);
    SetFirstVisibleCell(KORGRID_CELL(4, 7));
    SetSelectedRanged(KORGRID_PAIR(5, 6), KORGRID_PAIR(8, 9));
    SetGridZoomLevel(6);
    ToggleGridLines();
    destroy();
    create(400, 300);
    expected.firstColumn = 4;
    expected.firstRow = 7;
    expected.zoom = 6;
    expected.linesHidden = true;
    expected.selection = {5, 6, 8, 9};
    expected.fit();
    EXPECT_EQ(VisibleRange(), expected.visibleRange());
    EXPECT_EQ(Selection(), expected.selection);
    Canvas canvas(400, 300, RGB(255, 0, 0));
    DrawExpectedRedraw(canvas.dc(), expected, expected.client());
    EXPECT_TRUE(SamePicture(canvas.picture(), image()));
}

// ---- ResetGrid --------------------------------------------------------------------------------

TEST_F(GridReset, ScrollsToTheFirstCellAndForgetsTheSizes) {
    create(400, 300);
    SetFirstVisibleCell(KORGRID_CELL(3, 5));
    SetColumnWidth(0, 100);
    SetRowHeight(0, 50);
    ResetGrid();
    SetFirstVisibleCell(KORGRID_CELL(3, 5));
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0), 60);
    EXPECT_EQ(KorHeader_GetItemSize(rowHeader, 0), 16);
    ResetGrid();
    EXPECT_EQ(VisibleRange().firstColumn, 0);
    EXPECT_EQ(VisibleRange().firstRow, 0);
}

TEST_F(GridReset, FreesBothBlocksOnce) {
    spy.watchAll({"LocalAlloc", "LocalFree"});
    create(400, 300);
    SetColumnWidth(0, 100);
    SetRowHeight(0, 50);
    const auto blocks = spy.callsOf("LocalAlloc");
    ASSERT_EQ(blocks.size(), 2u);
    spy.clearCalls();
    ResetGrid();
    ResetGrid();
    for (const auto& block : blocks)
        EXPECT_EQ(CountCalls(spy, "LocalFree", reinterpret_cast<void*>(block.result)), 1);
    SetColumnWidth(0, 100);
    EXPECT_EQ(spy.count("LocalAlloc"), 1) << "a new block is made";
}

TEST_F(GridReset, RepaintsNothing) {
    create(400, 300);
    SetFirstVisibleCell(KORGRID_CELL(3, 5));
    endColumnResize(1, 90);
    settle();
    const Picture before = image();
    const auto labels = HeaderLabels(columnHeader);
    const auto sizes = HeaderSizes(columnHeader);
    TakeInvalid(grid);
    ResetGrid();
    EXPECT_EQ(host.transcript(), Lines{});
    EXPECT_EQ(TakeInvalid(grid), std::nullopt);
    EXPECT_TRUE(SamePicture(before, image()));
    EXPECT_EQ(HeaderLabels(columnHeader), labels);
    EXPECT_EQ(HeaderSizes(columnHeader), sizes);
}

TEST_F(GridReset, KeepsSelectionZoomCountsAndBars) {
    create(400, 300, RecordingHost::kGridStyleWithBars);
    SetHorizontalDataRange(100);
    SetVerticalDataRange(200);
    SetGridZoomLevel(6);
    SetFirstVisibleCell(KORGRID_CELL(3, 5));
    SetSelectedRanged(KORGRID_PAIR(4, 6), KORGRID_PAIR(7, 9));
    settle();
    const DWORD columns = GetNumberOfVisibleColumns();
    const DWORD rows = GetNumberOfVisibleRows();
    SCROLLINFO before[2];
    SCROLLINFO after[2];
    for (const int bar : {SB_HORZ, SB_VERT}) {
        before[bar] = {};
        before[bar].cbSize = sizeof(SCROLLINFO);
        before[bar].fMask = SIF_ALL;
        after[bar] = before[bar];
        GetScrollInfo(grid, bar, &before[bar]);
    }
    ResetGrid();
    EXPECT_EQ(Selection(), (GridSelection{4, 6, 7, 9}));
    EXPECT_EQ(GetNumberOfVisibleColumns(), columns);
    EXPECT_EQ(GetNumberOfVisibleRows(), rows);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0), 90);
    for (const int bar : {SB_HORZ, SB_VERT}) {
        GetScrollInfo(grid, bar, &after[bar]);
        EXPECT_EQ(after[bar].nPos, before[bar].nPos);
        EXPECT_EQ(after[bar].nMax, before[bar].nMax);
        EXPECT_EQ(after[bar].nPage, before[bar].nPage);
    }
    SetFirstVisibleCell(0);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0), 90) << "the zoom is the same";
}

TEST_F(GridReset, EmptiesTheEquationBarWithoutACommit) {
    create(400, 300);
    TypeCharacter(grid, L'7');
    settle();
    ASSERT_EQ(TextOf(edit), L"7");
    ResetGrid();
    EXPECT_EQ(TextOf(edit), L"");
    EXPECT_EQ(host.transcript(), Lines{});
}

}  // namespace
}  // namespace kortest
