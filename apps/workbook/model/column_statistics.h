// What is to be told about one column of a sheet.
#ifndef WORKBOOK_MODEL_COLUMN_STATISTICS_H
#define WORKBOOK_MODEL_COLUMN_STATISTICS_H

#include "survey.h"

#include <string>

namespace workbook {

struct ColumnStatistics {
    std::wstring name;  // the heading of a title row, otherwise empty
    BlockStatistics cells;
    double median = 0;     // 0 without numbers
    double deviation = 0;  // of a sample, with count - 1; 0 with fewer than two numbers

    friend bool operator==(const ColumnStatistics&, const ColumnStatistics&) = default;
};

// With a title row the first row is the heading and not counted.
ColumnStatistics StatisticsOfColumn(const Sheet& sheet, int column, bool hasTitleRow);

}  // namespace workbook

#endif
