// Drawing for a long time, with objects that cannot be made, and with senseless arguments.
#include "grid/grid_fixture.h"
#include "support/handle_balance.h"

#include <climits>
#include <random>

namespace kortest {
namespace {

using GridLeaks = GridTest;

// A host that uses every drawing export.
void PaintEverything(const GridVisibleRange& range, HFONT font, HBRUSH brush, HPEN pen) {
    for (int row = range.firstRow; row < range.endRow && row < range.firstRow + 3; ++row)
        for (int column = range.firstColumn; column < range.endColumn; ++column) {
            const CellIndex cell = KORGRID_CELL(column, row);
            SetCellBackGroundColor(cell, brush);
            SetCellValue(cell, L"1234567", font, 0, 0xFFFFFF, 0, 1, 1, 1, 0);
            SetCellValue(cell, L"mid", font, 0, 0xFFFFFF, 0, 1, 1, 0, 0);
            SetCellBorder(cell, pen, 1, 1, 1, 1);
        }
}

WORD NextPenSlot() {
    const HPEN pen = CreatePen(PS_SOLID, 1, RGB(1, 2, 3));
    const WORD slot = LOWORD(reinterpret_cast<ULONG_PTR>(pen));
    DeleteObject(pen);
    return slot;
}

class GridLongUse : public GridTest {
protected:
    ~GridLongUse() override {
        DeleteObject(font);
        DeleteObject(brush);
        DeleteObject(pen);
    }

    void start() {
        create(300, 200);
        host.leaveOut(GRIDN_PAINTCELLS);
        host.onPaintCells = [this](const GridVisibleRange& range) {
            PaintEverything(range, font, brush, pen);
        };
    }

    void useOnce(int round) {
        SetGridZoomLevel(static_cast<DWORD>(2 + round % 6));
        SendMessageW(grid, GRIDM_REDRAW, 0, 0);
        SetWindowPos(grid, nullptr, 0, 0, 300 + round % 2, 200, SWP_NOMOVE | SWP_NOZORDER);
        SendResizing(grid, columnHeader, 50);
        SendResized(grid, columnHeader, 1, 40 + round % 50);
        SendResizing(grid, rowHeader, 20);
        SendResized(grid, rowHeader, 1, 10 + round % 20);
        ToggleGridLines();
        ToggleViewStateOfHeaders();
        SetFirstVisibleCell(KORGRID_CELL(round % 200, round));
        UpdateWindow(grid);
    }

    const HFONT font = CreateFontW(-13, 0, 0, 0, 400, 0, 0, 0, DEFAULT_CHARSET, 0, 0, 0, 0, L"");
    const HBRUSH brush = CreateSolidBrush(RGB(250, 250, 200));
    const HPEN pen = CreatePen(PS_SOLID, 1, RGB(200, 0, 0));
};

TEST_F(GridLongUse, KeepsNoGdiObject) {
    start();
    for (int round = 0; round < 10; ++round) useOnce(round);
    const int before = NextPenSlot();
    for (int round = 0; round < 150; ++round) {
        useOnce(round);
        spy.clearCalls();
    }
    // A single object kept in each round would take 150 slots; the system's own come and go.
    EXPECT_LT(NextPenSlot(), before + 50);
}

TEST_F(GridLongUse, GivesBackEveryObjectItMakes) {
    start();
    WatchHandles(spy);
    for (int round = 0; round < 20; ++round) {
        ToggleGridLines();
        SetGridZoomLevel(static_cast<DWORD>(2 + round % 6));
        SendResizing(grid, columnHeader, 50);
        SendResized(grid, columnHeader, 1, 40 + round);
        spy.clearCalls();
        SendMessageW(grid, GRIDM_REDRAW, 0, 0);
        SendResizing(grid, rowHeader, 20);
        SendResized(grid, rowHeader, 1, 10 + round % 20);
        SetFirstVisibleCell(KORGRID_CELL(round, round));
        ToggleGridLines();
        UpdateWindow(grid);
        EXPECT_EQ(UnreturnedHandles(spy), std::vector<std::string>{});
    }
}

// The headers' font is the one object that stays for good.
TEST_F(GridLongUse, WholeLifeGivesBackAllButTheHeadersFont) {
    start();
    destroy();
    WatchHandles(spy);
    spy.clearCalls();
    create(300, 200);
    // create() forgets the calls, so the life that is looked at begins here.
    DestroyWindow(grid);
    spy.clearCalls();
    grid = host.createGrid(300, 200);
    columnHeader = ColumnHeaderOf(grid);
    rowHeader = RowHeaderOf(grid);
    for (int round = 0; round < 5; ++round) useOnce(round);
    DestroyWindow(grid);
    EXPECT_EQ(UnreturnedHandles(spy), std::vector<std::string>{"CreateFontIndirectW"});
}

class GridLongUseGuarded : public GuardedGridTest {};

TEST_F(GridLongUseGuarded, KeepsNoHeapBlock) {
    create(300, 200);
    SetColumnWidth(0, 50);
    SetRowHeight(0, 20);
    SendMessageW(grid, GRIDM_REDRAW, 0, 0);
    const int before = heap.live();
    for (int round = 0; round < 150; ++round) {
        SetFirstVisibleCell(KORGRID_CELL(round, round));
        SendMessageW(grid, GRIDM_REDRAW, 0, 0);
        SetColumnWidth(0, 40 + round % 20);
        SetFirstVisibleCell(0);
        spy.clearCalls();
    }
    SendMessageW(grid, GRIDM_REDRAW, 0, 0);
    // New sizes may have made one block larger; a block per redraw would be hundreds.
    EXPECT_NEAR(heap.live(), before, 2) << heap.liveReport();
}

// ---- Objects that cannot be made ----------------------------------------------------------------

class GridDrawingFaults : public GuardedGridTest,
                          public ::testing::WithParamInterface<const char*> {};

TEST_P(GridDrawingFaults, AreSurvivedOneByOne) {
    const HFONT font = CreateFontW(-13, 0, 0, 0, 400, 0, 0, 0, DEFAULT_CHARSET, 0, 0, 0, 0, L"");
    const HBRUSH brush = CreateSolidBrush(RGB(250, 250, 200));
    const HPEN pen = CreatePen(PS_SOLID, 1, RGB(200, 0, 0));
    create(160, 110);
    SetGridZoomLevel(5);
    const std::string name = GetParam();
    if (!spy.watch(name)) {
        GTEST_SKIP() << "the library does not call " << name;
    }
    host.onPaintCells = [&](const GridVisibleRange& range) {
        PaintEverything(range, font, brush, pen);
    };
    const auto use = [&] {
        SendMessageW(grid, GRIDM_REDRAW, 0, 0);
        SendResizing(grid, columnHeader, 50);
        SendResized(grid, columnHeader, 0, 55);
        SendMessageW(grid, WM_SIZE, 0, 0);
        SetColumnWidth(1, 33);
        InvalidateRect(grid, nullptr, FALSE);
        UpdateWindow(grid);
    };
    int failures = 0;
    for (int nth = 1; nth <= 60; ++nth) {
        spy.clearCalls();
        spy.failNth(name, nth);
        use();
        bool failed = false;
        for (const auto& call : spy.callsOf(name)) failed |= call.failed;
        spy.stopFailing(name);
        if (!failed) break;
        ++failures;
    }
    EXPECT_GT(failures, 0) << name << " was never called";
    // Whatever failed, the next layout and redraw are whole.
    host.onPaintCells = nullptr;
    ResetGrid();
    SetGridZoomLevel(4);
    SendMessageW(grid, WM_SIZE, 0, 0);
    expected.fit();
    Canvas canvas(160, 110, RGB(0, 0, 0));
    DrawExpectedRedraw(canvas.dc(), expected, expected.client());
    EXPECT_TRUE(SamePicture(canvas.picture(), image()));
    DeleteObject(font);
    DeleteObject(brush);
    DeleteObject(pen);
}

std::string ImportTestName(const ::testing::TestParamInfo<const char*>& info) { return info.param; }

INSTANTIATE_TEST_SUITE_P(Imports, GridDrawingFaults,
                         ::testing::Values("CreateFontIndirectW", "CreateCompatibleBitmap", "GetDC",
                                           "SelectObject", "GetObjectW", "LocalAlloc", "BeginPaint",
                                           "PatBlt"),
                         ImportTestName);

// ---- Senseless arguments ------------------------------------------------------------------------

class GridSenselessCalls : public GuardedGridTest, public ::testing::WithParamInterface<unsigned> {
protected:
    LONG number() {
        static const LONG kExtremes[] = {0,          1,        2,        -1,           -2,
                                         255,        256,      257,      16383,        16384,
                                         32767,      32768,    65535,    65536,        -32768,
                                         -65536,     LONG_MAX, LONG_MIN, LONG_MAX - 1, LONG_MIN + 1,
                                         0x40000000, 1000000};
        if (random() % 2) return static_cast<LONG>(random() % 20);
        if (random() % 3) return kExtremes[random() % std::size(kExtremes)];
        return static_cast<LONG>(random());
    }

    DWORD value() { return static_cast<DWORD>(number()); }

    CellIndex cell() {
        if (random() % 3) return KORGRID_CELL(random() % 8, random() % 8);
        return value();
    }

    void callOne(HFONT font, HBRUSH brush, HPEN pen) {
        static const wchar_t* const kTexts[] = {nullptr, L"", L"text", L"1234567890123456"};
        const HFONT odd =
            random() % 4 ? font : reinterpret_cast<HFONT>(static_cast<ULONG_PTR>(value()));
        switch (random() % 21) {
        case 0:
        case 1:
        case 2:
        case 3:
            SetCellValue(cell(), kTexts[random() % 4], odd, value(), value(),
                         value() & ~static_cast<UINT>(DT_MODIFYSTRING), number(), number(), value(),
                         value());
            break;
        case 4: SetCellBackGroundColor(cell(), random() % 3 ? brush : nullptr); break;
        case 5:
            SetCellBorder(cell(), random() % 3 ? pen : nullptr, value(), value(), value(), value());
            break;
        case 6: SetColumnWidth(number(), number()); break;
        case 7: SetRowHeight(number(), number()); break;
        case 8: SetGridZoomLevel(value()); break;
        case 9: ToggleViewStateOfHeaders(); break;
        case 10: ToggleGridLines(); break;
        case 11: ToggleHorizontalScrollBar(); break;
        case 12: ToggleVerticalScrollBar(); break;
        case 13: SetHorizontalDataRange(number()); break;
        case 14: SetVerticalDataRange(number()); break;
        case 15: SetFirstVisibleCell(cell()); break;
        case 16: SetSelectedRanged(value(), value()); break;
        case 17:
            IsIndexCompletelyVisible(cell());
            IsIndexVisible(cell());
            break;
        case 18: ResetGrid(); break;
        case 19: SetGridZoomLevel(4); break;
        default:
            GetVisibleRange(nullptr);
            GetSelectedRanged(nullptr);
            EXPECT_EQ(GetCurrentSelectedCell(nullptr), 0u);
            PressOKButton();
        }
    }

    std::mt19937 random;
};

TEST_P(GridSenselessCalls, ChangeNothingOutsideTheGrid) {
    random.seed(GetParam());
    const HFONT font = CreateFontW(-13, 0, 0, 0, 400, 0, 0, 0, DEFAULT_CHARSET, 0, 0, 0, 0, L"");
    const HBRUSH brush = CreateSolidBrush(RGB(250, 250, 200));
    const HPEN pen = CreatePen(PS_SOLID, 1, RGB(200, 0, 0));
    create(200, 120);
    host.leaveOut(GRIDN_PAINTCELLS);
    for (int i = 0; i < 400; ++i) {
        callOne(font, brush, pen);
        spy.clearCalls();
        if (i % 50 == 0) host.pump();
    }
    DeleteObject(font);
    DeleteObject(brush);
    DeleteObject(pen);
    EXPECT_TRUE(IsWindow(grid));
    SetGridZoomLevel(4);
    ResetGrid();
    SetFirstVisibleCell(0);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0), 60);
}

INSTANTIATE_TEST_SUITE_P(Seeds, GridSenselessCalls, ::testing::Range(1u, 13u));

}  // namespace
}  // namespace kortest
