// SetCellBackGroundColor and SetCellBorder, pixel by pixel.
#include "grid/grid_fixture.h"

#include <random>

namespace kortest {
namespace {

constexpr COLORREF kInk = RGB(10, 20, 230);
constexpr COLORREF kPaper = RGB(255, 255, 255);

class GridCells : public GridTest {
protected:
    GridCells() : brush(CreateSolidBrush(kInk)), pen(CreatePen(PS_SOLID, 1, kInk)) {}
    ~GridCells() override {
        DeleteObject(brush);
        DeleteObject(pen);
    }

    // An image without anything in it.
    void blank() { PatBlt(imageDC, 0, 0, 4000, 4000, WHITENESS); }

    RECT inked() const { return image().boundsOfOthers(kPaper); }
    bool untouched() const { return image().count(kPaper) == 400 * 300; }

    HBRUSH brush;
    HPEN pen;
};

TEST_F(GridCells, BackgroundCoversTheLinesOnAllSides) {
    create(400, 300);
    blank();
    SetCellBackGroundColor(KORGRID_CELL(1, 2), brush);
    const int top = expected.cellsTop() + 32;
    EXPECT_EQ(inked(), (RECT{90, top, 151, top + 17}));
    EXPECT_EQ(image().count(kInk), 61 * 17);
}

TEST_F(GridCells, BackgroundOfAResizedCell) {
    create(400, 300);
    endColumnResize(0, 7);
    endColumnResize(1, 0);
    endRowResize(2, 31);
    blank();
    const int top = expected.cellsTop() + 32;
    SetCellBackGroundColor(KORGRID_CELL(0, 2), brush);
    EXPECT_EQ(inked(), (RECT{30, top, 38, top + 32}));
    blank();
    SetCellBackGroundColor(KORGRID_CELL(1, 2), brush);
    EXPECT_EQ(inked(), (RECT{37, top, 38, top + 32})) << "no width, but the line";
}

TEST_F(GridCells, BackgroundMayReachOutOfTheWindow) {
    create(400, 300);
    blank();
    SetCellBackGroundColor(KORGRID_CELL(6, 0), brush);
    EXPECT_EQ(inked(), (RECT{390, expected.cellsTop(), 400, expected.cellsTop() + 17}));
}

// Every cell around the visible range, in and out.
TEST_F(GridCells, OnlyVisibleCellsAreDrawn) {
    create(400, 300);
    SetFirstVisibleCell(KORGRID_CELL(5, 9));
    const GridVisibleRange range = VisibleRange();
    for (const int column : {0, 4, 5, range.endColumn - 1, +range.endColumn, 255, 256, 65535})
        for (const int row : {0, 8, 9, range.endRow - 1, +range.endRow, 16383, 16384, 65535}) {
            const bool visible =
                column >= 5 && column < range.endColumn && row >= 9 && row < range.endRow;
            const CellIndex cell = KORGRID_CELL(column, row);
            SCOPED_TRACE(::testing::Message() << column << ", " << row);
            blank();
            SetCellBackGroundColor(cell, brush);
            EXPECT_EQ(untouched(), !visible);
            blank();
            SetCellBorder(cell, pen, 1, 0, 1, 0);
            EXPECT_EQ(untouched(), !visible);
            blank();
            SetCellValue(cell, L"WWWWWW", nullptr, kInk, kPaper, 0, 0, 0, 0, 0);
            EXPECT_EQ(untouched(), !visible);
        }
}

// There is room in the window for a column and a row after the sheet's last ones.
TEST_F(GridCells, NothingIsDrawnPastTheSheet) {
    create(400, 300);
    SetFirstVisibleCell(KORGRID_CELL(253, 16380));
    ASSERT_EQ(VisibleRange(), (GridVisibleRange{253, 256, 16380, 16384}));
    for (const CellIndex cell : {KORGRID_CELL(256, 16380), KORGRID_CELL(253, 16384),
                                 KORGRID_CELL(252, 16380), KORGRID_CELL(253, 16379)}) {
        blank();
        SetCellBackGroundColor(cell, brush);
        SetCellBorder(cell, pen, 1, 1, 1, 1);
        SetCellValue(cell, L"WWWWWW", nullptr, kInk, kPaper, 0, 0, 0, 0, 0);
        EXPECT_TRUE(untouched()) << KORGRID_CELLCOLUMN(cell) << ", " << KORGRID_CELLROW(cell);
    }
    SetCellBackGroundColor(KORGRID_CELL(255, 16383), brush);
    EXPECT_EQ(image().count(kInk), 61 * 17);
}

TEST_F(GridCells, BorderDrawsEachEdgeOfTheBox) {
    create(400, 300);
    const int x0 = 90, x1 = 150;
    const int y0 = expected.cellsTop() + 16, y1 = y0 + 16;
    struct {
        DWORD left, right, top, bottom;
        RECT line;
    } const cases[] = {
        {1, 0, 0, 0, {x0, y0, x0 + 1, y1}},
        {0, 1, 0, 0, {x1, y0, x1 + 1, y1}},
        {0, 0, 1, 0, {x0, y0, x1, y0 + 1}},
        {0, 0, 0, 1, {x0, y1, x1, y1 + 1}},
    };
    for (const auto& each : cases) {
        blank();
        SetCellBorder(KORGRID_CELL(1, 1), pen, each.left, each.right, each.top, each.bottom);
        EXPECT_EQ(inked(), each.line);
        const RECT& line = each.line;
        EXPECT_EQ(image().count(kInk), (line.right - line.left) * (line.bottom - line.top));
    }
    blank();
    SetCellBorder(KORGRID_CELL(1, 1), pen, 1, 1, 1, 1);
    EXPECT_EQ(image().count(kInk), 60 + 60 + 16 + 16 - 1)
        << "the corner at the lower right is free";
    EXPECT_EQ(image().pixel(x1, y1), kPaper);
}

TEST_F(GridCells, BorderTestsTheLow16BitsOfItsFlags) {
    create(400, 300);
    blank();
    SetCellBorder(KORGRID_CELL(1, 1), pen, 0x10000, 0x20000, 0xFFFF0000, 0x80000000);
    EXPECT_TRUE(untouched());
    SetCellBorder(KORGRID_CELL(1, 1), pen, 0, 0, 0, 0);
    EXPECT_TRUE(untouched());
    SetCellBorder(KORGRID_CELL(1, 1), pen, 0x8000, 0, 0, 0);
    EXPECT_EQ(image().count(kInk), 16);
    SetCellBorder(KORGRID_CELL(1, 1), pen, 0, 0, 0, 0xFFFF8000);
    EXPECT_EQ(image().count(kInk), 16 + 60);
}

TEST_F(GridCells, BorderEdgesAreDrawnInOrder) {
    create(400, 300);
    spy.watch("Polyline");
    std::vector<std::vector<LONG>> lines;
    spy.replace("Polyline", [&](ULONG_PTR* arguments) {
        const auto* points = reinterpret_cast<const POINT*>(arguments[1]);
        EXPECT_EQ(static_cast<int>(arguments[2]), 2);
        EXPECT_EQ(GetCurrentObject(reinterpret_cast<HDC>(arguments[0]), OBJ_PEN), pen);
        lines.push_back({points[0].x, points[0].y, points[1].x, points[1].y});
        return spy.callReal("Polyline", arguments);
    });
    SetCellBorder(KORGRID_CELL(1, 1), pen, 1, 1, 1, 1);
    const LONG x0 = 90, x1 = 150;
    const LONG y0 = expected.cellsTop() + 16, y1 = y0 + 16;
    EXPECT_EQ(lines, (std::vector<std::vector<LONG>>{
                         {x0, y0, x0, y1}, {x1, y0, x1, y1}, {x0, y0, x1, y0}, {x0, y1, x1, y1}}));
}

TEST_F(GridCells, WidePensAreDrawnAsTheyAre) {
    create(400, 300);
    const HPEN wide = CreatePen(PS_SOLID, 3, kInk);
    blank();
    SetCellBorder(KORGRID_CELL(2, 3), wide, 1, 1, 1, 1);
    Canvas canvas(400, 300, kPaper);
    DrawExpectedBorder(canvas.dc(), expected, KORGRID_CELL(2, 3), wide, 1, 1, 1, 1);
    EXPECT_TRUE(SamePicture(canvas.picture(), image()));
    DeleteObject(wide);
}

TEST_F(GridCells, HostKeepsPenAndBrush) {
    create(400, 300);
    const HGDIOBJ before = GetCurrentObject(imageDC, OBJ_PEN);
    const HGDIOBJ brushBefore = GetCurrentObject(imageDC, OBJ_BRUSH);
    SetCellBorder(KORGRID_CELL(1, 1), pen, 1, 1, 1, 1);
    SetCellBackGroundColor(KORGRID_CELL(1, 1), brush);
    EXPECT_EQ(GetCurrentObject(imageDC, OBJ_PEN), before);
    EXPECT_EQ(GetCurrentObject(imageDC, OBJ_BRUSH), brushBefore);
    LOGPEN description{};
    EXPECT_NE(GetObjectW(pen, sizeof description, &description), 0);
    LOGBRUSH brushDescription{};
    EXPECT_NE(GetObjectW(brush, sizeof brushDescription, &brushDescription), 0);
}

TEST_F(GridCells, NullObjectsAreRefused) {
    create(400, 300);
    blank();
    spy.watch("FillRect");
    SetCellBackGroundColor(KORGRID_CELL(1, 1), nullptr);
    EXPECT_EQ(spy.count("FillRect"), 0);
    SetCellValue(KORGRID_CELL(1, 1), nullptr, nullptr, kInk, kPaper, 0, 0, 0, 0, 0);
    SetCellValue(KORGRID_CELL(1, 1), nullptr, nullptr, kInk, kPaper, 0, 2, -1, 1, 1);
    EXPECT_TRUE(untouched());
    const HGDIOBJ before = GetCurrentObject(imageDC, OBJ_PEN);
    SetCellBorder(KORGRID_CELL(1, 1), nullptr, 1, 1, 1, 1);
    EXPECT_EQ(GetCurrentObject(imageDC, OBJ_PEN), before);
}

TEST_F(GridCells, NothingIsInvalidated) {
    create(400, 300);
    TakeInvalid(grid);
    SetCellBackGroundColor(KORGRID_CELL(1, 1), brush);
    SetCellBorder(KORGRID_CELL(1, 1), pen, 1, 1, 1, 1);
    SetCellValue(KORGRID_CELL(1, 1), L"text", nullptr, kInk, kPaper, 0, 0, 0, 0, 0);
    EXPECT_EQ(TakeInvalid(grid), std::nullopt);
    EXPECT_EQ(host.transcript(), Lines{});
}

TEST_F(GridCells, RandomCellsMatchTheStatedSteps) {
    create(400, 300);
    std::mt19937 random(5);
    for (int round = 0; round < 400; ++round) {
        if (round % 20 == 0) {
            expected.zoom = 1 + static_cast<unsigned>(random() % 9);
            SetGridZoomLevel(expected.zoom);
            expected.firstColumn = static_cast<int>(random() % 256);
            expected.firstRow = static_cast<int>(random() % 700);
            SetFirstVisibleCell(KORGRID_CELL(expected.firstColumn, expected.firstRow));
            for (int i = 0; i < 4; ++i) {
                endColumnResize(
                    std::min(static_cast<int>(random() % 6), 255 - expected.firstColumn),
                    static_cast<int>(random() % 100));
                endRowResize(static_cast<int>(random() % 9), static_cast<int>(random() % 30));
            }
            SetFirstVisibleCell(KORGRID_CELL(expected.firstColumn, expected.firstRow));
            refit();
            expected.fitColumns(400);
        }
        const CellIndex cell = KORGRID_CELL(expected.firstColumn + static_cast<int>(random() % 8),
                                            expected.firstRow + static_cast<int>(random() % 30));
        Canvas canvas(400, 300, kPaper);
        blank();
        DrawExpectedBackground(canvas.dc(), expected, cell, brush);
        SetCellBackGroundColor(cell, brush);
        const DWORD flags = static_cast<DWORD>(random());
        const HPEN stock = static_cast<HPEN>(GetStockObject(BLACK_PEN));
        DrawExpectedBorder(canvas.dc(), expected, cell, stock, flags & 1, flags & 2, flags & 4,
                           flags & 8);
        SetCellBorder(cell, stock, flags & 1, flags & 2, flags & 4, flags & 8);
        ASSERT_TRUE(SamePicture(canvas.picture(), image())) << round;
    }
}

}  // namespace
}  // namespace kortest
