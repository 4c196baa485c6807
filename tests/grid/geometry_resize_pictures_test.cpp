// The end of a dragged border: which part of the image is redrawn, pixel for pixel.
#include "grid/grid_fixture.h"

#include <algorithm>
#include <random>

namespace kortest {
namespace {

class GridResizeEndPicture : public GridTest {
protected:
    // Fills the image with noise, so that every pixel that is touched or left shows.
    void scatter(unsigned seed) {
        std::mt19937 spots(seed);
        for (int i = 0; i < 60; ++i) {
            const int x = static_cast<int>(spots() % 400);
            const int y = static_cast<int>(spots() % 300);
            const HBRUSH brush = CreateSolidBrush(spots() & 0xFFFFFF);
            const RECT spot = {x - 20, y - 20, x + 30, y + 25};
            FillRect(imageDC, &spot, brush);
            DeleteObject(brush);
        }
    }

    void copyImage(const Canvas& canvas) const {
        BitBlt(canvas.dc(), 0, 0, expected.clientWidth, expected.clientHeight, imageDC, 0, 0,
               SRCCOPY);
    }

    void endColumn(const Canvas& canvas, int item, unsigned units) {
        const bool redraws = item < expected.columnCount;
        if (redraws && line != -1)
            PatBlt(canvas.dc(), line, 0, 1, expected.clientHeight, DSTINVERT);
        expected.columns[expected.firstColumn + item] = units;
        if (!redraws) return;
        line = -1;
        expected.fitColumns(expected.clientWidth);
        const int offset = expected.columnOffset(expected.firstColumn + item) -
                           expected.columnOffset(expected.firstColumn);
        DrawExpectedRedraw(canvas.dc(), expected,
                           {offset, 0, expected.clientWidth, expected.clientHeight});
    }

    void endRow(const Canvas& canvas, int item, unsigned units) {
        const bool redraws = item <= expected.rowCount;
        if (redraws && line != -1) PatBlt(canvas.dc(), 0, line, expected.clientWidth, 1, DSTINVERT);
        expected.rows[expected.firstRow + item] = units;
        if (!redraws) return;
        line = -1;
        expected.fitRows(expected.clientHeight - expected.cellsTop());
        const int offset =
            expected.rowOffset(expected.firstRow + item) - expected.rowOffset(expected.firstRow);
        DrawExpectedRedraw(canvas.dc(), expected,
                           {0, offset, expected.clientWidth, expected.clientHeight});
    }

    void resizing(bool isColumn, int end) {
        SendResizing(grid, isColumn ? columnHeader : rowHeader, end);
        line = (isColumn ? expected.cellsLeft() : expected.cellsTop()) + end;
    }

    // Sends one end and compares image, counts and header sizes with what is expected.
    void compareEnd(bool isColumn, int item, unsigned units) {
        Canvas canvas(expected.clientWidth, expected.clientHeight, RGB(0, 0, 0));
        copyImage(canvas);
        if (isColumn)
            endColumn(canvas, item, units);
        else
            endRow(canvas, item, units);
        ASSERT_EQ(
            SendResized(grid, isColumn ? columnHeader : rowHeader, item, static_cast<int>(units)),
            0);
        ASSERT_TRUE(SamePicture(canvas.picture(), image()));
        ASSERT_EQ(VisibleRange(), expected.visibleRange());
    }

    int upTo(int last) { return static_cast<int>(random() % (static_cast<unsigned>(last) + 1)); }

    void scrollTo(int column, int row) {
        SetFirstVisibleCell(KORGRID_CELL(column, row));
        expected.firstColumn = column;
        expected.firstRow = row;
        if (row >= 10000) expected.rowHeaderWidth = 40;
        expected.fitColumns(expected.clientWidth);
        expected.fitRows(expected.clientHeight - expected.cellsTop());
    }

    void zoomTo(unsigned zoom) {
        expected.zoom = zoom;
        SetGridZoomLevel(zoom);
        refit();
    }

    void selectAnything() {
        const int left = upTo(255);
        const int top = std::min(expected.firstRow + upTo(20), 16383);
        const int right = left + upTo(255 - left);
        const int bottom = std::min(top + upTo(10), 16383);
        expected.selection = {static_cast<WORD>(left), static_cast<WORD>(right),
                              static_cast<WORD>(top), static_cast<WORD>(bottom)};
        ASSERT_NE(SetSelectedRanged(KORGRID_PAIR(left, right), KORGRID_PAIR(top, bottom)), 0u);
    }

    // Two times in three with a tracking line before it.
    void compareAnyEnd() {
        const bool isColumn = upTo(1) != 0;
        if (upTo(2) != 0) resizing(isColumn, upTo(300));
        const int count = isColumn ? expected.columnCount : expected.rowCount;
        const int last = isColumn ? 255 - expected.firstColumn : 16383 - expected.firstRow;
        const int item = std::min(upTo(count + 2), last);
        const int units = upTo(7) == 0 ? upTo(400) : upTo(70);
        compareEnd(isColumn, item, static_cast<unsigned>(units));
    }

    int line = -1;  // where the tracking line is expected
    std::mt19937 random{77};
};

TEST_F(GridResizeEndPicture, RedrawsFromTheColumnsOffset) {
    create(400, 300);
    scatter(1);
    resizing(true, 190);
    compareEnd(true, 2, 90);
    EXPECT_EQ(TakeInvalid(grid), (RECT{120, 0, 400, 300})) << "the row header's width is not added";
}

TEST_F(GridResizeEndPicture, RedrawsFromTheRowsOffset) {
    create(400, 300);
    scatter(2);
    resizing(false, 60);
    compareEnd(false, 3, 25);
    EXPECT_EQ(TakeInvalid(grid), (RECT{0, 48, 400, 300}));
}

TEST_F(GridResizeEndPicture, FirstOnesRedrawEverything) {
    create(400, 300);
    scatter(3);
    compareEnd(true, 0, 10);
    EXPECT_EQ(TakeInvalid(grid), (RECT{0, 0, 400, 300}));
    compareEnd(false, 0, 10);
    EXPECT_EQ(TakeInvalid(grid), (RECT{0, 0, 400, 300}));
}

// At 50 % a column 30 units wider moves the offset by 30 pixels though it is 15 pixels wider.
TEST_F(GridResizeEndPicture, OffsetAddsChangesUnscaled) {
    create(400, 300);
    SetGridZoomLevel(2);
    expected.zoom = 2;
    refit();
    compareEnd(true, 1, 90);
    host.pump();
    scatter(4);
    compareEnd(true, 3, 60);
    EXPECT_EQ(TakeInvalid(grid), (RECT{90 + 30, 0, 400, 300}));
    compareEnd(false, 2, 26);
    host.pump();
    compareEnd(false, 4, 16);
    EXPECT_EQ(TakeInvalid(grid), (RECT{0, 32 + 10, 400, 300}));
}

// Columns at or past the count are stored only; a row at the count still redraws.
TEST_F(GridResizeEndPicture, RowsAndColumnsDifferAtTheCount) {
    create(400, 300);
    scatter(5);
    const int columns = expected.columnCount;
    const int rows = expected.rowCount;
    compareEnd(true, columns, 99);
    EXPECT_EQ(TakeInvalid(grid), std::nullopt);
    EXPECT_EQ(KorHeader_GetItemCount(columnHeader), columns);
    compareEnd(false, rows, 33);
    EXPECT_EQ(TakeInvalid(grid), (RECT{0, rows * 16, 400, 300}));
    compareEnd(false, expected.rowCount + 1, 34);
    EXPECT_EQ(TakeInvalid(grid), std::nullopt);
    compareEnd(true, columns - 1, 44);
    EXPECT_NE(TakeInvalid(grid), std::nullopt);
    SetFirstVisibleCell(KORGRID_CELL(columns - 1, rows));
    EXPECT_EQ(HeaderSizes(columnHeader)[0], 44);
    EXPECT_EQ(HeaderSizes(columnHeader)[1], 99);
    EXPECT_EQ(HeaderSizes(rowHeader)[0], 33);
    EXPECT_EQ(HeaderSizes(rowHeader)[1], 34);
}

// The column header is filled for the full client width, the row header's strip not taken off.
TEST_F(GridResizeEndPicture, ColumnsAreCountedOverTheWholeClientWidth) {
    create(30 + 5 * 60, 300);
    EXPECT_EQ(expected.columnCount, 5);
    compareEnd(true, 0, 61);
    EXPECT_EQ(GetNumberOfVisibleColumns(), 6u);
    EXPECT_EQ(HeaderSizes(columnHeader), (std::vector<int>{61, 60, 60, 60, 60, 60}));
}

TEST_F(GridResizeEndPicture, LineIsTakenOutOfTheImage) {
    create(400, 300);
    scatter(6);
    resizing(true, 5);  // left of the redrawn part, so its inversion stays to be seen
    compareEnd(true, 4, 50);
    resizing(false, 2);
    compareEnd(false, 6, 20);
    resizing(true, 7);
    compareEnd(true, 200, 60);  // stores only, the line is kept
    compareEnd(true, 1, 60);
}

TEST_F(GridResizeEndPicture, RandomEndsMatchTheStatedSteps) {
    create(400, 300);
    for (int round = 0; round < 400; ++round) {
        SCOPED_TRACE(round);
        if (round % 20 == 0) {
            scrollTo(upTo(255), upTo(600));
            selectAnything();
        }
        if (round % 50 == 0) zoomTo(1 + static_cast<unsigned>(upTo(8)));
        if (round % 5 == 0) scatter(static_cast<unsigned>(round));
        ASSERT_NO_FATAL_FAILURE(compareAnyEnd());
    }
}

// With the last column or row in sight lines end there, and there may be lines for columns and rows
// that do not exist.
TEST_F(GridResizeEndPicture, RandomEndsNearTheSheetsEnd) {
    create(400, 300);
    scrollTo(200, 15000);
    for (int round = 0; round < 300; ++round) {
        SCOPED_TRACE(round);
        if (round % 6 == 0) {
            scrollTo(244 + upTo(11), 16364 + upTo(19));
            selectAnything();
        }
        if (round % 50 == 49) zoomTo(1 + static_cast<unsigned>(upTo(8)));
        if (round % 5 == 0) scatter(static_cast<unsigned>(round));
        ASSERT_NO_FATAL_FAILURE(compareAnyEnd());
    }
}

}  // namespace
}  // namespace kortest
