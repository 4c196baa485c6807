// SetGridZoomLevel: layout, results, and levels that nobody can see.
#include "grid/grid_fixture.h"

namespace kortest {
namespace {

using GridZoom = GridTest;
using GuardedGridZoom = GuardedGridTest;

TEST_F(GridZoom, ReturnsWhetherTheHeadersAreHidden) {
    create(400, 300);
    EXPECT_EQ(SetGridZoomLevel(6), 0u);
    EXPECT_TRUE(IsWindowVisible(columnHeader));
    ToggleViewStateOfHeaders();
    EXPECT_EQ(SetGridZoomLevel(3), 1u);
    EXPECT_FALSE(IsWindowVisible(columnHeader));
    EXPECT_FALSE(IsWindowVisible(rowHeader));
}

TEST_F(GridZoom, EveryLevelRedrawsTheWholeGridOnce) {
    create(400, 300);
    for (const unsigned zoom : {1u, 2u, 3u, 4u, 5u, 6u, 8u}) {
        SCOPED_TRACE(zoom);
        host.clear();
        SetGridZoomLevel(zoom);
        expected.zoom = zoom;
        refit();
        const GridVisibleRange range = expected.visibleRange();
        EXPECT_EQ(host.transcript(),
                  (Lines{"sent GRIDN_PAINTCELLS columns 0-" + std::to_string(range.endColumn) +
                         " rows 0-" + std::to_string(range.endRow)}));
        Canvas canvas(400, 300, RGB(255, 0, 0));
        DrawExpectedRedraw(canvas.dc(), expected, expected.client());
        EXPECT_TRUE(SamePicture(canvas.picture(), image()));
    }
}

TEST_F(GridZoom, SizesThatWereChangedAreScaled) {
    create(400, 300);
    endColumnResize(0, 61);
    endColumnResize(1, 33);
    endRowResize(0, 17);
    endRowResize(2, 50);
    for (const unsigned zoom : {1u, 2u, 3u, 5u, 6u, 8u, 4u}) {
        SetGridZoomLevel(zoom);
        expected.zoom = zoom;
        refit();
        EXPECT_EQ(HeaderSizes(columnHeader), ExpectedColumnSizes(expected)) << zoom;
        EXPECT_EQ(HeaderSizes(rowHeader), ExpectedRowSizes(expected)) << zoom;
        EXPECT_EQ(VisibleRange(), expected.visibleRange()) << zoom;
    }
}

TEST_F(GridZoom, ZeroIsRefused) {
    create(400, 300);
    EXPECT_EQ(SetGridZoomLevel(6), 0u);
    EXPECT_EQ(SetGridZoomLevel(0), 0u);
    EXPECT_EQ(SetColumnWidth(1, 30), 1u);
    SetFirstVisibleCell(0);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0), 90) << "the level stays";
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 1), 30);
    EXPECT_EQ(KorHeader_GetItemSize(rowHeader, 0), 24);
    ToggleViewStateOfHeaders();
    EXPECT_EQ(SetGridZoomLevel(0), 1u);
    EXPECT_FALSE(IsWindowVisible(columnHeader));
}

// 16 bits of a size count: 1000000 * 15 leaves 57792, 1000000 * 4 leaves 2304.
TEST_F(GridZoom, MillionIsTruncatedTo16Bits) {
    create(400, 300);
    ToggleViewStateOfHeaders();
    EXPECT_EQ(SetGridZoomLevel(1000000), 1u);
    EXPECT_EQ(HeaderSizes(columnHeader), (std::vector<int>{57792}));
    EXPECT_EQ(HeaderSizes(rowHeader), (std::vector<int>{2304}));
    EXPECT_EQ(VisibleRange(), (GridVisibleRange{0, 1, 0, 1}));
    endColumnResize(0, 1);  // 250000 pixels leave 53392
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0), 250000 & 0xFFFF);
    endColumnResize(0, 65535);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0),
              static_cast<int>((65535ull * 1000000 >> 2) & 0xFFFF));
}

TEST_F(GridZoom, HeaderHigherThanTheWindowLeavesNoRows) {
    create(400, 300);
    EXPECT_EQ(SetGridZoomLevel(1000000), 0u);
    EXPECT_EQ(VisibleRange(), (GridVisibleRange{0, 1, 0, 0}));
    EXPECT_EQ(KorHeader_GetItemCount(rowHeader), 0);
    SetGridZoomLevel(4);
    EXPECT_EQ(VisibleRange(), expected.visibleRange());
}

// Of sizes that are 0 pixels any number would fit; 255 are counted.
TEST_F(GridZoom, AtMost255AreCounted) {
    create(400, 300);
    ToggleViewStateOfHeaders();
    SetGridZoomLevel(0x10000);
    EXPECT_EQ(VisibleRange(), (GridVisibleRange{0, 255, 0, 255}));
    EXPECT_EQ(KorHeader_GetItemCount(columnHeader), 255);
    EXPECT_EQ(KorHeader_GetItemCount(rowHeader), 255);
    SetFirstVisibleCell(KORGRID_CELL(10, 16300));
    EXPECT_EQ(VisibleRange(), (GridVisibleRange{10, 256, 16300, 16384})) << "the sheet ends first";
}

TEST_F(GridZoom, SmallRowsAreCountedTo255) {
    create(400, 300);
    for (int i = 0; i < 400; ++i) SetRowHeight(i, 0);
    for (int i = 0; i < 256; ++i) SetColumnWidth(i, 1);
    SetFirstVisibleCell(0);
    EXPECT_EQ(VisibleRange(), (GridVisibleRange{0, 255, 0, 255}));
    SetFirstVisibleCell(KORGRID_CELL(0, 350));
    expected.firstRow = 350;
    for (int i = 0; i < 400; ++i) expected.rows[i] = 0;
    expected.fitRows(expected.clientHeight - expected.cellsTop());
    EXPECT_EQ(GetNumberOfVisibleRows(), static_cast<DWORD>(expected.rowCount));
}

TEST_F(GuardedGridZoom, ExtremeLevelsAreSurvived) {
    create(400, 300);
    const HFONT font = CreateFontW(13, 0, 0, 0, 400, 0, 0, 0, DEFAULT_CHARSET, 0, 0, 0, 0, L"");
    host.onPaintCells = [&](const GridVisibleRange& range) {
        const CellIndex cell = KORGRID_CELL(range.firstColumn, range.firstRow);
        SetCellValue(cell, L"12345", font, 0, 0xFFFFFF, 0, 1, 1, 1, 0);
        SetCellBackGroundColor(cell, static_cast<HBRUSH>(GetStockObject(GRAY_BRUSH)));
        SetCellBorder(cell, static_cast<HPEN>(GetStockObject(BLACK_PEN)), 1, 1, 1, 1);
    };
    for (const DWORD zoom : {9u, 100u, 0x4444u, 0x7FFFu, 0x8000u, 0xFFFFu, 0x3FFFFFFFu, 0x40000000u,
                             0x7FFFFFFFu, 0x80000000u, 0xFFFFFFFFu}) {
        SetGridZoomLevel(zoom);
        SetColumnWidth(0, 100);
        SetRowHeight(0, 100);
        SendResized(grid, columnHeader, 0, 500);
        SendResizing(grid, rowHeader, 40);
        SendResized(grid, rowHeader, 0, 20);
        PressAt(grid, 100, 100);
        ReleaseAt(grid, 100, 100);
        ToggleViewStateOfHeaders();
        SetFirstVisibleCell(KORGRID_CELL(255, 16383));
        SetFirstVisibleCell(0);
        ResetGrid();
    }
    host.onPaintCells = nullptr;
    DeleteObject(font);
    SetGridZoomLevel(4);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0), 60);
}

}  // namespace
}  // namespace kortest
