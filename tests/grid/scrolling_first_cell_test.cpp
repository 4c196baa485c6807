// SetFirstVisibleCell: the host's way of scrolling.
#include "grid/use_grid.h"

namespace kortest {
namespace {

class FirstVisibleCell : public GridUse {
protected:
    void SetUp() override {
        open(330, 168);
        told();
    }
};

TEST_F(FirstVisibleCell, BecomesTheTopLeftCell) {
    EXPECT_EQ(SetFirstVisibleCell(KORGRID_CELL(7, 40)), 1u);
    EXPECT_EQ(VisibleRange(), Range(7, 13, 40, 51));
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 7-13 rows 40-51"}));
    EXPECT_EQ(HeaderItems(columnHeader), (Lines{"H 60", "I 60", "J 60", "K 60", "L 60", "M 60"}));
    EXPECT_EQ(HeaderItems(rowHeader)[0], "41 16");
    EXPECT_EQ(HeaderItems(rowHeader)[10], "51 16");
}

TEST_F(FirstVisibleCell, RedrawsTheWholeClientAreaAlsoInPlace) {
    TakeInvalid(grid);
    SetFirstVisibleCell(0);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_PAINTCELLS columns 0-6 rows 0-11"}));
    EXPECT_EQ(TakeInvalid(grid), client());
}

TEST_F(FirstVisibleCell, PutsTheBarsToItsColumnAndRow) {
    SetHorizontalDataRange(100);
    SetVerticalDataRange(1000);
    spy.watch("SetScrollPos");
    spy.watch("SetScrollInfo");
    SetFirstVisibleCell(KORGRID_CELL(7, 40));
    const DWORD window = HandleValue(grid);
    const auto calls = spy.callsOf("SetScrollPos");
    ASSERT_EQ(calls.size(), 2u);
    EXPECT_EQ(ArgumentsOf(calls[0]), (std::vector<DWORD>{window, SB_HORZ, 7, TRUE}));
    EXPECT_EQ(ArgumentsOf(calls[1]), (std::vector<DWORD>{window, SB_VERT, 40, TRUE}));
    EXPECT_EQ(spy.count("SetScrollInfo"), 0);
    EXPECT_EQ(bar(SB_HORZ).nPos, 7);
    EXPECT_EQ(bar(SB_VERT).nPos, 40);
    EXPECT_EQ(bar(SB_VERT).nMax, 1000);
}

TEST_F(FirstVisibleCell, PutsHiddenBarsAsWell) {
    ToggleHorizontalScrollBar();
    ToggleVerticalScrollBar();
    spy.watch("SetScrollPos");
    SetFirstVisibleCell(KORGRID_CELL(7, 40));
    EXPECT_EQ(spy.sequence(), "SetScrollPos SetScrollPos");
}

TEST_F(FirstVisibleCell, HasNoColumnsPastTheSheet) {
    for (const int column : {256, 300, 65535}) {
        SCOPED_TRACE(column);
        told();
        SetFirstVisibleCell(KORGRID_CELL(column, 0));
        EXPECT_EQ(VisibleRange(), Range(column, column, 0, 11));
        EXPECT_EQ(GetNumberOfVisibleColumns(), 0u);
        EXPECT_EQ(HeaderItems(columnHeader), Lines{});
        EXPECT_EQ(told().size(), 1u);
    }
    SetFirstVisibleCell(KORGRID_CELL(255, 0));
    EXPECT_EQ(HeaderItems(columnHeader), (Lines{"IV 60"}));
}

TEST_F(FirstVisibleCell, HasNoRowsPastTheSheet) {
    for (const int row : {16384, 20000, 65535}) {
        SCOPED_TRACE(row);
        SetFirstVisibleCell(KORGRID_CELL(0, row));
        EXPECT_EQ(VisibleRange(), Range(0, 6, row, row));
        EXPECT_EQ(GetNumberOfVisibleRows(), 0u);
        EXPECT_EQ(HeaderItems(rowHeader), Lines{});
    }
    SetFirstVisibleCell(KORGRID_CELL(0, 16383));
    EXPECT_EQ(HeaderItems(rowHeader), (Lines{"16384 16"}));
}

TEST_F(FirstVisibleCell, ShowsFewerCellsNearTheSheetsEnd) {
    SetFirstVisibleCell(KORGRID_CELL(253, 16380));
    EXPECT_EQ(VisibleRange(), Range(253, 256, 16380, 16384));
    EXPECT_EQ(HeaderItems(columnHeader), (Lines{"IT 60", "IU 60", "IV 60"}));
    EXPECT_EQ(HeaderItems(rowHeader), (Lines{"16381 16", "16382 16", "16383 16", "16384 16"}));
    SetFirstVisibleCell(0);
    EXPECT_EQ(VisibleRange(), Range(0, 6, 0, 11));
}

TEST_F(FirstVisibleCell, KeepsTheSelectionAndItsHighlight) {
    Select(1, 2, 3, 4);
    model.setSelection(Block(1, 2, 3, 4));
    const int cells[][2] = {{0, 0}, {1, 0}, {2, 3}, {3, 3}, {2, 4}, {2, 5}, {0, 0}};
    for (const auto& cell : cells) {
        SetFirstVisibleCell(KORGRID_CELL(cell[0], cell[1]));
        model.setFirstVisibleCell(cell[0], cell[1]);
        EXPECT_EQ(highlight(), expectedHighlight()) << cell[0] << ", " << cell[1];
    }
    EXPECT_EQ(Selection(), Block(1, 2, 3, 4));
}

TEST_F(FirstVisibleCell, CountsColumnsOverTheFullClientWidth) {
    resize(30 + 345 + GetSystemMetrics(SM_CXVSCROLL), 250);
    ASSERT_EQ(GetNumberOfVisibleColumns(), 6u);  // beside the row header
    SetFirstVisibleCell(0);
    EXPECT_EQ(GetNumberOfVisibleColumns(), 7u);
    send(GRIDM_REDRAW);
    EXPECT_EQ(GetNumberOfVisibleColumns(), 6u);
    SetFirstVisibleCell(0);
    ToggleGridLines();
    EXPECT_EQ(GetNumberOfVisibleColumns(), 6u);
}

TEST_F(FirstVisibleCell, LaysOutBothHeadersAnew) {
    SetColumnWidth(1, 45);
    SetRowHeight(2, 30);
    EXPECT_EQ(HeaderItems(columnHeader)[1], "B 60");
    EXPECT_EQ(HeaderItems(rowHeader)[2], "3 16");
    SetFirstVisibleCell(0);
    EXPECT_EQ(HeaderItems(columnHeader)[1], "B 45");
    EXPECT_EQ(HeaderItems(rowHeader)[2], "3 30");
}

}  // namespace
}  // namespace kortest
