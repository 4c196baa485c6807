// WM_VSCROLL: where each code takes the view. Unlike the columns, most are never refused.
#include "grid/use_grid.h"

namespace kortest {
namespace {

// 6 columns and 11 rows are visible.
class RowScrolling : public GridUse {
protected:
    void SetUp() override {
        open(330, 168);
        SetVerticalDataRange(500);
        told();
    }

    void start(int row) {
        SetFirstVisibleCell(KORGRID_CELL(0, row));
        told();
    }
    int firstRow() const { return VisibleRange().firstRow; }

    int from(int row, int code, int thumb = 0) {
        start(row);
        EXPECT_EQ(scrollRows(code, thumb), 0);
        EXPECT_FALSE(told().empty()) << "not redrawn from row " << row;
        return firstRow();
    }

    bool isRefused(int row, int code) {
        start(row);
        TakeInvalid(grid);
        EXPECT_EQ(scrollRows(code), 0);
        return told().empty() && !TakeInvalid(grid) && firstRow() == row;
    }
};

TEST_F(RowScrolling, LineUpGoesOneBackAndRedrawsAtTheFirstRow) {
    EXPECT_EQ(from(16383, SB_LINEUP), 16382);
    EXPECT_EQ(from(7, SB_LINEUP), 6);
    EXPECT_EQ(from(1, SB_LINEUP), 0);
    EXPECT_EQ(from(0, SB_LINEUP), 0);
}

TEST_F(RowScrolling, LineDownEndsWhereTheMostRowsEverShownReachTheLast) {
    EXPECT_EQ(from(0, SB_LINEDOWN), 1);
    EXPECT_EQ(from(16372, SB_LINEDOWN), 16373);
    EXPECT_EQ(from(16373, SB_LINEDOWN), 16374);
    EXPECT_TRUE(isRefused(16374, SB_LINEDOWN));
    EXPECT_TRUE(isRefused(16383, SB_LINEDOWN));
}

TEST_F(RowScrolling, PageUpGoesAWholePage) {
    EXPECT_EQ(from(30, SB_PAGEUP), 19);
    EXPECT_EQ(from(12, SB_PAGEUP), 1);
    EXPECT_EQ(from(11, SB_PAGEUP), 0);
    EXPECT_EQ(from(5, SB_PAGEUP), 0);
    EXPECT_EQ(from(0, SB_PAGEUP), 0);
}

TEST_F(RowScrolling, PageDownKeepsOneRowOfThePageAndStopsAtTheLast) {
    EXPECT_EQ(from(0, SB_PAGEDOWN), 10);
    EXPECT_EQ(from(30, SB_PAGEDOWN), 40);
    EXPECT_EQ(from(16373, SB_PAGEDOWN), 16383);
    EXPECT_EQ(from(16374, SB_PAGEDOWN), 16383);  // 10 rows are left there
    EXPECT_EQ(from(16380, SB_PAGEDOWN), 16383);
    EXPECT_EQ(from(16383, SB_PAGEDOWN), 16383);
}

TEST_F(RowScrolling, ThumbPositionIsNeverRefusedOrCut) {
    for (const int row : {0, 1, 989, 16383, 16384, 20000, 32768, 65535}) {
        EXPECT_EQ(from(3, SB_THUMBPOSITION, row), row);
    }
}

TEST_F(RowScrolling, OtherCodesAreIgnoredAndAnswerOne) {
    start(10);
    TakeInvalid(grid);
    for (const int code : {5, 6, 7, 8, 9, 100, 0x7FFF, 0x8000, 0xFFFF}) {
        EXPECT_EQ(scrollRows(code, 44), 1) << code;
    }
    EXPECT_EQ(firstRow(), 10);
    EXPECT_EQ(told(), Lines{});
    EXPECT_FALSE(TakeInvalid(grid));
}

TEST_F(RowScrolling, RefusalRemembersTheLargestCount) {
    const int width = clientWidth() + GetSystemMetrics(SM_CXVSCROLL);
    const int height = clientHeight() + GetSystemMetrics(SM_CYHSCROLL);
    resize(width, height + 160);
    ASSERT_EQ(GetNumberOfVisibleRows(), 21u);
    resize(width, height);
    ASSERT_EQ(GetNumberOfVisibleRows(), 11u);
    EXPECT_EQ(from(16363, SB_LINEDOWN), 16364);
    EXPECT_TRUE(isRefused(16364, SB_LINEDOWN));
    EXPECT_EQ(from(16364, SB_PAGEDOWN), 16374);
}

TEST_F(RowScrolling, RedrawsTheWholeClientAreaOnce) {
    TakeInvalid(grid);
    scrollRows(SB_LINEDOWN);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 0-6 rows 1-12"}));
    EXPECT_EQ(TakeInvalid(grid), client());
    scrollRows(SB_LINEUP);
    told();
    TakeInvalid(grid);
    scrollRows(SB_LINEUP);  // already at the first row
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 0-6 rows 0-11"}));
    EXPECT_EQ(TakeInvalid(grid), client());
}

TEST_F(RowScrolling, MovesTheHighlightWithTheCells) {
    Select(1, 2, 2, 3);
    scrollRows(SB_LINEDOWN);
    model.rows.first = 1;
    const Lines lines = highlight();
    EXPECT_EQ(lines[0], "......");
    EXPECT_EQ(lines[1], ".##...");
    EXPECT_EQ(lines[2], ".##...");
    EXPECT_EQ(lines[3], "......");
}

TEST_F(RowScrolling, BarStandsAtTheFirstRowWhileTheDataReachesPastTheView) {
    ScrollInfoLog log(spy);
    scrollRows(SB_THUMBPOSITION, 489);  // rows 489 to 499
    scrollRows(SB_LINEDOWN);
    scrollRows(SB_LINEUP);
    scrollRows(SB_THUMBPOSITION, 0);
    EXPECT_EQ(log.lines(), (Lines{BarCall(false, 500, 11, 489), BarCall(false, 501, 11, 501),
                                  BarCall(false, 500, 11, 489), BarCall(false, 500, 11, 0)}));
    scrollRows(SB_THUMBPOSITION, 490);
    EXPECT_EQ(bar(SB_VERT).nPos, 491);  // the platform keeps the last page whole
}

TEST_F(RowScrolling, BarIsSetBeforeTheRowsAreCountedAgain) {
    SetRowHeight(4, 100);
    ScrollInfoLog log(spy);
    scrollRows(SB_LINEDOWN);
    EXPECT_EQ(log.lines(), (Lines{BarCall(false, 500, 11, 1)}));
    EXPECT_EQ(GetNumberOfVisibleRows(), 6u);
    scrollRows(SB_LINEDOWN);
    EXPECT_EQ(log.lines().back(), BarCall(false, 500, 6, 2));
}

TEST_F(RowScrolling, LeavesTheColumnHeaderAlone) {
    SetColumnWidth(0, 40);
    scrollRows(SB_LINEDOWN);
    EXPECT_EQ(HeaderItems(columnHeader)[0], "A 60");
}

// ---- Other sizes ------------------------------------------------------------------------------

class RowScrollingElsewhere : public GridUse {};

TEST_F(RowScrollingElsewhere, WithoutADataRangeTheBarStandsBehindTheView) {
    open(330, 168);
    ScrollInfoLog log(spy);
    scrollRows(SB_THUMBPOSITION, 4);
    scrollRows(SB_THUMBPOSITION, 0);
    EXPECT_EQ(log.lines(), (Lines{BarCall(false, 15, 11, 15), BarCall(false, 11, 11, 0)}));
}

TEST_F(RowScrollingElsewhere, LineDownStopsAtTheLastRow) {
    open(330, 10);
    SetFirstVisibleCell(KORGRID_CELL(0, 16382));
    ASSERT_EQ(GetNumberOfVisibleRows(), 1u);
    scrollRows(SB_LINEDOWN);
    EXPECT_EQ(VisibleRange().firstRow, 16383);
    told();
    EXPECT_EQ(scrollRows(SB_LINEDOWN), 0);  // not refused: only one row was ever shown
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 0-6 rows 16383-16384"}));
}

TEST_F(RowScrollingElsewhere, PagesPastTheSheetFollowTheArithmetic) {
    open(330, 168);
    SetFirstVisibleCell(KORGRID_CELL(0, 20000));
    ASSERT_EQ(GetNumberOfVisibleRows(), 0u);
    scrollRows(SB_PAGEUP);  // no row is visible: no step
    EXPECT_EQ(VisibleRange().firstRow, 20000);
    scrollRows(SB_LINEUP);
    EXPECT_EQ(VisibleRange().firstRow, 19999);
    scrollRows(SB_PAGEDOWN);  // cut to the last row
    EXPECT_EQ(VisibleRange().firstRow, 16383);
}

// Before the first size nothing is visible, and a page less one is a step back.
TEST_F(RowScrollingElsewhere, PageDownOfNothingMakesTheOriginNegative) {
    grid = host.createGrid(0, 0);
    ASSERT_EQ(GetNumberOfVisibleRows(), 0u);
    GridCellPair cell{77, 88};
    EXPECT_EQ(GetCurrentSelectedCell(&cell), 1u);
    cell = {77, 88};
    EXPECT_EQ(scrollRows(SB_PAGEDOWN), 0);
    EXPECT_EQ(GetCurrentSelectedCell(&cell), 0u);
    EXPECT_EQ(cell.column, 77);
    EXPECT_EQ(cell.row, 88);
    EXPECT_EQ(scrollRows(SB_LINEUP), 0);
    EXPECT_EQ(GetCurrentSelectedCell(&cell), 1u);
    EXPECT_EQ(scrollColumns(SB_PAGEDOWN), 0);
    EXPECT_EQ(GetCurrentSelectedCell(&cell), 0u);
    EXPECT_EQ(scrollColumns(SB_LINEUP), 0);  // refused: first < 1
    EXPECT_EQ(GetCurrentSelectedCell(&cell), 0u);
    EXPECT_EQ(scrollColumns(SB_LINEDOWN), 0);
    EXPECT_EQ(GetCurrentSelectedCell(&cell), 1u);
}

}  // namespace
}  // namespace kortest
