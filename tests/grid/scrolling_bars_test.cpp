// The scroll bars' range, page and position: set by the host's data ranges, hidden and shown.
#include "grid/use_grid.h"

namespace kortest {
namespace {

// 6 columns (the last half hidden) and 11 rows (as well) are visible.
class ScrollBars : public GridUse {
protected:
    void SetUp() override { open(330, 168); }

    ScrollInfoLog log{spy};
};

TEST_F(ScrollBars, DataRangesBecomeTheMaximum) {
    EXPECT_EQ(SetHorizontalDataRange(100), 0);
    EXPECT_EQ(SetVerticalDataRange(1000), 0);
    EXPECT_EQ(log.lines(), (Lines{BarCall(true, 100, 6, 0), BarCall(false, 1000, 11, 0)}));
    EXPECT_EQ(bar(SB_HORZ).nMax, 100);
    EXPECT_EQ(bar(SB_VERT).nMax, 1000);
    EXPECT_EQ(told(), Lines{});
}

TEST_F(ScrollBars, DataRangeOfTheVisibleCountStays) {
    SetHorizontalDataRange(6);
    SetVerticalDataRange(11);
    SetHorizontalDataRange(7);
    SetVerticalDataRange(12);
    EXPECT_EQ(log.lines(), (Lines{BarCall(true, 6, 6, 0), BarCall(false, 11, 11, 0),
                                  BarCall(true, 7, 6, 0), BarCall(false, 12, 11, 0)}));
}

TEST_F(ScrollBars, DataRangeBelowTheVisibleCountBecomesTheVisibleCount) {
    for (const LONG range : {5L, 0L, -1L, -70000L}) {
        SCOPED_TRACE(range);
        log.clear();
        SetHorizontalDataRange(range);
        SetVerticalDataRange(range);
        EXPECT_EQ(log.lines(), (Lines{BarCall(true, 6, 6, 0), BarCall(false, 11, 11, 0)}));
        // A stored range below the count would now put the bars at 6 and 11.
        log.clear();
        ToggleHorizontalScrollBar();
        ToggleVerticalScrollBar();
        ToggleHorizontalScrollBar();
        ToggleVerticalScrollBar();
        EXPECT_EQ(bar(SB_HORZ).nPos, 0);
        EXPECT_EQ(bar(SB_VERT).nPos, 0);
    }
}

TEST_F(ScrollBars, EightVisibleColumnsMakeADataRangeOfFiveEight) {
    resize(30 + 450 + GetSystemMetrics(SM_CXVSCROLL), 300);
    ASSERT_EQ(GetNumberOfVisibleColumns(), 8u);
    SetHorizontalDataRange(5);
    EXPECT_EQ(log.lines(), (Lines{BarCall(true, 8, 8, 0)}));
}

TEST_F(ScrollBars, HorizontalDataRangeKeepsTheFirstColumnAsPosition) {
    SetFirstVisibleCell(KORGRID_CELL(3, 0));
    for (const int range : {20, 9, 8, 6}) {
        log.clear();
        EXPECT_EQ(SetHorizontalDataRange(range), 3) << range;
        EXPECT_EQ(log.lines(), (Lines{BarCall(true, std::max(9, range), 6, 3)})) << range;
    }
}

TEST_F(ScrollBars, VerticalDataRangePutsAViewPastTheDataBehindIt) {
    SetFirstVisibleCell(KORGRID_CELL(0, 3));
    EXPECT_EQ(SetVerticalDataRange(20), 3);
    EXPECT_EQ(SetVerticalDataRange(14), 3);
    // Rows 3 to 13 are visible: 13 rows of data end inside the view. The platform cuts 14 to 4.
    EXPECT_EQ(SetVerticalDataRange(13), 4);
    EXPECT_EQ(log.lines(), (Lines{BarCall(false, 20, 11, 3), BarCall(false, 14, 11, 3),
                                  BarCall(false, 14, 11, 14)}));
    EXPECT_EQ(bar(SB_VERT).nPos, 4);
}

TEST_F(ScrollBars, HiddenBarsTakeDataRangesWithoutBeingSet) {
    ToggleHorizontalScrollBar();
    ToggleVerticalScrollBar();
    log.clear();
    const LONG handle = static_cast<LONG>(reinterpret_cast<LONG_PTR>(grid));
    EXPECT_EQ(SetHorizontalDataRange(80), handle);
    EXPECT_EQ(SetVerticalDataRange(900), handle);
    EXPECT_EQ(log.lines(), Lines{});
    ToggleHorizontalScrollBar();
    ToggleVerticalScrollBar();
    EXPECT_EQ(bar(SB_HORZ).nMax, 80);
    EXPECT_EQ(bar(SB_VERT).nMax, 900);
}

TEST_F(ScrollBars, HidingCollapsesTheRange) {
    SetHorizontalDataRange(100);
    SetVerticalDataRange(1000);
    spy.watch("SetScrollRange");
    log.clear();
    EXPECT_EQ(ToggleHorizontalScrollBar(), 1u);
    EXPECT_EQ(ToggleVerticalScrollBar(), 1u);
    const auto calls = spy.callsOf("SetScrollRange");
    ASSERT_EQ(calls.size(), 2u);
    const DWORD window = HandleValue(grid);
    EXPECT_EQ(ArgumentsOf(calls[0]), (std::vector<DWORD>{window, SB_HORZ, 0, 0, TRUE}));
    EXPECT_EQ(ArgumentsOf(calls[1]), (std::vector<DWORD>{window, SB_VERT, 0, 0, TRUE}));
    EXPECT_EQ(log.lines(), Lines{});
    EXPECT_EQ(bar(SB_HORZ).nMax, 0);
    EXPECT_EQ(bar(SB_VERT).nMax, 0);
}

TEST_F(ScrollBars, HiddenBarsLeaveTheirRoomToTheCells) {
    const int width = clientWidth();
    const int height = clientHeight();
    ToggleHorizontalScrollBar();
    EXPECT_EQ(clientHeight(), height + GetSystemMetrics(SM_CYHSCROLL));
    EXPECT_EQ(GetNumberOfVisibleRows(), 12u);
    ToggleVerticalScrollBar();
    EXPECT_EQ(clientWidth(), width + GetSystemMetrics(SM_CXVSCROLL));
    ToggleHorizontalScrollBar();
    ToggleVerticalScrollBar();
    EXPECT_EQ(clientWidth(), width);
    EXPECT_EQ(clientHeight(), height);
    EXPECT_EQ(GetNumberOfVisibleRows(), 11u);
}

TEST_F(ScrollBars, ShowingAgainRestoresRangeAndPosition) {
    SetHorizontalDataRange(100);
    SetVerticalDataRange(1000);
    SetFirstVisibleCell(KORGRID_CELL(7, 40));
    ToggleHorizontalScrollBar();
    ToggleVerticalScrollBar();
    log.clear();
    EXPECT_EQ(ToggleHorizontalScrollBar(), 1u);
    EXPECT_EQ(ToggleVerticalScrollBar(), 1u);
    // The bars' room is still with the cells when each range is set.
    EXPECT_EQ(log.lines(), (Lines{BarCall(true, 100, 6, 7), BarCall(false, 1000, 11, 40)}));
}

TEST_F(ScrollBars, ShowingAgainPutsAViewPastTheDataBehindIt) {
    SetHorizontalDataRange(8);
    SetVerticalDataRange(13);
    SetFirstVisibleCell(KORGRID_CELL(3, 3));
    ToggleHorizontalScrollBar();
    ToggleVerticalScrollBar();
    const int columns = static_cast<int>(GetNumberOfVisibleColumns());
    log.clear();
    ToggleHorizontalScrollBar();
    const int rows = static_cast<int>(GetNumberOfVisibleRows());
    ToggleVerticalScrollBar();
    EXPECT_EQ(log.lines(), (Lines{BarCall(true, columns + 3, columns, columns + 3),
                                  BarCall(false, rows + 3, rows, rows + 3)}));
}

TEST_F(ScrollBars, ShowingWithoutADataRangePutsTheBarBehindTheView) {
    ToggleHorizontalScrollBar();
    const int columns = static_cast<int>(GetNumberOfVisibleColumns());
    ToggleHorizontalScrollBar();
    ToggleVerticalScrollBar();
    const int rows = static_cast<int>(GetNumberOfVisibleRows());
    ToggleVerticalScrollBar();
    EXPECT_EQ(log.lines(),
              (Lines{BarCall(true, columns, columns, columns), BarCall(false, rows, rows, rows)}));
}

TEST_F(ScrollBars, ScrollingLeavesHiddenBarsUntouched) {
    SetHorizontalDataRange(100);
    SetVerticalDataRange(1000);
    ToggleHorizontalScrollBar();
    ToggleVerticalScrollBar();
    log.clear();
    spy.watch("SetScrollRange");
    spy.watch("SetScrollPos");
    scrollColumns(SB_LINEDOWN);
    scrollRows(SB_PAGEDOWN);
    EXPECT_EQ(log.lines(), Lines{});
    EXPECT_EQ(spy.count("SetScrollRange"), 0);
    EXPECT_EQ(spy.count("SetScrollPos"), 0);
    EXPECT_EQ(VisibleRange().firstColumn, 1);
    EXPECT_EQ(VisibleRange().firstRow, 11);
    EXPECT_EQ(bar(SB_VERT).nMax, 0);
}

TEST_F(ScrollBars, ShowingAfterScrollingHiddenTellsTheNewPosition) {
    SetVerticalDataRange(1000);
    ToggleVerticalScrollBar();
    scrollRows(SB_THUMBPOSITION, 200);
    ToggleVerticalScrollBar();
    EXPECT_EQ(bar(SB_VERT).nMax, 1000);
    EXPECT_EQ(bar(SB_VERT).nPos, 200);
}

// ---- Which header a toggle lays out again -------------------------------------------------------

class ScrollBarToggles : public GridUse {};

TEST_F(ScrollBarToggles, HorizontalLaysOutTheRowHeaderOnly) {
    open(330, 168, Bars::WhenRanged);
    told();
    SetColumnWidth(0, 40);
    SetRowHeight(0, 40);
    EXPECT_EQ(ToggleHorizontalScrollBar(), 1u);
    EXPECT_EQ(HeaderItems(rowHeader)[0], "1 40");
    EXPECT_EQ(HeaderItems(columnHeader)[0], "A 60");
    EXPECT_EQ(GetNumberOfVisibleRows(), 9u);
    EXPECT_EQ(told(), Lines{});
}

TEST_F(ScrollBarToggles, VerticalLaysOutTheColumnHeaderOnly) {
    open(330, 168, Bars::WhenRanged);
    told();
    SetColumnWidth(0, 150);
    SetRowHeight(0, 40);
    EXPECT_EQ(ToggleVerticalScrollBar(), 1u);
    EXPECT_EQ(HeaderItems(columnHeader)[0], "A 150");
    EXPECT_EQ(HeaderItems(rowHeader)[0], "1 16");
    EXPECT_EQ(GetNumberOfVisibleColumns(), 4u);
    EXPECT_EQ(told(), Lines{});
}

TEST_F(ScrollBarToggles, VerticalCountsTheColumnsBesideTheRowHeader) {
    open(345, 168, Bars::WhenRanged);
    SetFirstVisibleCell(KORGRID_CELL(0, 0));
    ASSERT_EQ(GetNumberOfVisibleColumns(), 7u);
    ToggleVerticalScrollBar();
    EXPECT_EQ(GetNumberOfVisibleColumns(), 6u);
}

TEST_F(ScrollBarToggles, FirstRangeMakesTheBarAppearAndLaysOutAgain) {
    open(330, 168, Bars::WhenRanged);
    const int height = clientHeight();
    told();
    SetHorizontalDataRange(100);
    EXPECT_EQ(clientHeight(), height - GetSystemMetrics(SM_CYHSCROLL));
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 0-6 rows 0-10"}));
}

}  // namespace
}  // namespace kortest
