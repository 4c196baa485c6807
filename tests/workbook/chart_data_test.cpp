#include "chart_data.h"

#include "sheet_support.h"

#include <gtest/gtest.h>

namespace workbook {
namespace {

using Names = std::vector<std::wstring>;
using Numbers = std::vector<double>;

ChartData DataOf(CellList cells, std::wstring_view block) {
    return ReadChartData(SheetOf(cells), BlockAt(block));
}

TEST(ChartData, TakesNamesFromTheFirstRowAndCategoriesFromTheFirstColumn) {
    const ChartData data = DataOf({{L"A1", L"Town"},
                                   {L"B1", L"Rain"},
                                   {L"C1", L"Sun"},
                                   {L"A2", L"Rome"},
                                   {L"B2", L"1"},
                                   {L"C2", L"=B2+1"},
                                   {L"A3", L"Oslo"},
                                   {L"B3", L"3"},
                                   {L"C3", L"4"}},
                                  L"A1:C3");
    EXPECT_EQ(data.categoryTitle, L"Town");
    EXPECT_EQ(data.categories, (Names{L"Rome", L"Oslo"}));
    ASSERT_EQ(data.series.size(), 2u);
    EXPECT_EQ(data.series[0].name, L"Rain");
    EXPECT_EQ(data.series[0].values, (Numbers{1, 3}));
    EXPECT_EQ(data.series[1].name, L"Sun");
    EXPECT_EQ(data.series[1].values, (Numbers{2, 4}));
}

TEST(ChartData, CountsAnythingButNumbersAsZero) {
    const ChartData data =
        DataOf({{L"B2", L"1"}, {L"B3", L"text"}, {L"B4", L"true"}, {L"B5", L"=1/0"}, {L"B7", L"7"}},
               L"B2:B7");
    ASSERT_EQ(data.series.size(), 1u);
    EXPECT_EQ(data.series[0].name, L"B");
    EXPECT_EQ(data.series[0].values, (Numbers{1, 0, 0, 0, 0, 7}));
    EXPECT_TRUE(data.categories.empty());
}

TEST(ChartData, TakesCountingNumbersForCategoriesWhenThereIsMore) {
    const CellList cells = {{L"A1", L"1999"}, {L"A2", L"2000"}, {L"B1", L"5"}, {L"B2", L"6"}};
    const ChartData both = DataOf(cells, L"A1:B2");
    EXPECT_EQ(both.categories, (Names{L"1999", L"2000"}));
    ASSERT_EQ(both.series.size(), 1u);
    EXPECT_EQ(both.series[0].values, (Numbers{5, 6}));

    const ChartData alone = DataOf(cells, L"A1:A2");
    EXPECT_TRUE(alone.categories.empty());
    ASSERT_EQ(alone.series.size(), 1u);
    EXPECT_EQ(alone.series[0].values, (Numbers{1999, 2000}));
}

TEST(ChartData, LeavesColumnsWithoutNumbersOut) {
    const ChartData data = DataOf({{L"A1", L"one"}, {L"B1", L"note"}, {L"D1", L"3"}}, L"A1:D1");
    EXPECT_EQ(data.categories, (Names{L"one"}));
    ASSERT_EQ(data.series.size(), 1u);
    EXPECT_EQ(data.series[0].name, L"D");
}

TEST(ChartData, IsEmptyWithoutNumbers) {
    EXPECT_TRUE(ReadChartData(Sheet(), BlockAt(L"A1:C3")).series.empty());
    EXPECT_EQ(ValuesOf(ReadChartData(Sheet(), BlockAt(L"A1"))), ValueRange());
}

TEST(ChartData, MeansTheWholeSheetByASingleCell) {
    const Sheet sheet = SheetOf({{L"B2", L"1"}, {L"D9", L"2"}});
    EXPECT_EQ(ChartedBlock(sheet, BlockAt(L"C3")), BlockAt(L"A1:D9"));
    EXPECT_EQ(ChartedBlock(sheet, BlockAt(L"B1:B16384")), BlockAt(L"B1:B9"));
    EXPECT_EQ(ChartedBlock(sheet, BlockAt(L"F20:H30")), BlockAt(L"F20"));
    EXPECT_EQ(ChartedBlock(Sheet(), BlockAt(L"C3")), BlockAt(L"A1"));
}

TEST(ChartData, TellsShapeFromValues) {
    const ChartData one = DataOf({{L"A1", L"Sun"}, {L"A2", L"1"}, {L"A3", L"-2"}}, L"A1:A3");
    const ChartData other = DataOf({{L"A1", L"Sun"}, {L"A2", L"5"}, {L"A3", L"6"}}, L"A1:A3");
    const ChartData renamed = DataOf({{L"A1", L"Fog"}, {L"A2", L"1"}, {L"A3", L"-2"}}, L"A1:A3");
    EXPECT_TRUE(HaveSameShape(one, other));
    EXPECT_FALSE(HaveSameShape(one, renamed));
    EXPECT_EQ(ValuesOf(one), (ValueRange{-2, 1}));
}

}  // namespace
}  // namespace workbook
