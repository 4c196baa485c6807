// The grid lines in the off-screen image, and showing, hiding and redrawing them.
#include "grid/grid_fixture.h"

#include <random>

namespace kortest {
namespace {

class GridLines : public GridTest {
protected:
    // Blackens the image, asks for a redraw of the cells and returns what is there then.
    Picture redrawnOverBlack() {
        PatBlt(imageDC, 0, 0, 4000, 4000, BLACKNESS);
        SendMessageW(grid, GRIDM_REDRAW, 0, 0);
        return image();
    }

    // The same drawn by the stated steps.
    Picture expectedOverBlack() {
        Canvas canvas(expected.clientWidth, expected.clientHeight, RGB(0, 0, 0));
        expected.fit();
        DrawExpectedRedraw(canvas.dc(), expected, expected.cells());
        return canvas.picture();
    }

    void scrollTo(int column, int row) {
        SetFirstVisibleCell(KORGRID_CELL(column, row));
        expected.firstColumn = column;
        expected.firstRow = row;
        if (row > 9000) expected.rowHeaderWidth = 40;
        refit();
    }
};

TEST_F(GridLines, LieOnLeftAndUpperEdges) {
    create(400, 300);
    SetSelectedRanged(KORGRID_PAIR(200, 200), KORGRID_PAIR(200, 200));
    const Picture picture = redrawnOverBlack();
    const int top = expected.cellsTop();
    for (int y = top; y < 300; ++y)
        for (int x = 30; x < 400; ++x) {
            const bool onLine = (x - 30) % 60 == 0 || (y - top) % 16 == 0;
            ASSERT_EQ(picture.pixel(x, y), onLine ? kGridLineColour : RGB(255, 255, 255))
                << x << ", " << y;
        }
    EXPECT_EQ(picture.count(RGB(0, 0, 0)), 400 * 300 - 370 * (300 - top)) << "headers' place";
}

TEST_F(GridLines, RunThroughTheHeadersPlaceInAFullRedraw) {
    create(400, 300);
    SetSelectedRanged(KORGRID_PAIR(200, 200), KORGRID_PAIR(200, 200));
    PatBlt(imageDC, 0, 0, 400, 300, BLACKNESS);
    SetFirstVisibleCell(0);
    const Picture picture = image();
    EXPECT_EQ(picture.pixel(90, 0), kGridLineColour) << "vertical lines begin at the upper edge";
    EXPECT_EQ(picture.pixel(0, expected.cellsTop()), kGridLineColour) << "and horizontal ones left";
    EXPECT_EQ(picture.pixel(0, 0), RGB(255, 255, 255));
    EXPECT_EQ(picture.count(RGB(0, 0, 0)), 0);
}

TEST_F(GridLines, VerticalOnesStopBelowTheLastRow) {
    create(400, 300);
    scrollTo(0, 16380);
    SetSelectedRanged(KORGRID_PAIR(0, 0), KORGRID_PAIR(0, 0));
    const Picture picture = redrawnOverBlack();
    const int bottom = expected.cellsTop() + 4 * 16;
    EXPECT_EQ(picture.pixel(100, bottom - 1), kGridLineColour);
    EXPECT_EQ(picture.pixel(100, bottom), kGridLineColour) << "the last row's lower line";
    EXPECT_EQ(picture.boundsOfOthers(RGB(255, 255, 255), {41, bottom + 1, 400, 300}),
              (RECT{0, 0, 0, 0}));
    EXPECT_TRUE(SamePicture(expectedOverBlack(), picture));
}

TEST_F(GridLines, HorizontalOnesStopAfterTheLastColumn) {
    create(400, 300);
    scrollTo(253, 0);
    SetSelectedRanged(KORGRID_PAIR(0, 0), KORGRID_PAIR(0, 0));
    const Picture picture = redrawnOverBlack();
    const int right = 30 + 3 * 60;
    const int top = expected.cellsTop();
    EXPECT_EQ(picture.pixel(right - 1, top), kGridLineColour);
    EXPECT_EQ(picture.pixel(right, top + 5), kGridLineColour) << "the last column's right line";
    EXPECT_EQ(picture.boundsOfOthers(RGB(255, 255, 255), {right + 1, top, 400, 300}),
              (RECT{0, 0, 0, 0}));
    EXPECT_TRUE(SamePicture(expectedOverBlack(), picture));
}

TEST_F(GridLines, SheetsLastCellStandsAlone) {
    create(400, 300);
    scrollTo(255, 16383);
    EXPECT_TRUE(SamePicture(expectedOverBlack(), redrawnOverBlack()));
}

TEST_F(GridLines, NothingIsVisiblePastTheSheet) {
    create(400, 300);
    scrollTo(256, 16384);
    EXPECT_EQ(VisibleRange(), (GridVisibleRange{256, 256, 16384, 16384}));
    EXPECT_TRUE(SamePicture(expectedOverBlack(), redrawnOverBlack()));
}

TEST_F(GridLines, HiddenLeaveAWhiteArea) {
    create(400, 300);
    SetSelectedRanged(KORGRID_PAIR(200, 200), KORGRID_PAIR(200, 200));
    EXPECT_EQ(ToggleGridLines(), 1u);
    const Picture picture = redrawnOverBlack();
    EXPECT_EQ(picture.count(RGB(255, 255, 255)), 370 * (300 - expected.cellsTop()));
    EXPECT_EQ(ToggleGridLines(), 1u);
    EXPECT_EQ(image().pixel(90, 150), kGridLineColour);
}

TEST_F(GridLines, ToggleRedrawsTheCellsAndOnlyThem) {
    create(400, 300);
    PatBlt(imageDC, 0, 0, 400, 300, BLACKNESS);
    TakeInvalid(grid);
    EXPECT_EQ(ToggleGridLines(), 1u);
    expected.linesHidden = true;
    EXPECT_TRUE(SamePicture(expectedOverBlack(), image()));
    EXPECT_EQ(TakeInvalid(grid), expected.cells());
    EXPECT_EQ(host.transcript(), (Lines{"sent GRIDN_PAINTCELLS columns 0-7 rows 0-" +
                                        std::to_string(expected.rowCount)}));
}

TEST_F(GridLines, RedrawMessageRefreshesBothHeaders) {
    create(30 + 5 * 60, 300);
    SetFirstVisibleCell(0);
    EXPECT_EQ(GetNumberOfVisibleColumns(), 6u) << "counted over the whole client width";
    SetColumnWidth(1, 50);
    SetRowHeight(1, 40);
    expected.columns[1] = 50;
    expected.rows[1] = 40;
    TakeInvalid(columnHeader);
    TakeInvalid(rowHeader);
    SendMessageW(grid, GRIDM_REDRAW, 0, 0);
    expected.fit();
    EXPECT_EQ(VisibleRange(), expected.visibleRange());
    EXPECT_EQ(HeaderSizes(columnHeader), ExpectedColumnSizes(expected));
    EXPECT_EQ(HeaderSizes(rowHeader), ExpectedRowSizes(expected));
    EXPECT_NE(TakeInvalid(columnHeader), std::nullopt);
    EXPECT_NE(TakeInvalid(rowHeader), std::nullopt);
    SetColumnWidth(1, 60);
    expected.columns[1] = 60;
    SendMessageW(grid, GRIDM_REDRAW, 0, 0);
    expected.fit();
    EXPECT_EQ(GetNumberOfVisibleColumns(), 5u) << "counted right of the row header";
}

TEST_F(GridLines, ToggleRefreshesBothHeaders) {
    create(400, 300);
    SetColumnWidth(1, 50);
    SetRowHeight(1, 40);
    ToggleGridLines();
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 1), 50);
    EXPECT_EQ(KorHeader_GetItemSize(rowHeader, 1), 40);
}

TEST_F(GridLines, PreviousPenComesBack) {
    create(400, 300);
    const HPEN own = CreatePen(PS_SOLID, 3, RGB(1, 2, 3));
    SelectObject(imageDC, own);
    SendMessageW(grid, GRIDM_REDRAW, 0, 0);
    EXPECT_EQ(GetCurrentObject(imageDC, OBJ_PEN), own);
    SelectObject(imageDC, GetStockObject(BLACK_PEN));
    DeleteObject(own);
}

TEST_F(GridLines, ColumnsAndRowsOfNoSizeStackTheirLines) {
    create(400, 300);
    for (int i = 1; i < 4; ++i) {
        endColumnResize(i, 0);
        endRowResize(i, 0);
    }
    EXPECT_TRUE(SamePicture(expectedOverBlack(), redrawnOverBlack()));
    EXPECT_EQ(image().pixel(90, 250), kGridLineColour);
    EXPECT_EQ(image().pixel(150, 250), kGridLineColour);
}

TEST_F(GridLines, RandomGridsMatchTheStatedSteps) {
    create(400, 300);
    std::mt19937 random(99);
    for (int round = 0; round < 150; ++round) {
        SCOPED_TRACE(round);
        if (round % 10 == 0) {
            expected.zoom = 1 + static_cast<unsigned>(random() % 9);
            SetGridZoomLevel(expected.zoom);
            if (random() % 2) {
                ToggleViewStateOfHeaders();
                expected.headersHidden = !expected.headersHidden;
            }
        }
        const bool atEnd = random() % 3 == 0;
        const int column = static_cast<int>(atEnd ? 248 + random() % 8 : random() % 256);
        expected.rowHeaderWidth = 30;
        scrollTo(column, static_cast<int>(random() % 800));
        for (int i = 0; i < 6; ++i) {
            const int item = std::min(static_cast<int>(random() % 8), 255 - column);
            endColumnResize(item, static_cast<int>(random() % 120));
            endRowResize(static_cast<int>(random() % 25), static_cast<int>(random() % 40));
        }
        ASSERT_TRUE(SamePicture(expectedOverBlack(), redrawnOverBlack()));
    }
}

TEST_F(GridLines, RandomSheetEndsMatchTheStatedSteps) {
    create(400, 300);
    std::mt19937 random(100);
    scrollTo(200, 16000);
    for (int round = 0; round < 60; ++round) {
        SCOPED_TRACE(round);
        scrollTo(static_cast<int>(245 + random() % 11), static_cast<int>(16364 + random() % 20));
        endColumnResize(0, static_cast<int>(random() % 120));
        endRowResize(0, static_cast<int>(random() % 40));
        ASSERT_TRUE(SamePicture(expectedOverBlack(), redrawnOverBlack()));
    }
}

}  // namespace
}  // namespace kortest
