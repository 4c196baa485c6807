// WM_HSCROLL: where each code takes the view, and when it is refused.
#include "grid/use_grid.h"

namespace kortest {
namespace {

// 6 columns and 11 rows are visible.
class ColumnScrolling : public GridUse {
protected:
    void SetUp() override {
        open(330, 168);
        SetHorizontalDataRange(100);
        told();
    }

    void start(int column) {
        SetFirstVisibleCell(KORGRID_CELL(column, 0));
        told();
    }
    int firstColumn() const { return VisibleRange().firstColumn; }

    // Scrolls from a column; the column that is first then.
    int from(int column, int code, int thumb = 0) {
        start(column);
        EXPECT_EQ(scrollColumns(code, thumb), 0);
        return firstColumn();
    }

    bool isRefused(int column, int code) {
        start(column);
        TakeInvalid(grid);
        EXPECT_EQ(scrollColumns(code), 0);
        return told().empty() && !TakeInvalid(grid) && firstColumn() == column;
    }
};

TEST_F(ColumnScrolling, LineUpGoesOneBack) {
    EXPECT_EQ(from(1, SB_LINEUP), 0);
    EXPECT_EQ(from(7, SB_LINEUP), 6);
    EXPECT_EQ(from(255, SB_LINEUP), 254);
}

TEST_F(ColumnScrolling, LineUpIsRefusedAtTheFirstColumn) { EXPECT_TRUE(isRefused(0, SB_LINEUP)); }

TEST_F(ColumnScrolling, LineDownGoesOneOn) {
    EXPECT_EQ(from(0, SB_LINEDOWN), 1);
    EXPECT_EQ(from(100, SB_LINEDOWN), 101);
}

TEST_F(ColumnScrolling, LineDownEndsWhereTheMostColumnsEverShownReachTheLast) {
    EXPECT_EQ(from(249, SB_LINEDOWN), 250);
    EXPECT_EQ(from(250, SB_LINEDOWN), 251);
    EXPECT_TRUE(isRefused(251, SB_LINEDOWN));
    EXPECT_TRUE(isRefused(255, SB_LINEDOWN));
}

TEST_F(ColumnScrolling, PageUpKeepsOneColumnOfThePage) {
    EXPECT_EQ(from(20, SB_PAGEUP), 15);
    EXPECT_EQ(from(6, SB_PAGEUP), 1);
    EXPECT_EQ(from(5, SB_PAGEUP), 0);
    EXPECT_EQ(from(1, SB_PAGEUP), 0);
    EXPECT_TRUE(isRefused(0, SB_PAGEUP));
}

TEST_F(ColumnScrolling, PageDownKeepsOneColumnOfThePage) {
    EXPECT_EQ(from(0, SB_PAGEDOWN), 5);
    EXPECT_EQ(from(40, SB_PAGEDOWN), 45);
    EXPECT_EQ(from(250, SB_PAGEDOWN), 255);
    EXPECT_TRUE(isRefused(251, SB_PAGEDOWN));
}

TEST_F(ColumnScrolling, RefusalRemembersTheLargestCount) {
    const SIZE window{static_cast<int>(clientWidth() + GetSystemMetrics(SM_CXVSCROLL)), 250};
    resize(static_cast<int>(window.cx) + 300, 250);
    ASSERT_EQ(GetNumberOfVisibleColumns(), 11u);
    resize(static_cast<int>(window.cx), 250);
    ASSERT_EQ(GetNumberOfVisibleColumns(), 6u);
    EXPECT_EQ(from(245, SB_LINEDOWN), 246);
    EXPECT_TRUE(isRefused(246, SB_LINEDOWN));
    EXPECT_TRUE(isRefused(246, SB_PAGEDOWN));
    EXPECT_EQ(from(246, SB_LINEUP), 245);
    EXPECT_EQ(from(246, SB_PAGEUP), 241);
}

TEST_F(ColumnScrolling, ThumbPositionIsNeverRefusedOrCut) {
    for (const int column : {0, 1, 250, 251, 255, 256, 300, 32767, 32768, 65535}) {
        EXPECT_EQ(from(3, SB_THUMBPOSITION, column), column);
    }
    EXPECT_EQ(from(0, SB_THUMBPOSITION, 0), 0);
}

TEST_F(ColumnScrolling, ThumbPositionOnTheSameColumnRedraws) {
    start(7);
    EXPECT_EQ(scrollColumns(SB_THUMBPOSITION, 7), 0);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 7-13 rows 0-11"}));
}

TEST_F(ColumnScrolling, OtherCodesAreIgnoredAndAnswerOne) {
    start(10);
    TakeInvalid(grid);
    for (const int code : {5, 6, 7, 8, 9, 100, 0x7FFF, 0x8000, 0xFFFF}) {
        EXPECT_EQ(scrollColumns(code, 44), 1) << code;
    }
    EXPECT_EQ(firstColumn(), 10);
    EXPECT_EQ(told(), Lines{});
    EXPECT_FALSE(TakeInvalid(grid));
}

TEST_F(ColumnScrolling, LinesAndPagesIgnoreTheThumb) {
    EXPECT_EQ(from(10, SB_LINEUP, 77), 9);
    EXPECT_EQ(from(10, SB_LINEDOWN, 77), 11);
    EXPECT_EQ(from(10, SB_PAGEUP, 77), 5);
    EXPECT_EQ(from(10, SB_PAGEDOWN, 77), 15);
}

TEST_F(ColumnScrolling, RedrawsTheWholeClientAreaOnce) {
    TakeInvalid(grid);
    scrollColumns(SB_LINEDOWN);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 1-7 rows 0-11"}));
    EXPECT_EQ(TakeInvalid(grid), client());
}

TEST_F(ColumnScrolling, MovesTheHighlightWithTheCells) {
    Select(2, 3, 1, 2);
    scrollColumns(SB_LINEDOWN);
    const Lines lines = [&] {
        model.columns.first = 1;
        return highlight();
    }();
    EXPECT_EQ(lines[0], "......");
    EXPECT_EQ(lines[1], ".##...");
    EXPECT_EQ(lines[2], ".##...");
    EXPECT_EQ(lines[3], "......");
}

TEST_F(ColumnScrolling, BarStandsAtTheFirstColumnWhileTheDataReachesPastTheView) {
    ScrollInfoLog log(spy);
    scrollColumns(SB_THUMBPOSITION, 94);  // columns 94 to 99
    scrollColumns(SB_LINEDOWN);
    scrollColumns(SB_LINEUP);
    scrollColumns(SB_THUMBPOSITION, 0);
    EXPECT_EQ(log.lines(), (Lines{BarCall(true, 100, 6, 94), BarCall(true, 101, 6, 101),
                                  BarCall(true, 100, 6, 94), BarCall(true, 100, 6, 0)}));
    scrollColumns(SB_THUMBPOSITION, 95);
    EXPECT_EQ(bar(SB_HORZ).nMax, 101);
    EXPECT_EQ(bar(SB_HORZ).nPos, 96);  // the platform keeps the last page whole
}

TEST_F(ColumnScrolling, BarIsSetBeforeTheColumnsAreCountedAgain) {
    SetColumnWidth(4, 300);
    ScrollInfoLog log(spy);
    scrollColumns(SB_LINEDOWN);
    EXPECT_EQ(log.lines(), (Lines{BarCall(true, 100, 6, 1)}));
    EXPECT_EQ(GetNumberOfVisibleColumns(), 4u);
    scrollColumns(SB_LINEDOWN);
    EXPECT_EQ(log.lines().back(), BarCall(true, 100, 4, 2));
}

TEST_F(ColumnScrolling, LeavesTheRowHeaderAlone) {
    SetRowHeight(0, 40);
    scrollColumns(SB_LINEDOWN);
    EXPECT_EQ(HeaderItems(rowHeader)[0], "1 16");
}

// ---- Other sizes ------------------------------------------------------------------------------

class ColumnScrollingElsewhere : public GridUse {};

TEST_F(ColumnScrollingElsewhere, CountsColumnsOverTheFullClientWidth) {
    open(345, 168);
    ASSERT_EQ(GetNumberOfVisibleColumns(), 6u);
    scrollColumns(SB_LINEDOWN);
    EXPECT_EQ(GetNumberOfVisibleColumns(), 7u);
    EXPECT_EQ(HeaderItems(columnHeader).size(), 7u);
}

TEST_F(ColumnScrollingElsewhere, WithoutADataRangeTheBarStandsBehindTheView) {
    open(330, 168);
    ScrollInfoLog log(spy);
    scrollColumns(SB_THUMBPOSITION, 4);
    scrollColumns(SB_THUMBPOSITION, 0);
    EXPECT_EQ(log.lines(), (Lines{BarCall(true, 10, 6, 10), BarCall(true, 6, 6, 0)}));
}

TEST_F(ColumnScrollingElsewhere, PageUpOfOneColumnStaysAndRedraws) {
    open(20, 168);
    SetFirstVisibleCell(KORGRID_CELL(5, 0));
    ASSERT_EQ(GetNumberOfVisibleColumns(), 1u);
    told();
    EXPECT_EQ(scrollColumns(SB_PAGEUP), 0);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 5-6 rows 0-11"}));
    EXPECT_EQ(scrollColumns(SB_PAGEDOWN), 0);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 5-6 rows 0-11"}));
}

TEST_F(ColumnScrollingElsewhere, LineDownStopsAtTheLastColumn) {
    open(20, 168);
    SetFirstVisibleCell(KORGRID_CELL(254, 0));
    scrollColumns(SB_LINEDOWN);
    EXPECT_EQ(VisibleRange().firstColumn, 255);
    told();
    EXPECT_EQ(scrollColumns(SB_LINEDOWN), 0);  // not refused: only one column was ever shown
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 255-256 rows 0-11"}));
}

TEST_F(ColumnScrollingElsewhere, PagesPastTheSheetFollowTheArithmetic) {
    open(330, 168);
    SetFirstVisibleCell(KORGRID_CELL(300, 0));
    ASSERT_EQ(GetNumberOfVisibleColumns(), 0u);
    scrollColumns(SB_LINEUP);
    EXPECT_EQ(VisibleRange().firstColumn, 299);
    scrollColumns(SB_PAGEUP);  // no column is visible: one on
    EXPECT_EQ(VisibleRange().firstColumn, 300);
    told();
    scrollColumns(SB_LINEDOWN);
    scrollColumns(SB_PAGEDOWN);
    EXPECT_EQ(told(), Lines{});
}

}  // namespace
}  // namespace kortest
