#include "sheet.h"

#include "sheet_support.h"

#include <gtest/gtest.h>

#include <utility>

namespace workbook {
namespace {

ValueKind KindOf(std::wstring_view typed) { return ValueAt(SheetOf({{L"B4", typed}}), L"B4").kind; }

TEST(Sheet, TellsKindsByWhatWasTyped) {
    EXPECT_EQ(KindOf(L"12.5"), ValueKind::Number);
    EXPECT_EQ(KindOf(L"12%"), ValueKind::Number);
    EXPECT_EQ(KindOf(L"twelve"), ValueKind::Text);
    EXPECT_EQ(KindOf(L"1,5"), ValueKind::Text);
    EXPECT_EQ(KindOf(L" "), ValueKind::Text);
    EXPECT_EQ(KindOf(L"True"), ValueKind::Boolean);
    EXPECT_EQ(KindOf(L"FALSE"), ValueKind::Boolean);
    EXPECT_EQ(KindOf(L"TRUER"), ValueKind::Text);
    EXPECT_EQ(KindOf(L"=1/0"), ValueKind::Error);
    EXPECT_EQ(KindOf(L"=1=1"), ValueKind::Boolean);
    EXPECT_EQ(KindOf(L""), ValueKind::Empty);
}

TEST(Sheet, KeepsWhatWasTyped) {
    const Sheet sheet = SheetOf({{L"A1", L" 007 "}, {L"A2", L"=sum( A1 )"}, {L"A3", L"'5"}});
    EXPECT_EQ(sheet.text(At(L"A1")), L" 007 ");
    EXPECT_EQ(sheet.text(At(L"A2")), L"=sum( A1 )");
    EXPECT_EQ(sheet.text(At(L"A3")), L"'5");
    EXPECT_EQ(sheet.text(At(L"A4")), L"");
    EXPECT_EQ(Show(sheet, L"A1"), L"7");
    EXPECT_EQ(Show(sheet, L"A2"), L"7");
}

TEST(Sheet, ForcesTextAfterAnApostrophe) {
    const Sheet sheet =
        SheetOf({{L"A1", L"'12"}, {L"A2", L"'=A1"}, {L"A3", L"'"}, {L"A4", L"''x"}});
    EXPECT_EQ(ValueAt(sheet, L"A1").kind, ValueKind::Text);
    EXPECT_EQ(Show(sheet, L"A1"), L"12");
    EXPECT_EQ(Show(sheet, L"A2"), L"=A1");
    EXPECT_EQ(ValueAt(sheet, L"A3").kind, ValueKind::Text);
    EXPECT_EQ(Show(sheet, L"A3"), L"");
    EXPECT_EQ(Show(sheet, L"A4"), L"'x");
}

TEST(Sheet, TakesALoneEqualsSignForText) {
    const Sheet sheet = SheetOf({{L"A1", L"="}});
    EXPECT_FALSE(sheet.isFormula(At(L"A1")));
    EXPECT_EQ(Show(sheet, L"A1"), L"=");
}

TEST(Sheet, ShowsTruthValuesInCapitals) {
    const Sheet sheet = SheetOf({{L"A1", L"true"}, {L"A2", L"fAlSe"}});
    EXPECT_EQ(Show(sheet, L"A1"), L"TRUE");
    EXPECT_EQ(Show(sheet, L"A2"), L"FALSE");
}

TEST(Sheet, EmptiesACellByAnEmptyText) {
    Sheet sheet = SheetOf({{L"C3", L"1"}});
    EXPECT_FALSE(sheet.isEmpty(At(L"C3")));
    sheet.setText(At(L"C3"), L"");
    EXPECT_TRUE(sheet.isEmpty(At(L"C3")));
    EXPECT_EQ(sheet.extent(), (SheetExtent{0, 0}));
    EXPECT_EQ(sheet.occupiedCells(), 0u);
    sheet.setText(At(L"C3"), L"");
    EXPECT_EQ(sheet.occupiedCells(), 0u);
}

TEST(Sheet, MeasuresHowFarCellsReach) {
    Sheet sheet = SheetOf({{L"C3", L"1"}, {L"A200", L"x"}, {L"IV2", L"=1"}});
    EXPECT_EQ(sheet.extent(), (SheetExtent{256, 200}));
    EXPECT_EQ(sheet.occupiedCells(), 3u);
    sheet.setText(At(L"IV2"), L"");
    EXPECT_EQ(sheet.extent(), (SheetExtent{3, 200}));
    sheet.setText(At(L"A200"), L"");
    EXPECT_EQ(sheet.extent(), (SheetExtent{3, 3}));
    sheet.setText(At(L"C3"), L"2");
    EXPECT_EQ(sheet.occupiedCells(), 1u);
}

TEST(Sheet, RefusesCellsOutsideAndTextsTooLong) {
    Sheet sheet;
    for (const CellAddress cell : {CellAddress{256, 0}, {0, 16384}, {-1, 0}, {0, -1}}) {
        sheet.setText(cell, L"x");
        EXPECT_TRUE(sheet.isEmpty(cell));
        EXPECT_EQ(sheet.text(cell), L"");
    }
    sheet.setText(At(L"A1"), std::wstring(kLongestCellText + 1, L'x'));
    EXPECT_EQ(sheet.occupiedCells(), 0u);
    sheet.setText(At(L"A1"), std::wstring(kLongestCellText, L'x'));
    EXPECT_EQ(sheet.text(At(L"A1")).size(), kLongestCellText);
}

TEST(Sheet, ListsOccupiedCellsColumnByColumn) {
    const Sheet sheet = SheetOf({{L"B1", L"1"},
                                 {L"A64", L"1"},
                                 {L"A65", L"1"},
                                 {L"A2", L"1"},
                                 {L"C700", L"1"},
                                 {L"D1", L"1"}});
    const std::vector<CellAddress> expected{At(L"A2"), At(L"A64"), At(L"A65"), At(L"B1"),
                                            At(L"C700")};
    EXPECT_EQ(sheet.occupiedIn(BlockAt(L"A1:C700")), expected);
    EXPECT_EQ(sheet.occupiedIn(BlockAt(L"A3:C64")), std::vector<CellAddress>{At(L"A64")});
    EXPECT_EQ(sheet.occupiedIn(BlockAt(L"A65:A65")), std::vector<CellAddress>{At(L"A65")});
    EXPECT_TRUE(sheet.occupiedIn(BlockAt(L"A66:B16384")).empty());
    EXPECT_EQ(sheet.occupiedIn({-10, -10, 1000, 100000}).size(), 6u);
}

TEST(Sheet, StopsVisitingWhenToldTo) {
    const Sheet sheet = SheetOf({{L"A1", L"1"}, {L"A2", L"=A1+1"}, {L"A3", L"=A2+1"}});
    double sum = 0;
    sheet.visit(BlockAt(L"A1:A3"), [&sum](CellAddress, const ValueView& value) {
        sum += value.number;
        return value.number < 2;
    });
    EXPECT_EQ(sum, 3);
}

TEST(Sheet, KeepsItsCellsWhenMoved) {
    Sheet first = SheetOf({{L"A1", L"1"}, {L"A2", L"=A1+1"}});
    Sheet second = std::move(first);
    second.setText(At(L"A1"), L"5");
    EXPECT_EQ(Show(second, L"A2"), L"6");
}

TEST(Sheet, SaysWhyAFormulaCannotBeRead) {
    const Sheet sheet = SheetOf({{L"A1", L"=(1"}, {L"A2", L"=1"}, {L"A3", L"("}});
    EXPECT_EQ(sheet.formulaProblem(At(L"A1")), L"A closing parenthesis is missing.");
    EXPECT_EQ(sheet.formulaProblem(At(L"A2")), L"");
    EXPECT_EQ(sheet.formulaProblem(At(L"A3")), L"");
    EXPECT_EQ(sheet.formulaProblem(At(L"A4")), L"");
}

}  // namespace
}  // namespace workbook
