#include "survey.h"

#include "sheet_support.h"

#include <gtest/gtest.h>

namespace workbook {
namespace {

TEST(Survey, SumsUpTheNumbersOfABlock) {
    const Sheet sheet = SheetOf({{L"A1", L"1"},
                                 {L"A2", L"=A1+1"},
                                 {L"B1", L"text"},
                                 {L"B2", L"=1/0"},
                                 {L"C9", L"-9"},
                                 {L"A3", L"true"},
                                 {L"D1", L"1000"}});
    const BlockStatistics statistics = SurveyBlock(sheet, BlockAt(L"A1:C16384"));
    EXPECT_EQ(statistics.occupied, 6u);
    EXPECT_EQ(statistics.numbers, 3u);
    EXPECT_EQ(statistics.sum, -6);
    EXPECT_EQ(statistics.average, -2);
    EXPECT_EQ(statistics.lowest, -9);
    EXPECT_EQ(statistics.highest, 2);
}

TEST(Survey, IsAllZeroWithoutNumbers) {
    const Sheet sheet = SheetOf({{L"A1", L"text"}});
    const BlockStatistics statistics = SurveyBlock(sheet, BlockAt(L"A1:IV16384"));
    EXPECT_EQ(statistics.occupied, 1u);
    EXPECT_EQ(statistics.numbers, 0u);
    EXPECT_EQ(statistics.sum, 0);
    EXPECT_EQ(statistics.average, 0);
    EXPECT_EQ(SurveyBlock(sheet, {300, 0, 400, 5}).occupied, 0u);
}

TEST(Survey, TakesARowOfTextsOverNumbersForHeadings) {
    EXPECT_TRUE(FirstRowIsHeader(SheetOf({{L"A1", L"Year"}, {L"B1", L"Mean"}, {L"B2", L"5"}})));
    EXPECT_TRUE(FirstRowIsHeader(SheetOf({{L"B1", L"Mean"}, {L"A2", L"Rome"}, {L"B2", L"=1+1"}})));
}

TEST(Survey, TakesOtherRowsForNoHeadings) {
    EXPECT_FALSE(FirstRowIsHeader(Sheet()));
    EXPECT_FALSE(FirstRowIsHeader(SheetOf({{L"A2", L"5"}})));
    EXPECT_FALSE(FirstRowIsHeader(SheetOf({{L"A1", L"Year"}})));
    EXPECT_FALSE(FirstRowIsHeader(SheetOf({{L"A1", L"Year"}, {L"A2", L"text"}})));
    EXPECT_FALSE(FirstRowIsHeader(SheetOf({{L"A1", L"Year"}, {L"B1", L"1"}, {L"B2", L"5"}})));
    EXPECT_FALSE(FirstRowIsHeader(SheetOf({{L"A1", L"Year"}, {L"A3", L"5"}})));
}

}  // namespace
}  // namespace workbook
