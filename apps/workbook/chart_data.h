// What a block of the sheet is as a chart: series, categories and their names. No windows.
#pragma once

#include <string>
#include <vector>

#include "model/sheet.h"

namespace workbook {

struct ChartSeries {
    std::wstring name;
    std::vector<double> values;  // as many in every series
    int column = 0;              // of the sheet
};

struct ChartData {
    std::wstring categoryTitle;            // heading of the column of categories; may be empty
    std::vector<std::wstring> categories;  // empty, or one for each value of a series
    std::vector<ChartSeries> series;       // empty when the block holds no numbers
};

struct ValueRange {
    double low = 0;
    double high = 0;

    friend bool operator==(const ValueRange&, const ValueRange&) = default;
};

struct ChartTitles {
    std::wstring chart;
    std::wstring categories;
    std::wstring values;

    friend bool operator==(const ChartTitles&, const ChartTitles&) = default;
};

// The block that a selection means: its part with anything in it, for a single cell all of the
// sheet.
Block ChartedBlock(const Sheet& sheet, const Block& selection);

// A first row with texts and no numbers names the series. The first column with texts and no
// numbers names the categories; without one a first column of whole numbers that count up by one,
// such as years, does. Every other column with numbers is a series, in which empty cells, texts,
// truth values and errors count as 0.
ChartData ReadChartData(const Sheet& sheet, const Block& block);

// Whether the two differ in nothing but values.
bool HaveSameShape(const ChartData& one, const ChartData& other);

// The least and the largest value of all series; zeros without any.
ValueRange ValuesOf(const ChartData& data);

}  // namespace workbook
