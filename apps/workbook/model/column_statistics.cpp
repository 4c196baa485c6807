#include "column_statistics.h"

#include <algorithm>
#include <cmath>
#include <numeric>
#include <vector>

namespace workbook {

namespace {

std::vector<double> NumbersIn(const Sheet& sheet, const Block& block) {
    std::vector<double> numbers;
    sheet.visit(block, [&numbers](CellAddress, const ValueView& value) {
        if (value.kind == ValueKind::Number) numbers.push_back(value.number);
        return true;
    });
    return numbers;
}

// The middle one, or the mean of the two in the middle. Changes the numbers' order.
double MedianOf(std::vector<double>& numbers) {
    if (numbers.empty()) return 0;
    const auto middle = numbers.begin() + static_cast<std::ptrdiff_t>(numbers.size() / 2);
    std::ranges::nth_element(numbers, middle);
    if (numbers.size() % 2 == 1) return *middle;
    return std::midpoint(*std::max_element(numbers.begin(), middle), *middle);
}

double DeviationOf(const std::vector<double>& numbers, double mean) {
    if (numbers.size() < 2) return 0;
    double squares = 0;
    for (const double number : numbers) squares += (number - mean) * (number - mean);
    return std::sqrt(squares / static_cast<double>(numbers.size() - 1));
}

}  // namespace

ColumnStatistics StatisticsOfColumn(const Sheet& sheet, int column, bool hasTitleRow) {
    const Block block = {column, hasTitleRow ? 1 : 0, column, kRowCount - 1};
    ColumnStatistics statistics;
    if (hasTitleRow) statistics.name = sheet.display({column, 0});
    statistics.cells = SurveyBlock(sheet, block);
    std::vector<double> numbers = NumbersIn(sheet, block);
    statistics.deviation = DeviationOf(numbers, statistics.cells.average);
    statistics.median = MedianOf(numbers);
    return statistics;
}

}  // namespace workbook
