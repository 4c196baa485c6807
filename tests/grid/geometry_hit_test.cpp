// Which cell a point belongs to, asked by presses as GRIDN_CELLCLICKED answers them.
#include "grid/grid_fixture.h"

#include <optional>
#include <random>

namespace kortest {
namespace {

class GridHitTest : public GridTest {
protected:
    // The cell that a press reports; none when the press was ignored.
    std::optional<CellIndex> cellAt(int x, int y) {
        clicked_.reset();
        host.onMessage = [this](UINT message, WPARAM wParam, LPARAM lParam) -> LRESULT {
            if (message == WM_NOTIFY && wParam == GRIDN_CELLCLICKED) {
                const auto* pair = reinterpret_cast<const GridCellPair*>(lParam);
                clicked_ = KORGRID_CELL(pair->column, pair->row);
            }
            return 0;
        };
        PressAt(grid, x, y);
        ReleaseAt(grid, x, y);
        host.onMessage = nullptr;
        host.clear();
        return clicked_;
    }

    // Compares a line of pixels along each axis with what is expected.
    void comparePixels(int firstX, int endX, int firstY, int endY) {
        for (int x = firstX; x < endX; ++x)
            ASSERT_EQ(cellAt(x, expected.cellsTop() + 1),
                      expected.cellAt(x, expected.cellsTop() + 1))
                << "x " << x;
        for (int y = firstY; y < endY; ++y)
            ASSERT_EQ(cellAt(expected.cellsLeft() + 1, y),
                      expected.cellAt(expected.cellsLeft() + 1, y))
                << "y " << y;
    }

    void scrollTo(int column, int row) {
        SetFirstVisibleCell(KORGRID_CELL(column, row));
        expected.firstColumn = column;
        expected.firstRow = row;
        expected.fitColumns(expected.clientWidth);
        expected.fitRows(expected.clientHeight - expected.cellsTop());
    }

private:
    std::optional<CellIndex> clicked_;
};

// A cell's right and lower border belong to it; its left one does not.
TEST_F(GridHitTest, BordersBelongToTheCellBefore) {
    create(400, 300);
    const int top = expected.cellsTop();
    EXPECT_EQ(cellAt(31, top + 1), KORGRID_CELL(0, 0));
    EXPECT_EQ(cellAt(90, top + 16), KORGRID_CELL(0, 0));
    EXPECT_EQ(cellAt(91, top + 16), KORGRID_CELL(1, 0));
    EXPECT_EQ(cellAt(90, top + 17), KORGRID_CELL(0, 1));
    EXPECT_EQ(cellAt(150, top + 32), KORGRID_CELL(1, 1));
    EXPECT_EQ(cellAt(151, top + 33), KORGRID_CELL(2, 2));
}

TEST_F(GridHitTest, EveryPixelOfTheClientArea) {
    create(400, 300);
    comparePixels(0, 403, 0, 303);
}

TEST_F(GridHitTest, EveryPixelWithSizesOfAllKinds) {
    create(400, 300);
    const int columns[] = {1, 0, 7, 61, 0, 33, 100};
    const int rows[] = {0, 3, 16, 0, 40, 1, 25};
    for (int i = 0; i < 7; ++i) {
        endColumnResize(i, columns[i]);
        endRowResize(i, rows[i]);
    }
    scrollTo(0, 0);
    comparePixels(0, 403, 0, 303);
}

TEST_F(GridHitTest, EveryPixelAtOtherZooms) {
    create(400, 300);
    for (const unsigned zoom : {1u, 3u, 8u}) {
        SetGridZoomLevel(zoom);
        expected.zoom = zoom;
        refit();
        comparePixels(0, 401, 0, 301);
    }
}

TEST_F(GridHitTest, EveryPixelWithoutHeaders) {
    create(400, 300);
    ToggleViewStateOfHeaders();
    expected.headersHidden = true;
    refit();
    comparePixels(0, 401, 0, 301);
}

TEST_F(GridHitTest, HeaderAndEquationBarBelongToTheFirstVisibleCells) {
    create(400, 300);
    scrollTo(5, 9);
    EXPECT_EQ(cellAt(0, 0), KORGRID_CELL(5, 9));
    EXPECT_EQ(cellAt(10, expected.cellsTop() + 20), KORGRID_CELL(5, 10));
    EXPECT_EQ(cellAt(100, 3), KORGRID_CELL(6, 9));
}

TEST_F(GridHitTest, AboveTheClientAreaIsTheSheetsFirstCell) {
    create(400, 300);
    scrollTo(5, 9);
    EXPECT_EQ(cellAt(100, -1), KORGRID_CELL(0, 0));
    EXPECT_EQ(cellAt(300, -32768), KORGRID_CELL(0, 0));
}

// A pointer left of the window wraps to a large position, which is cut to the right edge.
TEST_F(GridHitTest, LeftOfTheClientAreaWrapsToTheRightEdge) {
    create(400, 300);
    const int top = expected.cellsTop();
    EXPECT_EQ(cellAt(-1, top + 1), expected.cellAt(400, top + 1));
    EXPECT_EQ(KORGRID_CELLCOLUMN(*cellAt(-1, top + 1)), 6);
}

TEST_F(GridHitTest, PointsOutsideAreCutToTheEdges) {
    create(400, 300);
    const int top = expected.cellsTop();
    for (const int x : {400, 401, 5000, 32767})
        EXPECT_EQ(cellAt(x, top + 1), expected.cellAt(400, top + 1)) << x;
    for (const int y : {300, 301, 5000, 32767})
        EXPECT_EQ(cellAt(31, y), expected.cellAt(31, 300)) << y;
}

// Right of the sheet's end the search finds one column and row more, then none.
TEST_F(GridHitTest, PastTheSheetsEnd) {
    create(400, 300);
    scrollTo(253, 16380);
    expected.rowHeaderWidth = 40;
    refit();
    ASSERT_EQ(VisibleRange(), expected.visibleRange());
    const int left = 40;
    const int top = expected.cellsTop();
    EXPECT_EQ(cellAt(left + 180, top + 1), KORGRID_CELL(255, 16380));
    EXPECT_EQ(cellAt(left + 181, top + 1), KORGRID_CELL(256, 16380));
    EXPECT_EQ(cellAt(left + 240, top + 1), KORGRID_CELL(256, 16380));
    EXPECT_EQ(cellAt(left + 241, top + 1), KORGRID_CELL(0, 16380));
    EXPECT_EQ(cellAt(left + 1, top + 64), KORGRID_CELL(253, 16383));
    EXPECT_EQ(cellAt(left + 1, top + 65), KORGRID_CELL(253, 16384));
    EXPECT_EQ(cellAt(left + 1, top + 80), KORGRID_CELL(253, 16384));
    EXPECT_EQ(cellAt(left + 1, top + 81), KORGRID_CELL(253, 0));
    comparePixels(0, 401, 0, 301);
}

TEST_F(GridHitTest, PastTheSheetsEndWithASizedLastColumn) {
    create(400, 300);
    scrollTo(254, 0);
    endColumnResize(1, 20);
    expected.fitColumns(400);
    comparePixels(30, 401, 20, 21);
}

TEST_F(GridHitTest, WithoutVisibleCells) {
    create(400, 300);
    SetFirstVisibleCell(KORGRID_CELL(300, 100));
    expected.firstColumn = 300;
    expected.firstRow = 100;
    expected.columnCount = 0;
    expected.fitRows(300 - expected.cellsTop());
    const int top = expected.cellsTop();
    EXPECT_EQ(cellAt(50, top + 1), KORGRID_CELL(300, 100));
    EXPECT_EQ(cellAt(200, top + 1), KORGRID_CELL(0, 100));
}

TEST_F(GridHitTest, AsManyAsCanBeCounted) {
    create(400, 300);
    for (int i = 0; i < 256; ++i) SetColumnWidth(i, 1);
    for (int i = 0; i < 256; ++i) expected.columns[i] = 1;
    scrollTo(0, 0);
    ASSERT_EQ(expected.columnCount, 255);
    comparePixels(250, 400, 100, 101);
}

TEST_F(GridHitTest, RandomPointsInRandomGrids) {
    create(400, 300);
    std::mt19937 random(4711);
    for (int round = 0; round < 40; ++round) {
        ResetGrid();
        expected.columns.clear();
        expected.rows.clear();
        const int column = static_cast<int>(random() % 256);
        const int row = static_cast<int>(random() % 900);
        expected.firstColumn = 0;
        expected.firstRow = 0;
        for (int i = 0; i < 20; ++i) {
            const int item = std::min(column + static_cast<int>(random() % 12), 255);
            endColumnResize(item, static_cast<int>(random() % 150));
            endRowResize(row + static_cast<int>(random() % 20), static_cast<int>(random() % 50));
        }
        scrollTo(column, row);
        for (int i = 0; i < 60; ++i) {
            const int x = static_cast<int>(random() % 410);
            const int y = static_cast<int>(random() % 300);
            ASSERT_EQ(cellAt(x, y), expected.cellAt(x, y)) << x << ", " << y << " round " << round;
        }
    }
}

}  // namespace
}  // namespace kortest
