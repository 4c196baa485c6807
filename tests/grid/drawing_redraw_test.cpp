// One redraw: what happens in which order, what the host finds and what becomes invalid.
#include "grid/grid_fixture.h"

namespace kortest {
namespace {

using GridRedraw = GridTest;
using GuardedGridRedraw = GuardedGridTest;

std::string Describe(const ImportCall& call) {
    std::string text = call.name;
    for (size_t i = 1; i < 5 && i < call.arguments.size(); ++i)
        text = Joined(text, " ", static_cast<int>(NumberAt(call, i)));
    return text;
}

// The steps of a redraw that reach the image or the host, in order. Lines count as one step.
std::vector<std::string> Steps(const ImportSpy& spy, HDC imageDC, HWND host, HWND grid) {
    std::vector<std::string> steps;
    for (const auto& call : spy.calls()) {
        const ULONG_PTR first = call.arguments[0];
        std::string step;
        if (call.name == "PatBlt" && first == reinterpret_cast<ULONG_PTR>(imageDC))
            step = Joined(Describe(call), NumberAt(call, 5) == DSTINVERT ? " invert" : " whiten");
        else if (call.name == "SendMessageW" && first == reinterpret_cast<ULONG_PTR>(host))
            step = Joined("notify ", call.arguments[2]);
        else if (call.name == "InvalidateRect" && first == reinterpret_cast<ULONG_PTR>(grid))
            step = "invalidate";
        else if (first == reinterpret_cast<ULONG_PTR>(imageDC) &&
                 (call.name == "Polyline" || call.name == "LineTo" || call.name == "PolyPolyline"))
            step = "lines";
        else
            continue;
        if (step == "lines" && !steps.empty() && steps.back() == "lines") continue;
        steps.push_back(step);
    }
    return steps;
}

const std::vector<std::string> kDrawing = {"PatBlt", "SendMessageW", "InvalidateRect",
                                           "LineTo", "Polyline",     "PolyPolyline"};

TEST_F(GridRedraw, StepsComeInOrder) {
    create(400, 300);
    const int top = expected.cellsTop();
    const std::string highlight = Joined("PatBlt 30 ", top, " 60 16 invert");
    const std::string cells = Joined("PatBlt 30 ", top, " 370 ", 300 - top, " whiten");
    spy.watchAll(kDrawing);
    SendMessageW(grid, GRIDM_REDRAW, 0, 0);
    EXPECT_EQ(Steps(spy, imageDC, host.window(), grid),
              (std::vector<std::string>{highlight, cells, "lines", "notify 3425", highlight,
                                        "invalidate"}));
}

TEST_F(GridRedraw, WithoutLinesTheOtherStepsStay) {
    create(400, 300);
    SetSelectedRanged(KORGRID_PAIR(200, 201), KORGRID_PAIR(9, 9));
    ToggleGridLines();
    spy.watchAll(kDrawing);
    SetFirstVisibleCell(0);
    const auto steps = Steps(spy, imageDC, host.window(), grid);
    EXPECT_EQ(steps,
              (std::vector<std::string>{"PatBlt 0 0 400 300 whiten", "notify 3425", "invalidate"}));
}

TEST_F(GridRedraw, HostFindsWhiteCellsWithLinesAndNoHighlight) {
    create(400, 300);
    SetSelectedRanged(KORGRID_PAIR(1, 3), KORGRID_PAIR(2, 5));
    PatBlt(imageDC, 0, 0, 400, 300, BLACKNESS);
    Canvas canvas(400, 300, RGB(0, 0, 0));
    expected.selection = {1, 3, 2, 5};
    InvertExpectedSelection(canvas.dc(), expected);  // what the first step leaves outside the cells
    DrawExpectedLines(canvas.dc(), expected, expected.cells());
    Picture found;
    std::optional<RECT> invalid;
    TakeInvalid(grid);
    host.onPaintCells = [&](const GridVisibleRange&) {
        found = image();
        invalid = TakeInvalid(grid);
    };
    SendMessageW(grid, GRIDM_REDRAW, 0, 0);
    host.onPaintCells = nullptr;
    EXPECT_TRUE(SamePicture(canvas.picture(), found));
    EXPECT_EQ(invalid, std::nullopt) << "the area becomes invalid when all is drawn";
    InvertExpectedSelection(canvas.dc(), expected);
    EXPECT_TRUE(SamePicture(canvas.picture(), image()));
}

TEST_F(GridRedraw, HostGetsTheVisibleRange) {
    create(400, 300);
    SetFirstVisibleCell(KORGRID_CELL(7, 40));
    std::vector<GridVisibleRange> ranges;
    host.onPaintCells = [&](const GridVisibleRange& range) { ranges.push_back(range); };
    SendMessageW(grid, GRIDM_REDRAW, 0, 0);
    host.onPaintCells = nullptr;
    ASSERT_EQ(ranges.size(), 1u);
    expected.firstColumn = 7;
    expected.firstRow = 40;
    expected.fit();
    EXPECT_EQ(ranges[0], expected.visibleRange());
}

TEST_F(GridRedraw, HighlightLiesOverWhatTheHostDraws) {
    create(400, 300);
    const HBRUSH brush = CreateSolidBrush(RGB(0x12, 0x34, 0x56));
    host.onPaintCells = [&](const GridVisibleRange&) { SetCellBackGroundColor(0, brush); };
    SendMessageW(grid, GRIDM_REDRAW, 0, 0);
    host.onPaintCells = nullptr;
    DeleteObject(brush);
    const int top = expected.cellsTop();
    EXPECT_EQ(image().pixel(40, top + 5), RGB(0xED, 0xCB, 0xA9));
    EXPECT_EQ(image().pixel(90, top + 5), RGB(0x12, 0x34, 0x56)) << "the extra pixel at the right";
    UpdateWindow(grid);
    EXPECT_EQ(ReadWindow(grid).pixel(40, top + 5), RGB(0xED, 0xCB, 0xA9));
}

TEST_F(GridRedraw, InvalidatesTheRedrawnRectangle) {
    create(400, 300);
    TakeInvalid(grid);
    SendMessageW(grid, GRIDM_REDRAW, 0, 0);
    EXPECT_EQ(TakeInvalid(grid), expected.cells());
    SetFirstVisibleCell(0);
    EXPECT_EQ(TakeInvalid(grid), expected.client());
    SetGridZoomLevel(5);
    EXPECT_EQ(TakeInvalid(grid), expected.client());
}

// What is drawn outside the notification lasts until the next redraw.
TEST_F(GridRedraw, NextRedrawWhitensWhatTheHostDrew) {
    create(400, 300);
    const Picture before = image();
    SetCellBackGroundColor(KORGRID_CELL(2, 2), static_cast<HBRUSH>(GetStockObject(BLACK_BRUSH)));
    SetCellValue(KORGRID_CELL(3, 3), L"text", nullptr, 0, 0xFFFFFF, 0, 0, 0, 0, 0);
    EXPECT_FALSE(before == image());
    SendMessageW(grid, GRIDM_REDRAW, 0, 0);
    EXPECT_TRUE(SamePicture(before, image()));
}

// A whole screen painted by a host, compared with the same calls in plain GDI.
TEST_F(GridRedraw, PaintedScreenMatchesTheStatedSteps) {
    create(400, 300);
    const HFONT font = CreateFontW(-13, 0, 0, 0, 700, 0, 0, 0, DEFAULT_CHARSET, 0, 0, 0, 0, L"");
    const HBRUSH brush = CreateSolidBrush(RGB(250, 240, 200));
    const HPEN pen = CreatePen(PS_SOLID, 1, RGB(200, 0, 0));
    const auto textOf = [&](int column, int row) {
        CellText value;
        value.cell = KORGRID_CELL(column, row);
        value.text = std::to_wstring(column * 1000 + row * 7919);
        value.font = (column + row) % 2 ? font : nullptr;
        value.fitCheck = 1;
        return value;
    };
    for (const unsigned zoom : {4u, 3u, 6u}) {
        SCOPED_TRACE(zoom);
        host.onPaintCells = [&](const GridVisibleRange& range) {
            for (int row = range.firstRow; row < range.endRow; ++row)
                for (int column = range.firstColumn; column < range.endColumn; ++column) {
                    const CellIndex cell = KORGRID_CELL(column, row);
                    if (row % 3 == 0) SetCellBackGroundColor(cell, brush);
                    SetCellText(textOf(column, row));
                    if (column % 2 == 0) SetCellBorder(cell, pen, 0, 1, 0, 1);
                }
        };
        SetGridZoomLevel(zoom);
        host.onPaintCells = nullptr;
        expected.zoom = zoom;
        refit();
        Canvas canvas(400, 300, RGB(0, 0, 0));
        DrawExpectedRedraw(canvas.dc(), expected, expected.client(), [&] {
            for (int row = 0; row < expected.rowCount; ++row)
                for (int column = 0; column < expected.columnCount; ++column) {
                    const CellIndex cell = KORGRID_CELL(column, row);
                    if (row % 3 == 0) DrawExpectedBackground(canvas.dc(), expected, cell, brush);
                    DrawExpectedText(canvas.dc(), expected, textOf(column, row));
                    if (column % 2 == 0)
                        DrawExpectedBorder(canvas.dc(), expected, cell, pen, 0, 1, 0, 1);
                }
        });
        EXPECT_TRUE(SamePicture(canvas.picture(), image()));
    }
    DeleteObject(font);
    DeleteObject(brush);
    DeleteObject(pen);
}

// ---- A host that calls back -----------------------------------------------------------------

TEST_F(GuardedGridRedraw, HostMayChangeTheGridInsideTheNotification) {
    create(400, 300);
    int depth = 0;
    int calls = 0;
    host.onPaintCells = [&](const GridVisibleRange&) {
        if (++depth < 4) {
            switch (calls++ % 7) {
            case 0: SetColumnWidth(0, 77); break;
            case 1: ResetGrid(); break;
            case 2: SetFirstVisibleCell(KORGRID_CELL(3, 3)); break;
            case 3: SetGridZoomLevel(5); break;
            case 4: ToggleViewStateOfHeaders(); break;
            case 5: SetSelectedRanged(KORGRID_PAIR(1, 2), KORGRID_PAIR(3, 4)); break;
            default: SendMessageW(grid, GRIDM_REDRAW, 0, 0);
            }
        }
        --depth;
    };
    for (int i = 0; i < 20; ++i) SendMessageW(grid, GRIDM_REDRAW, 0, 0);
    host.onPaintCells = nullptr;
    EXPECT_GT(calls, 20);
}

TEST_F(GuardedGridRedraw, HostMayDestroyTheGridInsideTheNotification) {
    create(400, 300);
    host.onPaintCells = [&](const GridVisibleRange&) { DestroyWindow(grid); };
    SendMessageW(grid, GRIDM_REDRAW, 0, 0);
    host.onPaintCells = nullptr;
    EXPECT_FALSE(IsWindow(grid));
    create(400, 300);
    host.onMessage = [&](UINT message, WPARAM wParam, LPARAM) -> LRESULT {
        if (message == WM_NOTIFY && wParam == GRIDN_COLUMNRESIZED) DestroyWindow(grid);
        return 0;
    };
    SendResized(grid, columnHeader, 0, 70);
    host.onMessage = nullptr;
    EXPECT_FALSE(IsWindow(grid));
    create(400, 300);
    EXPECT_EQ(GetNumberOfVisibleColumns(), 7u);
}

}  // namespace
}  // namespace kortest
