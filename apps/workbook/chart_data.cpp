#include "chart_data.h"

#include <algorithm>
#include <cmath>
#include <cstddef>

namespace workbook {

namespace {

constexpr int kNone = -1;

// What stands in one column below the headings.
struct ColumnContents {
    int numbers = 0;
    int texts = 0;
    double last = 0;
    bool countsUp = true;  // whole numbers, each one more than the one before
};

// A block taken apart.
struct ChartBlock {
    Block body;
    bool hasHeadings = false;
    std::vector<ColumnContents> columns;
    int categories = kNone;  // a column, counted from the block's left

    size_t place(int column) const { return static_cast<size_t>(column - body.left); }
    int rows() const { return body.bottom - body.top + 1; }
};

bool HasHeadings(const Sheet& sheet, const Block& block) {
    if (block.top == block.bottom) return false;
    bool hasText = false;
    bool hasNumber = false;
    sheet.visit({block.left, block.top, block.right, block.top},
                [&](CellAddress, const ValueView& value) {
                    hasText = hasText || value.kind == ValueKind::Text;
                    hasNumber = value.kind == ValueKind::Number;
                    return !hasNumber;
                });
    return hasText && !hasNumber;
}

void AddNumber(ColumnContents& column, double number) {
    const bool follows = column.numbers == 0 || number == column.last + 1;
    column.countsUp = column.countsUp && follows && number == std::floor(number);
    column.last = number;
    ++column.numbers;
}

std::vector<ColumnContents> Survey(const Sheet& sheet, const Block& body) {
    std::vector<ColumnContents> columns(static_cast<size_t>(body.right - body.left + 1));
    sheet.visit(body, [&](CellAddress cell, const ValueView& value) {
        ColumnContents& column = columns[static_cast<size_t>(cell.column - body.left)];
        if (value.kind == ValueKind::Number) AddNumber(column, value.number);
        if (value.kind == ValueKind::Text) ++column.texts;
        return true;
    });
    return columns;
}

bool IsAllTexts(const ColumnContents& column) { return column.texts > 0 && column.numbers == 0; }
bool HasNumbers(const ColumnContents& column) { return column.numbers > 0; }

int CategoryColumn(const std::vector<ColumnContents>& columns, int rows) {
    const auto texts = std::ranges::find_if(columns, IsAllTexts);
    if (texts != columns.end()) return static_cast<int>(texts - columns.begin());
    const ColumnContents& first = columns.front();
    const bool isCounted = rows > 1 && first.numbers == rows && first.countsUp;
    return isCounted && std::any_of(columns.begin() + 1, columns.end(), HasNumbers) ? 0 : kNone;
}

ChartBlock TakeApart(const Sheet& sheet, const Block& block) {
    ChartBlock parts;
    parts.body = block;
    parts.hasHeadings = HasHeadings(sheet, block);
    if (parts.hasHeadings) ++parts.body.top;
    parts.columns = Survey(sheet, parts.body);
    parts.categories = CategoryColumn(parts.columns, parts.rows());
    return parts;
}

std::wstring Heading(const Sheet& sheet, const ChartBlock& parts, int column) {
    return parts.hasHeadings ? sheet.display({column, parts.body.top - 1}) : std::wstring();
}

ChartSeries ReadSeries(const Sheet& sheet, const ChartBlock& parts, int column) {
    ChartSeries series;
    series.column = column;
    series.name = Heading(sheet, parts, column);
    if (series.name.empty()) series.name = ColumnName(column);
    series.values.resize(static_cast<size_t>(parts.rows()));
    sheet.visit({column, parts.body.top, column, parts.body.bottom}, [&](CellAddress cell,
                                                                         const ValueView& value) {
        if (value.kind == ValueKind::Number) {
            series.values[static_cast<size_t>(cell.row - parts.body.top)] = value.number;
        }
        return true;
    });
    return series;
}

void ReadCategories(const Sheet& sheet, const ChartBlock& parts, ChartData& data) {
    const int column = parts.body.left + parts.categories;
    data.categoryTitle = Heading(sheet, parts, column);
    data.categories.reserve(static_cast<size_t>(parts.rows()));
    for (int row = parts.body.top; row <= parts.body.bottom; ++row) {
        data.categories.push_back(sheet.display({column, row}));
    }
}

}  // namespace

Block ChartedBlock(const Sheet& sheet, const Block& selection) {
    const SheetExtent extent = sheet.extent();
    const Block used = {0, 0, std::max(0, extent.columns - 1), std::max(0, extent.rows - 1)};
    if (selection == BlockOf({selection.left, selection.top})) return used;
    return {selection.left, selection.top,
            std::max(selection.left, std::min(selection.right, used.right)),
            std::max(selection.top, std::min(selection.bottom, used.bottom))};
}

ChartData ReadChartData(const Sheet& sheet, const Block& block) {
    const ChartBlock parts = TakeApart(sheet, block);
    ChartData data;
    if (parts.categories != kNone) ReadCategories(sheet, parts, data);
    for (int column = block.left; column <= block.right; ++column) {
        if (column - block.left == parts.categories) continue;
        if (!HasNumbers(parts.columns[parts.place(column)])) continue;
        data.series.push_back(ReadSeries(sheet, parts, column));
    }
    return data;
}

bool HaveSameShape(const ChartData& one, const ChartData& other) {
    const auto isAlike = [](const ChartSeries& left, const ChartSeries& right) {
        return left.name == right.name && left.values.size() == right.values.size();
    };
    return one.categoryTitle == other.categoryTitle && one.categories == other.categories &&
           std::ranges::equal(one.series, other.series, isAlike);
}

ValueRange ValuesOf(const ChartData& data) {
    if (data.series.empty()) return {};
    ValueRange range = {data.series.front().values.front(), data.series.front().values.front()};
    for (const ChartSeries& series : data.series) {
        const auto [low, high] = std::ranges::minmax(series.values);
        range = {std::min(range.low, low), std::max(range.high, high)};
    }
    return range;
}

}  // namespace workbook
