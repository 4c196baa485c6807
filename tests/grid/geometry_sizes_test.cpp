// Sizes in units, and what they are in pixels: defaults, SetColumnWidth and SetRowHeight.
#include "grid/grid_fixture.h"

#include <climits>

namespace kortest {
namespace {

using GridSizes = GridTest;

// Every column's pixels, read from the header's first item; scrolls the grid.
std::vector<int> AllColumnSizes(HWND columnHeader) {
    std::vector<int> sizes;
    for (int column = 0; column < KORGRID_COLUMNS; ++column) {
        SetFirstVisibleCell(KORGRID_CELL(column, 0));
        sizes.push_back(KorHeader_GetItemSize(columnHeader, 0));
    }
    return sizes;
}

std::vector<int> FirstRowSizes(HWND rowHeader, int count) {
    std::vector<int> sizes;
    for (int row = 0; row < count; ++row) {
        SetFirstVisibleCell(KORGRID_CELL(0, row));
        sizes.push_back(KorHeader_GetItemSize(rowHeader, 0));
    }
    return sizes;
}

TEST_F(GridSizes, DefaultsFollowTheZoom) {
    create(400, 300);
    struct {
        DWORD zoom;
        int width, height;
    } const cases[] = {{1, 15, 4},  {2, 30, 8},  {3, 45, 12},  {4, 60, 16},
                       {5, 75, 20}, {6, 90, 24}, {8, 120, 32}, {16, 240, 64}};
    for (const auto& each : cases) {
        SetGridZoomLevel(each.zoom);
        for (const int size : HeaderSizes(columnHeader)) EXPECT_EQ(size, each.width) << each.zoom;
        for (const int size : HeaderSizes(rowHeader)) EXPECT_EQ(size, each.height) << each.zoom;
        EXPECT_FALSE(HeaderSizes(rowHeader).empty());
    }
}

TEST_F(GridSizes, UnitsBecomePixelsByQuartersRoundedDown) {
    create(400, 300);
    const int units[] = {0,    1,     2,     3,     5,     7,     15,    16,    17,    59,
                         60,   61,    63,    99,    101,   255,   256,   300,   999,   1023,
                         4095, 16383, 16384, 21845, 32767, 32768, 43691, 65533, 65534, 65535};
    for (const unsigned zoom : {1u, 2u, 3u, 4u, 5u, 6u, 7u, 8u, 13u}) {
        SetGridZoomLevel(zoom);
        expected.zoom = zoom;
        for (const int each : units) {
            endColumnResize(0, each);
            endRowResize(0, each);
            ASSERT_EQ(KorHeader_GetItemSize(columnHeader, 0), expected.width(0))
                << each << " units at zoom " << zoom;
            ASSERT_EQ(KorHeader_GetItemSize(rowHeader, 0), expected.height(0))
                << each << " units at zoom " << zoom;
        }
    }
}

TEST_F(GridSizes, PixelsBecomeUnitsRoundedDown) {
    create(640, 480);
    struct {
        DWORD zoom;
        int pixels, units;
    } const cases[] = {{1, 1, 4},     {1, 100, 400}, {2, 30, 60},  {2, 33, 66},   {3, 100, 133},
                       {3, 1, 1},     {3, 2, 2},     {3, 4, 5},    {4, 77, 77},   {5, 1, 0},
                       {5, 99, 79},   {6, 1, 0},     {6, 100, 66}, {8, 101, 50},  {8, 1, 0},
                       {7, 200, 114}, {16, 333, 83}, {16, 3, 0},   {1000, 600, 2}};
    for (const auto& each : cases) {
        SCOPED_TRACE(::testing::Message() << each.pixels << " pixels at zoom " << each.zoom);
        SetGridZoomLevel(each.zoom);
        ASSERT_EQ(SetColumnWidth(0, each.pixels), 1u);
        const bool rowFits = each.zoom < 16;  // else the column header leaves no cell area
        if (rowFits) {
            ASSERT_EQ(SetRowHeight(0, each.pixels), 1u);
        }
        SetGridZoomLevel(4);
        EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0), each.units);
        if (rowFits) {
            EXPECT_EQ(KorHeader_GetItemSize(rowHeader, 0), each.units);
        }
    }
}

TEST_F(GridSizes, EveryWidthAtManyZooms) {
    create(640, 480);
    for (const unsigned zoom : {1u, 3u, 5u, 6u, 7u, 11u}) {
        SCOPED_TRACE(zoom);
        ResetGrid();
        SetFirstVisibleCell(0);
        SetGridZoomLevel(zoom);
        expected.zoom = zoom;
        std::vector<int> wanted;
        for (int column = 0; column < KORGRID_COLUMNS; ++column) {
            const int pixels = column * 3 + 1;
            ASSERT_EQ(SetColumnWidth(column, pixels), 1u);
            wanted.push_back(static_cast<int>(expected.unitsForWidth(pixels)));
        }
        SetGridZoomLevel(4);
        ASSERT_EQ(AllColumnSizes(columnHeader), wanted);
    }
}

TEST_F(GridSizes, EveryHeightAtManyZooms) {
    create(640, 480);
    for (const unsigned zoom : {1u, 3u, 5u, 7u}) {
        SCOPED_TRACE(zoom);
        ResetGrid();
        SetFirstVisibleCell(0);
        SetGridZoomLevel(zoom);
        expected.zoom = zoom;
        std::vector<int> wanted;
        for (int row = 0; row < 200; ++row) {
            const int pixels = row * 3 + 1;
            ASSERT_EQ(SetRowHeight(row, pixels), 1u);
            wanted.push_back(static_cast<int>(expected.unitsForHeight(pixels)));
        }
        SetGridZoomLevel(4);
        ASSERT_EQ(FirstRowSizes(rowHeader, 200), wanted);
    }
}

TEST_F(GridSizes, Zoom50PercentTakesPixelsForHalfUnits) {
    create(400, 300);
    SetGridZoomLevel(2);
    const auto before = HeaderSizes(columnHeader);
    EXPECT_EQ(SetColumnWidth(2, 30), 1u);
    SetFirstVisibleCell(0);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 2), 30) << "looks unchanged";
    SetGridZoomLevel(4);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 2), 60);
}

TEST_F(GridSizes, OnlyTheLow16BitsCount) {
    create(400, 300);
    EXPECT_EQ(SetColumnWidth(0, 0x10000 + 100), 1u);
    EXPECT_EQ(SetRowHeight(0, static_cast<LONG>(0xFFFF0000) + 44), 1u);
    SetFirstVisibleCell(0);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0), 100);
    EXPECT_EQ(KorHeader_GetItemSize(rowHeader, 0), 44);
    EXPECT_EQ(SetColumnWidth(0, -1), 1u);
    SetFirstVisibleCell(0);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0), 360) << "65535 is cut";
}

TEST_F(GridSizes, WidthIsCutToTheCellAreaLessTen) {
    create(400, 300);  // 370 pixels of cells
    for (const LONG width : {371L, 372L, 400L, 1000L, 40000L, 65535L}) {
        EXPECT_EQ(SetColumnWidth(1, width), 1u);
        SetFirstVisibleCell(0);
        EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 1), 360) << width;
    }
    EXPECT_EQ(SetColumnWidth(1, 370), 1u);
    SetFirstVisibleCell(0);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 1), 370) << "as wide as the area is not cut";
}

TEST_F(GridSizes, HeightIsCutToTheCellAreaLessTen) {
    create(400, 300);
    const int area = expected.clientHeight - expected.cellsTop();
    for (const int height : {area + 1, area + 2, 300, 5000, 65535}) {
        EXPECT_EQ(SetRowHeight(1, height), 1u);
        SetFirstVisibleCell(0);
        EXPECT_EQ(KorHeader_GetItemSize(rowHeader, 1), area - 10) << height;
    }
    EXPECT_EQ(SetRowHeight(1, area), 1u);
    SetFirstVisibleCell(0);
    EXPECT_EQ(KorHeader_GetItemSize(rowHeader, 1), area) << "as high as the area is not cut";
}

TEST_F(GridSizes, HiddenHeadersGiveTheirRoomToTheCells) {
    create(400, 300);
    ToggleViewStateOfHeaders();
    EXPECT_EQ(SetColumnWidth(1, 401), 1u);
    EXPECT_EQ(SetColumnWidth(0, 400), 1u);
    SetFirstVisibleCell(0);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0), 400);
    SetFirstVisibleCell(1);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0), 390);
    EXPECT_EQ(SetRowHeight(0, 300 - expected.equationBarHeight + 1), 1u);
    SetFirstVisibleCell(0);
    EXPECT_EQ(KorHeader_GetItemSize(rowHeader, 0), 300 - expected.equationBarHeight - 10);
}

// Units are compared with pixels, so at 50 % the limit is at half the area and at 200 % at twice.
TEST_F(GridSizes, LimitComparesUnitsWithPixels) {
    create(400, 300);
    SetGridZoomLevel(2);
    EXPECT_EQ(SetColumnWidth(0, 186), 1u);  // 372 units, more than 370
    EXPECT_EQ(SetColumnWidth(1, 185), 1u);  // 370 units
    SetFirstVisibleCell(0);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0), 180);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 1), 185);
    SetGridZoomLevel(8);
    EXPECT_EQ(SetColumnWidth(0, 600), 1u);  // 300 units, wider than the window
    SetFirstVisibleCell(0);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0), 600);
}

// 16384 pixels at 25 % are 65536 units, of which 16 bits stay.
TEST_F(GridSizes, UnitsAreCountedIn16Bits) {
    create(400, 300);
    SetGridZoomLevel(1);
    EXPECT_EQ(SetColumnWidth(0, 16384), 1u);
    EXPECT_EQ(SetColumnWidth(1, 16384 + 10), 1u);
    SetGridZoomLevel(4);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0), 0);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 1), 40);
}

TEST_F(GridSizes, CountFromTheFirstVisibleOne) {
    create(400, 300);
    SetFirstVisibleCell(KORGRID_CELL(10, 20));
    EXPECT_EQ(SetColumnWidth(0, 99), 1u);
    EXPECT_EQ(SetRowHeight(0, 33), 1u);
    EXPECT_EQ(SetColumnWidth(-1, 88), 1u);
    EXPECT_EQ(SetRowHeight(-1, 22), 1u);
    SetFirstVisibleCell(KORGRID_CELL(8, 18));
    EXPECT_EQ(HeaderSizes(columnHeader)[0], 60);
    EXPECT_EQ(HeaderSizes(columnHeader)[1], 88);
    EXPECT_EQ(HeaderSizes(columnHeader)[2], 99);
    EXPECT_EQ(HeaderSizes(rowHeader)[0], 16);
    EXPECT_EQ(HeaderSizes(rowHeader)[1], 22);
    EXPECT_EQ(HeaderSizes(rowHeader)[2], 33);
    SetFirstVisibleCell(0);
    EXPECT_EQ(HeaderSizes(columnHeader)[0], 60);
    EXPECT_EQ(HeaderSizes(rowHeader)[0], 16);
}

TEST_F(GridSizes, OutsideTheSheetGivesZero) {
    create(400, 300);
    for (const LONG index : {-1L, 256L, 65536L, LONG_MAX, LONG_MIN})
        EXPECT_EQ(SetColumnWidth(index, 99), 0u) << index;
    for (const LONG index : {-1L, 16384L, 65536L, LONG_MAX, LONG_MIN})
        EXPECT_EQ(SetRowHeight(index, 99), 0u) << index;
    SetFirstVisibleCell(KORGRID_CELL(200, 16000));
    EXPECT_EQ(SetColumnWidth(56, 99), 0u);
    EXPECT_EQ(SetRowHeight(384, 99), 0u);
    EXPECT_EQ(SetColumnWidth(55, 99), 1u);
    EXPECT_EQ(SetRowHeight(383, 99), 1u);
    SetFirstVisibleCell(KORGRID_CELL(255, 16383));
    EXPECT_EQ(HeaderSizes(columnHeader), (std::vector<int>{99}));
    EXPECT_EQ(HeaderSizes(rowHeader), (std::vector<int>{99}));
    SetFirstVisibleCell(0);
    for (const int size : HeaderSizes(columnHeader)) EXPECT_EQ(size, 60);
}

TEST_F(GridSizes, SettingOneRepaintsNothing) {
    create(400, 300);
    const Picture before = image();
    const auto columns = HeaderSizes(columnHeader);
    TakeInvalid(grid);
    TakeInvalid(columnHeader);
    TakeInvalid(rowHeader);
    EXPECT_EQ(SetColumnWidth(0, 99), 1u);
    EXPECT_EQ(SetRowHeight(0, 99), 1u);
    EXPECT_EQ(host.transcript(), Lines{});
    EXPECT_EQ(TakeInvalid(grid), std::nullopt);
    EXPECT_EQ(TakeInvalid(columnHeader), std::nullopt);
    EXPECT_EQ(TakeInvalid(rowHeader), std::nullopt);
    EXPECT_TRUE(SamePicture(before, image()));
    EXPECT_EQ(HeaderSizes(columnHeader), columns);
}

TEST_F(GridSizes, WindowNarrowerThanTenPixelsOfCells) {
    create(35, 300);
    EXPECT_EQ(SetColumnWidth(0, 100), 1u);
    SetFirstVisibleCell(0);
    EXPECT_GE(KorHeader_GetItemCount(columnHeader), 1);
    EXPECT_EQ(SetColumnWidth(0, 5), 1u) << "as wide as the area";
    SetFirstVisibleCell(0);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0), 5);
}

}  // namespace
}  // namespace kortest
