// The highlight: an inverted rectangle over the visible part of the selection.
#include "grid/grid_fixture.h"

#include <random>

namespace kortest {
namespace {

class GridHighlight : public GridTest {
protected:
    // The rectangles that were inverted in the image since the last settle.
    std::vector<RECT> inverted() const {
        std::vector<RECT> blocks;
        for (const auto& call : spy.callsOf("PatBlt")) {
            if (call.arguments[0] != reinterpret_cast<ULONG_PTR>(imageDC) ||
                NumberAt(call, 5) != DSTINVERT)
                continue;
            const int x = static_cast<int>(NumberAt(call, 1));
            const int y = static_cast<int>(NumberAt(call, 2));
            blocks.push_back({x, y, x + static_cast<int>(NumberAt(call, 3)),
                              y + static_cast<int>(NumberAt(call, 4))});
        }
        return blocks;
    }

    // Selects a block with nothing selected in sight before, and returns what was inverted.
    std::vector<RECT> select(int left, int right, int top, int bottom) {
        hide();
        expected.selection = {static_cast<WORD>(left), static_cast<WORD>(right),
                              static_cast<WORD>(top), static_cast<WORD>(bottom)};
        EXPECT_NE(SetSelectedRanged(KORGRID_PAIR(left, right), KORGRID_PAIR(top, bottom)), 0u);
        return inverted();
    }

    // Moves the selection to a cell far from everything visible.
    void hide() {
        const int column = expected.firstColumn > 128 ? 0 : 255;
        const int row = expected.firstRow > 8000 ? 0 : 16383;
        SetSelectedRanged(KORGRID_PAIR(column, column), KORGRID_PAIR(row, row));
        settle();
    }

    void start() {
        create(400, 300);
        spy.watch("PatBlt");
    }

    std::vector<RECT> expectedBlocks() const {
        RECT block;
        if (expected.selectedBlock(&block)) return {block};
        return {};
    }
};

using Blocks = std::vector<RECT>;

TEST_F(GridHighlight, CoversTheSelectedCells) {
    start();
    const int top = expected.cellsTop();
    EXPECT_EQ(select(0, 0, 0, 0), (Blocks{{30, top, 90, top + 16}}));
    EXPECT_EQ(select(1, 3, 2, 4), (Blocks{{90, top + 32, 270, top + 80}}));
    EXPECT_EQ(select(6, 6, 5, 5), (Blocks{{390, top + 80, 450, top + 96}}));
}

TEST_F(GridHighlight, IsCutToTheFirstVisibleCell) {
    start();
    SetFirstVisibleCell(KORGRID_CELL(10, 20));
    expected.firstColumn = 10;
    expected.firstRow = 20;
    expected.fitColumns(400);
    expected.fitRows(300 - expected.cellsTop());
    const int top = expected.cellsTop();
    EXPECT_EQ(select(8, 11, 15, 20), (Blocks{{30, top, 150, top + 16}}));
    EXPECT_EQ(select(12, 255, 21, 16383),
              (Blocks{{150, top + 16, 30 + 8 * 60, top + 16 * (expected.rowCount + 1)}}))
        << "one column and row past the last visible ones";
    EXPECT_EQ(select(0, 255, 0, 16383),
              (Blocks{{30, top, 30 + 8 * 60, top + 16 * (expected.rowCount + 1)}}));
    EXPECT_EQ(select(0, 9, 20, 20), Blocks{});
    EXPECT_EQ(select(10, 10, 0, 19), Blocks{});
}

// The visible interval is closed: the column after the last visible one still touches it.
TEST_F(GridHighlight, TouchesOnePastTheVisibleCells) {
    start();
    const int top = expected.cellsTop();
    const int rows = expected.rowCount;
    EXPECT_EQ(select(7, 7, 0, 0), (Blocks{{450, top, 510, top + 16}}));
    EXPECT_EQ(select(8, 8, 0, 0), Blocks{});
    EXPECT_EQ(select(7, 200, 0, 0), (Blocks{{450, top, 510, top + 16}}));
    EXPECT_EQ(select(0, 0, rows, rows), (Blocks{{30, top + 16 * rows, 90, top + 16 * (rows + 1)}}));
    EXPECT_EQ(select(0, 0, rows + 1, rows + 1), Blocks{});
}

TEST_F(GridHighlight, NeedsBothColumnsAndRows) {
    start();
    EXPECT_EQ(select(0, 0, 100, 200), Blocks{});
    EXPECT_EQ(select(100, 200, 0, 0), Blocks{});
    EXPECT_EQ(select(0, 255, 100, 100), Blocks{});
}

TEST_F(GridHighlight, RandomBlocksInRandomViews) {
    start();
    std::mt19937 random(31337);
    const auto upTo = [&](int last) {
        return static_cast<int>(random() % static_cast<unsigned>(last + 1));
    };
    for (int i = 0; i < 30; ++i) {
        endColumnResize(upTo(40), upTo(130));
        endRowResize(upTo(60), upTo(45));
    }
    for (int round = 0; round < 300; ++round) {
        if (round % 15 == 0) {
            expected.firstColumn = round % 45 == 0 ? 245 + upTo(10) : upTo(40);
            expected.firstRow = upTo(60);
            SetFirstVisibleCell(KORGRID_CELL(expected.firstColumn, expected.firstRow));
            expected.fitColumns(400);
            expected.fitRows(300 - expected.cellsTop());
        }
        const int left = std::min(expected.firstColumn + upTo(14) - 4, 255);
        const int top = expected.firstRow + upTo(30) - 6;
        if (left < 0 || top < 0) continue;
        const int right = std::min(left + upTo(10), 255);
        const auto found = select(left, right, top, top + upTo(25));
        ASSERT_EQ(found, expectedBlocks()) << round;
    }
}

TEST_F(GridHighlight, InvertsTheImageTwiceToNothing) {
    start();
    hide();
    const Picture before = image();
    select(1, 2, 3, 4);
    EXPECT_FALSE(before == image());
    hide();
    EXPECT_TRUE(SamePicture(before, image()));
}

TEST_F(GridHighlight, ChangesInvalidateOldAndNewBlock) {
    start();
    const int top = expected.cellsTop();
    select(1, 1, 1, 1);
    settle();
    SetSelectedRanged(KORGRID_PAIR(3, 3), KORGRID_PAIR(5, 5));
    EXPECT_EQ(TakeInvalid(grid), (RECT{90, top + 16, 270, top + 96}));
    EXPECT_EQ(inverted(), (Blocks{{90, top + 16, 150, top + 32}, {210, top + 80, 270, top + 96}}));
}

TEST_F(GridHighlight, OutOfSightInvalidatesNothing) {
    start();
    hide();
    TakeInvalid(grid);
    SetSelectedRanged(KORGRID_PAIR(100, 100), KORGRID_PAIR(100, 100));
    EXPECT_EQ(TakeInvalid(grid), std::nullopt);
    EXPECT_EQ(inverted(), Blocks{});
}

// A press right of the sheet's end selects the column that is not there; it is shown there.
TEST_F(GridHighlight, ShowsASelectionPastTheSheet) {
    start();
    SetFirstVisibleCell(KORGRID_CELL(253, 0));
    expected.firstColumn = 253;
    expected.fitColumns(400);
    hide();
    const int top = expected.cellsTop();
    PressAt(grid, 30 + 185, top + 1);
    ReleaseAt(grid, 30 + 185, top + 1);
    EXPECT_EQ(Selection(), (GridSelection{256, 256, 0, 0}));
    EXPECT_EQ(inverted(), (Blocks{{210, top, 270, top + 16}}));
}

TEST_F(GridHighlight, HiddenHeadersMoveIt) {
    start();
    ToggleViewStateOfHeaders();
    const int top = expected.equationBarHeight;
    EXPECT_EQ(select(1, 1, 1, 1), (Blocks{{60, top + 16, 120, top + 32}}));
}

TEST_F(GridHighlight, RedrawKeepsItWhereItWas) {
    start();
    select(1, 3, 2, 4);
    const Picture before = image();
    SendMessageW(grid, GRIDM_REDRAW, 0, 0);
    EXPECT_TRUE(SamePicture(before, image()));
}

}  // namespace
}  // namespace kortest
