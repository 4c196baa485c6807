// The row header grows with the row numbers: 30, 35 or 40 pixels.
#include "grid/use_grid.h"

namespace kortest {
namespace {

// 11 rows are visible; at 35 and 40 pixels still 6 columns.
class RowNumbers : public GridUse {
protected:
    void SetUp() override { open(330, 168); }

    int headerWidth() const { return static_cast<int>(ChildRect(rowHeader).right); }
    void showRow(int row) { SetFirstVisibleCell(KORGRID_CELL(0, row)); }
    void scrollTo(int row) { scrollRows(SB_THUMBPOSITION, row); }

    // Layouts that the grid asked itself for.
    int layouts() const {
        int found = 0;
        for (const ImportCall& call : spy.callsOf("SendMessageW")) {
            if (ArgumentsOf(call)[0] == HandleValue(grid) && ArgumentsOf(call)[1] == WM_SIZE) {
                EXPECT_EQ(call.arguments[2], 3u);
                EXPECT_EQ(call.arguments[3], 0u);
                ++found;
            }
        }
        return found;
    }
};

TEST_F(RowNumbers, WidthFollowsTheRowAfterTheView) {
    const struct {
        int firstRow;
        int width;
    } cases[] = {{0, 30},     {988, 30},   {989, 35},   {990, 35},  {9988, 35}, {9989, 40},
                 {16383, 40}, {65535, 40}, {9988, 35},  {989, 35},  {988, 30},  {9989, 40},
                 {988, 30},   {5000, 35},  {12000, 40}, {5000, 35}, {0, 30}};
    for (const auto& step : cases) {
        SCOPED_TRACE(step.firstRow);
        showRow(step.firstRow);
        EXPECT_EQ(headerWidth(), step.width);
        // Past the sheet no row is visible, and none would count for the next step.
        if (step.firstRow > 16373) showRow(9000);
    }
    for (const auto& step : cases) {
        SCOPED_TRACE(step.firstRow);
        scrollTo(step.firstRow);
        EXPECT_EQ(headerWidth(), step.width);
        if (step.firstRow > 16373) scrollTo(9000);
    }
}

TEST_F(RowNumbers, GrowsDuringLineScrolling) {
    resize(400, barHeight() + 16 + 15 * 16 + GetSystemMetrics(SM_CYHSCROLL));
    ASSERT_EQ(GetNumberOfVisibleRows(), 15u);
    showRow(984);
    EXPECT_EQ(headerWidth(), 30);
    scrollRows(SB_LINEDOWN);
    EXPECT_EQ(headerWidth(), 35);
    scrollRows(SB_LINEUP);
    EXPECT_EQ(headerWidth(), 30);
}

TEST_F(RowNumbers, NewWidthLaysOutAllChildren) {
    const int top = barHeight();
    showRow(2000);
    EXPECT_EQ(ChildRect(CornerButtonOf(grid)), (RECT{0, top, 35, top + 16}));
    EXPECT_EQ(ChildRect(columnHeader), (RECT{35, top, clientWidth(), top + 16}));
    EXPECT_EQ(ChildRect(rowHeader), (RECT{0, top + 16, 35, clientHeight()}));
    showRow(12000);
    EXPECT_EQ(ChildRect(CornerButtonOf(grid)).right, 40);
    EXPECT_EQ(ChildRect(columnHeader).left, 40);
    EXPECT_EQ(ChildRect(rowHeader).right, 40);
}

TEST_F(RowNumbers, CellsBeginBesideTheWiderHeader) {
    Select(0, 0, 2000, 2000);
    showRow(2000);
    UpdateWindow(grid);
    const Picture picture = ReadWindow(grid);
    EXPECT_EQ(picture.pixel(35 + 59, cellsTop() + 15), RGB(0, 0, 0));
    EXPECT_EQ(picture.pixel(35 + 60 + 1, cellsTop() + 15), RGB(255, 255, 255));
}

TEST_F(RowNumbers, OnlyANewWidthAsksForALayout) {
    spy.watch("SendMessageW");
    showRow(100);
    scrollTo(500);
    scrollRows(SB_PAGEDOWN);
    EXPECT_EQ(layouts(), 0);
    showRow(989);
    EXPECT_EQ(layouts(), 1);
    scrollTo(3000);
    scrollRows(SB_LINEUP);
    EXPECT_EQ(layouts(), 1);
    scrollTo(0);
    EXPECT_EQ(layouts(), 2);
}

TEST_F(RowNumbers, NewWidthRepaintsTheCornerButtonAtOnce) {
    spy.watch("InvalidateRect");
    spy.watch("UpdateWindow");
    const DWORD corner = HandleValue(CornerButtonOf(grid));
    const auto repaints = [&] {
        int invalidated = 0;
        int updated = 0;
        for (const ImportCall& call : spy.callsOf("InvalidateRect")) {
            if (ArgumentsOf(call) == std::vector<DWORD>{corner, 0, TRUE}) ++invalidated;
        }
        for (const ImportCall& call : spy.callsOf("UpdateWindow")) {
            if (ArgumentsOf(call)[0] == corner) ++updated;
        }
        spy.clearCalls();
        return std::pair(invalidated, updated);
    };
    showRow(500);
    EXPECT_EQ(repaints(), std::pair(0, 0));
    showRow(1500);
    EXPECT_EQ(repaints(), std::pair(1, 1));
    scrollTo(500);
    EXPECT_EQ(repaints(), std::pair(1, 1));
    scrollTo(501);
    EXPECT_EQ(repaints(), std::pair(0, 0));
}

TEST_F(RowNumbers, FirstVisibleCellIsStoredBeforeTheLayout) {
    told();
    showRow(2000);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 0-6 rows 2000-2011",
                             "sent GRIDN_PAINTCELLS columns 0-6 rows 2000-2011"}));
}

TEST_F(RowNumbers, ScrollingLaysOutWithTheOldRowStill) {
    told();
    scrollTo(2000);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 0-6 rows 0-11",
                             "sent GRIDN_PAINTCELLS columns 0-6 rows 2000-2011"}));
}

TEST_F(RowNumbers, CountFromBeforeTheScrollingDecides) {
    showRow(980);
    for (int row = 0; row < 60; ++row) SetRowHeight(row, 8);
    showRow(0);
    ASSERT_EQ(GetNumberOfVisibleRows(), 11u);
    showRow(985);  // 985 + 11, although 21 rows fit there
    EXPECT_EQ(GetNumberOfVisibleRows(), 21u);
    EXPECT_EQ(headerWidth(), 30);
    scrollRows(SB_LINEUP);  // 984 + 21
    EXPECT_EQ(headerWidth(), 35);
}

TEST_F(RowNumbers, HiddenHeadersKeepTheCellsAtTheLeftEdge) {
    ToggleViewStateOfHeaders();
    spy.watch("SendMessageW");
    showRow(2000);
    EXPECT_EQ(layouts(), 1);
    EXPECT_EQ(ChildRect(columnHeader).left, 0);
    EXPECT_EQ(headerWidth(), 0);
    ToggleViewStateOfHeaders();
    EXPECT_EQ(ChildRect(columnHeader).left, 35);
    EXPECT_EQ(headerWidth(), 35);
}

TEST_F(RowNumbers, ZoomDoesNotScaleTheWidth) {
    SetGridZoomLevel(8);
    EXPECT_EQ(headerWidth(), 30);
    showRow(1500);
    EXPECT_EQ(headerWidth(), 35);
    SetGridZoomLevel(2);
    EXPECT_EQ(headerWidth(), 35);
}

TEST_F(RowNumbers, ColumnScrollingDoesNotAsk) {
    showRow(988);
    SetRowHeight(0, 8);
    SetRowHeight(1, 8);
    send(GRIDM_REDRAW);
    ASSERT_EQ(GetNumberOfVisibleRows(), 12u);  // 988 + 12 = 1000
    scrollColumns(SB_LINEDOWN);
    EXPECT_EQ(headerWidth(), 30);
    scrollRows(SB_THUMBPOSITION, 988);
    EXPECT_EQ(headerWidth(), 35);
}

}  // namespace
}  // namespace kortest
