#include "column_statistics.h"

#include "sheet_support.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cmath>
#include <random>

namespace workbook {
namespace {

TEST(ColumnStatistics, LeavesOutTheTitleRow) {
    const Sheet sheet = SheetOf({{L"B1", L"Rain"}, {L"B2", L"4"}, {L"B3", L"8"}, {L"C2", L"99"}});
    const ColumnStatistics statistics = StatisticsOfColumn(sheet, 1, true);
    EXPECT_EQ(statistics.name, L"Rain");
    EXPECT_EQ(statistics.cells.occupied, 2u);
    EXPECT_EQ(statistics.cells.numbers, 2u);
    EXPECT_EQ(statistics.cells.sum, 12);
    EXPECT_EQ(statistics.cells.average, 6);
    EXPECT_EQ(statistics.cells.lowest, 4);
    EXPECT_EQ(statistics.cells.highest, 8);
    EXPECT_EQ(statistics.median, 6);
    EXPECT_DOUBLE_EQ(statistics.deviation, std::sqrt(8.0));
}

TEST(ColumnStatistics, CountsTheFirstRowWithoutTitles) {
    const Sheet sheet = SheetOf({{L"A1", L"5"}, {L"A2", L"text"}, {L"A9", L"=A1*2"}});
    const ColumnStatistics statistics = StatisticsOfColumn(sheet, 0, false);
    EXPECT_EQ(statistics.name, L"");
    EXPECT_EQ(statistics.cells.occupied, 3u);
    EXPECT_EQ(statistics.cells.numbers, 2u);
    EXPECT_EQ(statistics.cells.highest, 10);
}

TEST(ColumnStatistics, TakesTheMiddleNumberForTheMedian) {
    const Sheet odd = SheetOf({{L"A1", L"100"}, {L"A2", L"1"}, {L"A3", L"2"}});
    EXPECT_EQ(StatisticsOfColumn(odd, 0, false).median, 2);
    const Sheet even = SheetOf({{L"A1", L"100"}, {L"A2", L"1"}, {L"A3", L"2"}, {L"A4", L"5"}});
    EXPECT_EQ(StatisticsOfColumn(even, 0, false).median, 3.5);
}

TEST(ColumnStatistics, IsAllZeroWithoutNumbersAndHasNoDeviationOfOne) {
    const ColumnStatistics none = StatisticsOfColumn(SheetOf({{L"A1", L"text"}}), 0, false);
    EXPECT_EQ(none.cells.numbers, 0u);
    EXPECT_EQ(none.median, 0);
    EXPECT_EQ(none.deviation, 0);
    const ColumnStatistics one = StatisticsOfColumn(SheetOf({{L"A1", L"7"}}), 0, false);
    EXPECT_EQ(one.median, 7);
    EXPECT_EQ(one.deviation, 0);
}

// Sorting, and one pass over sums of squares, in place of what the engine does.
TEST(ColumnStatistics, AgreesWithSortingTheNumbers) {
    std::mt19937 random(7);
    for (int round = 0; round < 50; ++round) {
        const int count = std::uniform_int_distribution<int>(2, 60)(random);
        std::vector<double> numbers;
        Sheet sheet;
        for (int row = 0; row < count; ++row) {
            const int number = std::uniform_int_distribution<int>(-50, 50)(random);
            numbers.push_back(number);
            sheet.setText({3, row * 5}, std::to_wstring(number));
        }
        std::ranges::sort(numbers);
        double sum = 0, squares = 0;
        for (const double number : numbers) sum += number, squares += number * number;
        const auto middle = numbers.size() / 2;
        const double median =
            count % 2 ? numbers[middle] : (numbers[middle - 1] + numbers[middle]) / 2;

        const ColumnStatistics statistics = StatisticsOfColumn(sheet, 3, false);
        EXPECT_EQ(statistics.cells.sum, sum);
        EXPECT_EQ(statistics.cells.lowest, numbers.front());
        EXPECT_EQ(statistics.cells.highest, numbers.back());
        EXPECT_EQ(statistics.median, median);
        EXPECT_NEAR(statistics.deviation, std::sqrt((squares - sum * sum / count) / (count - 1)),
                    1e-9);
    }
}

}  // namespace
}  // namespace workbook
