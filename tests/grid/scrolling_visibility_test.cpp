// GetVisibleRange, the counts, IsIndexVisible and IsIndexCompletelyVisible.
#include "grid/use_grid.h"

namespace kortest {
namespace {

class Visibility : public GridUse {
protected:
    void SetUp() override { open(330, 168); }

    int rightOf(int column) const {
        int right = model.cellsLeft;
        for (int i = model.columns.first; i <= column; ++i) right += model.widthOf(i);
        return right;
    }
    int bottomOf(int row) const {
        int bottom = model.cellsTop;
        for (int i = model.rows.first; i <= row; ++i) bottom += model.heightOf(i);
        return bottom;
    }

    // Compares both functions with the model for the whole sheet and a little more.
    void expectWholeSheetAsModel() {
        const AxisModel& columns = model.columns;
        const AxisModel& rows = model.rows;
        std::vector<bool> columnFits(300);
        for (int column = columns.first; column < columns.end(); ++column) {
            columnFits[static_cast<size_t>(column)] = rightOf(column) <= clientWidth();
        }
        int wrong = 0;
        for (int row = 0; row < 16400; ++row) {
            const bool rowShows = row >= rows.first && row < rows.end();
            const bool rowFits = rowShows && bottomOf(row) <= clientHeight();
            for (int column = 0; column < 300; ++column) {
                const bool shows = rowShows && column >= columns.first && column < columns.end();
                const bool isLast = column == columns.end() - 1 || row == rows.end() - 1;
                const bool fits = columnFits[static_cast<size_t>(column)] && rowFits;
                const CellIndex cell = KORGRID_CELL(column, row);
                if (IsIndexVisible(cell) != (shows ? 1u : 0u)) ++wrong;
                if (IsIndexCompletelyVisible(cell) != (shows && (!isLast || fits) ? 1u : 0u)) {
                    ++wrong;
                }
            }
        }
        EXPECT_EQ(wrong, 0);
    }
};

TEST_F(Visibility, RangeEndsBehindTheLastVisibleCell) {
    EXPECT_EQ(VisibleRange(), Range(0, 6, 0, 11));
    EXPECT_EQ(GetNumberOfVisibleColumns(), 6u);
    EXPECT_EQ(GetNumberOfVisibleRows(), 11u);
    SetFirstVisibleCell(KORGRID_CELL(254, 16000));
    EXPECT_EQ(VisibleRange(), Range(254, 256, 16000, 16011));
    EXPECT_EQ(GetNumberOfVisibleColumns(), 2u);
}

TEST_F(Visibility, RangeIgnoresANullPointer) {
    GetVisibleRange(nullptr);
    EXPECT_EQ(VisibleRange(), Range(0, 6, 0, 11));
}

TEST_F(Visibility, RangeWritesEightBytes) {
    WORD words[6] = {0xAAAA, 0xAAAA, 0xAAAA, 0xAAAA, 0xAAAA, 0xAAAA};
    GetVisibleRange(reinterpret_cast<GridVisibleRange*>(words + 1));
    EXPECT_EQ(words[0], 0xAAAA);
    EXPECT_EQ(words[2], 6);
    EXPECT_EQ(words[4], 11);
    EXPECT_EQ(words[5], 0xAAAA);
}

TEST_F(Visibility, WholeSheetOfAFreshGrid) { expectWholeSheetAsModel(); }

TEST_F(Visibility, WholeSheetAfterScrolling) {
    SetFirstVisibleCell(KORGRID_CELL(250, 16370));
    model.setFirstVisibleCell(250, 16370);
    ASSERT_TRUE(isAsModel());
    expectWholeSheetAsModel();
}

TEST_F(Visibility, WholeSheetWithOtherSizes) {
    for (int i = 0; i < 4; ++i) {
        SetColumnWidth(i, 20 + 31 * i);
        model.setColumnWidth(i, 20 + 31 * i);
        SetRowHeight(i, 5 + 13 * i);
        model.setRowHeight(i, 5 + 13 * i);
    }
    SetFirstVisibleCell(KORGRID_CELL(1, 1));
    model.setFirstVisibleCell(1, 1);
    ASSERT_TRUE(isAsModel());
    expectWholeSheetAsModel();
}

TEST_F(Visibility, WholeSheetWhenAllCellsFitExactly) {
    resize(30 + 300 + GetSystemMetrics(SM_CXVSCROLL),
           cellsTop() + 160 + GetSystemMetrics(SM_CYHSCROLL));
    model.resize(30 + 300 + GetSystemMetrics(SM_CXVSCROLL),
                 cellsTop() + 160 + GetSystemMetrics(SM_CYHSCROLL));
    ASSERT_TRUE(isAsModel());
    EXPECT_EQ(IsIndexCompletelyVisible(KORGRID_CELL(4, 9)), 1u);
    expectWholeSheetAsModel();
}

TEST_F(Visibility, WholeSheetWithoutHeaders) {
    ToggleViewStateOfHeaders();
    model.toggleHeaders();
    ASSERT_TRUE(isAsModel());
    expectWholeSheetAsModel();
}

TEST_F(Visibility, NothingShowsPastTheSheet) {
    SetFirstVisibleCell(KORGRID_CELL(256, 0));
    EXPECT_EQ(IsIndexVisible(KORGRID_CELL(256, 0)), 0u);
    EXPECT_EQ(IsIndexCompletelyVisible(KORGRID_CELL(256, 0)), 0u);
    SetFirstVisibleCell(KORGRID_CELL(0, 16384));
    EXPECT_EQ(IsIndexVisible(KORGRID_CELL(0, 16384)), 0u);
    EXPECT_EQ(IsIndexCompletelyVisible(KORGRID_CELL(0, 16384)), 0u);
}

TEST_F(Visibility, LastColumnIsCompleteWhenItEndsAtTheEdge) {
    const int bars = GetSystemMetrics(SM_CXVSCROLL);
    resize(30 + 300 + bars, 300);
    EXPECT_EQ(IsIndexCompletelyVisible(KORGRID_CELL(4, 0)), 1u);
    resize(30 + 299 + bars, 300);
    EXPECT_EQ(IsIndexVisible(KORGRID_CELL(4, 0)), 1u);
    EXPECT_EQ(IsIndexCompletelyVisible(KORGRID_CELL(4, 0)), 0u);
}

TEST_F(Visibility, LastRowIsCompleteWhenItEndsAtTheEdge) {
    const int below = cellsTop() + GetSystemMetrics(SM_CYHSCROLL);
    resize(400, below + 160);
    EXPECT_EQ(IsIndexCompletelyVisible(KORGRID_CELL(0, 9)), 1u);
    resize(400, below + 159);
    EXPECT_EQ(IsIndexVisible(KORGRID_CELL(0, 9)), 1u);
    EXPECT_EQ(IsIndexCompletelyVisible(KORGRID_CELL(0, 9)), 0u);
}

TEST_F(Visibility, CellInTheLastColumnMustFitInBothDirections) {
    const int right = 30 + 300 + GetSystemMetrics(SM_CXVSCROLL);
    resize(right, cellsTop() + 155 + GetSystemMetrics(SM_CYHSCROLL));
    EXPECT_EQ(IsIndexCompletelyVisible(KORGRID_CELL(4, 8)), 1u);
    EXPECT_EQ(IsIndexCompletelyVisible(KORGRID_CELL(4, 9)), 0u);
}

// Scrolling counts the columns over the full client width, so a column that is cut at the edge can
// be the last but one, and only the last one is measured.
TEST_F(Visibility, CutColumnBeforeTheLastCountsAsComplete) {
    resize(30 + 345 + GetSystemMetrics(SM_CXVSCROLL), 300);
    EXPECT_EQ(IsIndexCompletelyVisible(KORGRID_CELL(5, 0)), 0u);
    SetFirstVisibleCell(0);
    ASSERT_EQ(GetNumberOfVisibleColumns(), 7u);
    EXPECT_EQ(IsIndexCompletelyVisible(KORGRID_CELL(5, 0)), 1u);
    EXPECT_EQ(IsIndexCompletelyVisible(KORGRID_CELL(6, 0)), 0u);
}

// In the last row both directions are measured, so there the same column is found to be cut.
TEST_F(Visibility, CutColumnBeforeTheLastIsFoundInTheLastRow) {
    resize(30 + 345 + GetSystemMetrics(SM_CXVSCROLL),
           cellsTop() + 160 + GetSystemMetrics(SM_CYHSCROLL));
    SetFirstVisibleCell(0);
    EXPECT_EQ(IsIndexCompletelyVisible(KORGRID_CELL(5, 8)), 1u);
    EXPECT_EQ(IsIndexCompletelyVisible(KORGRID_CELL(5, 9)), 0u);
    EXPECT_EQ(IsIndexCompletelyVisible(KORGRID_CELL(4, 9)), 1u);
}

}  // namespace
}  // namespace kortest
