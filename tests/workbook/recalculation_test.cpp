// Changes reach all cells that depend on them, rings are found, and chains of any length are
// followed. A quadratic or recursive way would run into the suite's time limit, or out of stack.
#include "sheet_support.h"

#include <gtest/gtest.h>

namespace workbook {
namespace {

std::wstring Number(int number) { return std::to_wstring(number); }

TEST(Recalculation, FollowsAChange) {
    Sheet sheet = SheetOf({{L"A1", L"1"}, {L"B1", L"=A1+1"}, {L"C1", L"=B1*10"}});
    EXPECT_EQ(Show(sheet, L"C1"), L"20");
    sheet.setText(At(L"A1"), L"4");
    EXPECT_EQ(Show(sheet, L"C1"), L"50");
    EXPECT_EQ(Show(sheet, L"B1"), L"5");
}

TEST(Recalculation, FollowsAChangeInsideABlock) {
    Sheet sheet = SheetOf({{L"A1", L"1"}, {L"D4", L"=SUM(A1:C100)"}});
    EXPECT_EQ(Show(sheet, L"D4"), L"1");
    sheet.setText(At(L"C100"), L"5");
    EXPECT_EQ(Show(sheet, L"D4"), L"6");
    sheet.setText(At(L"C101"), L"50");
    EXPECT_EQ(Show(sheet, L"D4"), L"6");
    sheet.setText(At(L"A1"), L"");
    EXPECT_EQ(Show(sheet, L"D4"), L"5");
}

TEST(Recalculation, ForgetsWhatAFormulaReadBefore) {
    Sheet sheet = SheetOf({{L"A1", L"1"}, {L"A2", L"2"}, {L"B1", L"=A1"}, {L"C1", L"=B1"}});
    EXPECT_EQ(Show(sheet, L"C1"), L"1");
    sheet.setText(At(L"B1"), L"=A2");
    EXPECT_EQ(Show(sheet, L"C1"), L"2");
    sheet.setText(At(L"A1"), L"7");
    EXPECT_EQ(Show(sheet, L"C1"), L"2");
    sheet.setText(At(L"B1"), L"constant");
    EXPECT_EQ(Show(sheet, L"C1"), L"constant");
}

TEST(Recalculation, FollowsChangesMadeBeforeAnythingWasRead) {
    Sheet sheet = SheetOf({{L"C1", L"=B1"}, {L"B1", L"=A1"}, {L"A1", L"1"}});
    sheet.setText(At(L"A1"), L"2");
    sheet.setText(At(L"A1"), L"3");
    EXPECT_EQ(Show(sheet, L"C1"), L"3");
    sheet.setText(At(L"A1"), L"4");
    sheet.setText(At(L"D1"), L"=A1");
    sheet.setText(At(L"A1"), L"5");
    EXPECT_EQ(Show(sheet, L"D1"), L"5");
    EXPECT_EQ(Show(sheet, L"C1"), L"5");
}

TEST(Recalculation, ReplacesAFormulaByOneThatReadsTheSameCell) {
    Sheet sheet = SheetOf({{L"A1", L"1"}, {L"B1", L"=A1+1"}});
    EXPECT_EQ(Show(sheet, L"B1"), L"2");
    sheet.setText(At(L"B1"), L"=A1+2");
    EXPECT_EQ(Show(sheet, L"B1"), L"3");
    sheet.setText(At(L"A1"), L"10");
    EXPECT_EQ(Show(sheet, L"B1"), L"12");
}

TEST(Recalculation, FindsACellThatReadsItself) {
    Sheet sheet = SheetOf({{L"A1", L"=A1+1"}, {L"B1", L"=SUM(B1:B5)"}, {L"C1", L"=COUNT(A1:D4)"}});
    EXPECT_EQ(Show(sheet, L"A1"), L"#CIRC!");
    EXPECT_EQ(Show(sheet, L"B1"), L"#CIRC!");
    EXPECT_EQ(Show(sheet, L"C1"), L"#CIRC!");
}

TEST(Recalculation, FindsRingsWhicheverCellIsReadFirst) {
    // A1 reads B1 and C1, B1 reads A1, C1 reads B1: one ring of three. COUNT passes over errors, so
    // a search that leaves C1 out of the ring would show a number there.
    for (const wchar_t* first : {L"A1", L"B1", L"C1"}) {
        Sheet sheet =
            SheetOf({{L"A1", L"=B1+C1"}, {L"B1", L"=A1"}, {L"C1", L"=COUNT(B1)"}, {L"D1", L"=5"}});
        EXPECT_EQ(Show(sheet, first), L"#CIRC!");
        for (const wchar_t* cell : {L"A1", L"B1", L"C1"})
            EXPECT_EQ(Show(sheet, cell), L"#CIRC!") << "after " << first;
        EXPECT_EQ(Show(sheet, L"D1"), L"5");
    }
}

TEST(Recalculation, CellsThatReadARingAreNotInIt) {
    const Sheet sheet = SheetOf({{L"A1", L"=B1"},
                                 {L"B1", L"=A1"},
                                 {L"C1", L"=A1"},
                                 {L"D1", L"=COUNT(A1:B1)"},
                                 {L"E1", L"=IF(TRUE,1,A1)"}});
    EXPECT_EQ(Show(sheet, L"C1"), L"#CIRC!");  // the error passes on
    EXPECT_EQ(Show(sheet, L"D1"), L"0");
    EXPECT_EQ(Show(sheet, L"E1"), L"1");
}

TEST(Recalculation, CountsReferencesThatIfDoesNotChoose) {
    EXPECT_EQ(Result(L"=IF(TRUE,1,IV16384)"), L"#CIRC!");
}

TEST(Recalculation, RecoversWhenARingIsOpened) {
    Sheet sheet = SheetOf({{L"A1", L"=C1+1"}, {L"B1", L"=A1+1"}, {L"C1", L"=B1+1"}});
    EXPECT_EQ(Show(sheet, L"B1"), L"#CIRC!");
    sheet.setText(At(L"C1"), L"1");
    EXPECT_EQ(Show(sheet, L"B1"), L"3");
    sheet.setText(At(L"C1"), L"=B1");
    EXPECT_EQ(Show(sheet, L"A1"), L"#CIRC!");
    EXPECT_EQ(Show(sheet, L"C1"), L"#CIRC!");
}

TEST(Recalculation, CalculatesAChainOverAllRows) {
    Sheet sheet;
    for (int row = 1; row < kRowCount; ++row) sheet.setText({0, row}, L"=A" + Number(row) + L"+1");
    sheet.setText({0, 0}, L"1");
    EXPECT_EQ(Show(sheet, L"A16384"), L"16384");
    sheet.setText({0, 0}, L"1001");
    EXPECT_EQ(Show(sheet, L"A16384"), L"17384");
}

TEST(Recalculation, CalculatesAChainThatRunsUpwards) {
    Sheet sheet;
    for (int row = 0; row + 1 < kRowCount; ++row)
        sheet.setText({0, row}, L"=A" + Number(row + 2) + L"+1");
    sheet.setText({0, kRowCount - 1}, L"0");
    EXPECT_EQ(Show(sheet, L"A1"), L"16383");
}

TEST(Recalculation, FindsARingOverAllRows) {
    Sheet sheet;
    for (int row = 0; row < kRowCount; ++row)
        sheet.setText({0, row}, L"=A" + Number((row + 1) % kRowCount + 1) + L"+1");
    for (const wchar_t* cell : {L"A1", L"A8000", L"A16384"})
        EXPECT_EQ(Show(sheet, cell), L"#CIRC!");
    sheet.setText(At(L"A8000"), L"0");
    EXPECT_EQ(Show(sheet, L"A8001"), L"16383");
}

TEST(Recalculation, CalculatesRunningTotals) {
    Sheet sheet;
    constexpr int kRows = 4000;
    for (int row = 0; row < kRows; ++row) {
        sheet.setText({0, row}, L"1");
        sheet.setText({1, row}, L"=SUM(A$1:A" + Number(row + 1) + L")");
    }
    double sum = 0;
    for (int row = 0; row < kRows; ++row) sum += sheet.view({1, row}).number;
    EXPECT_EQ(sum, kRows * (kRows + 1) / 2);
    sheet.setText({0, 0}, L"2");
    EXPECT_EQ(sheet.view({1, kRows - 1}).number, kRows + 1);
}

TEST(Recalculation, DoublesInTheSameColumnAsItsTotals) {
    // Each cell is the sum of all above: 1, 1, 2, 4, 8, ...
    Sheet sheet;
    sheet.setText({0, 0}, L"1");
    for (int row = 1; row < 1000; ++row)
        sheet.setText({0, row}, L"=SUM(A$1:A" + Number(row) + L")");
    EXPECT_EQ(Show(sheet, L"A11"), L"512");
    EXPECT_EQ(Show(sheet, L"A1000"), L"2.67877E+300");
    sheet.setText({0, 0}, L"0");
    EXPECT_EQ(Show(sheet, L"A1000"), L"0");
}

TEST(Recalculation, WalksOnlyOccupiedCellsOfWholeSheets) {
    Sheet sheet = SheetOf({{L"B2", L"1"}, {L"IV16383", L"2"}});
    for (int row = 0; row < 2000; ++row)
        sheet.setText({0, row}, L"=SUM($B$1:$IV$16384)+" + Number(row));
    EXPECT_EQ(Show(sheet, L"A2000"), L"2002");
    for (int i = 0; i < 20; ++i) {
        sheet.setText(At(L"C3"), Number(i));
        EXPECT_EQ(sheet.view({0, 1999}).number, 2002 + i);
    }
}

TEST(Recalculation, ChangesOneCellThatAllOthersRead) {
    Sheet sheet;
    for (int row = 1; row < kRowCount; ++row) sheet.setText({0, row}, L"=$A$1*2");
    for (int i = 0; i < 20; ++i) {
        sheet.setText({0, 0}, Number(i));
        for (int row = 1; row < kRowCount; ++row) ASSERT_EQ(sheet.view({0, row}).number, 2 * i);
    }
    for (int row = 1; row < kRowCount; ++row) sheet.setText({0, row}, L"");
    EXPECT_EQ(sheet.occupiedCells(), 1u);
}

}  // namespace
}  // namespace workbook
