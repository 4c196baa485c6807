#include "survey.h"

#include "accumulator.h"

namespace workbook {

namespace {

constexpr Block WholeRow(int row) { return {0, row, kColumnCount - 1, row}; }

}  // namespace

BlockStatistics SurveyBlock(const Sheet& sheet, const Block& block) {
    BlockStatistics statistics;
    Accumulator numbers;
    sheet.visit(block, [&](CellAddress, const ValueView& value) {
        ++statistics.occupied;
        if (value.kind == ValueKind::Number) numbers.add(value.number);
        return true;
    });
    statistics.numbers = numbers.count();
    statistics.sum = numbers.sum();
    statistics.average = numbers.average();
    statistics.lowest = numbers.lowest();
    statistics.highest = numbers.highest();
    return statistics;
}

bool FirstRowIsHeader(const Sheet& sheet) {
    bool hasHeading = false;
    bool hasOther = false;
    sheet.visit(WholeRow(0), [&](CellAddress, const ValueView& value) {
        (value.kind == ValueKind::Text ? hasHeading : hasOther) = true;
        return !hasOther;
    });
    if (!hasHeading || hasOther) return false;

    bool hasNumber = false;
    sheet.visit(WholeRow(1), [&](CellAddress, const ValueView& value) {
        hasNumber = value.kind == ValueKind::Number;
        return !hasNumber;
    });
    return hasNumber;
}

}  // namespace workbook
