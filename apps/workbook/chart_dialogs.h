// The dialogs of the chart menu.
#pragma once

namespace workbook {

struct Workbook;

// Asks for the titles of the chart and its axes.
void EditChartTitles(Workbook& workbook);

// Asks for the least and the largest value that the chart shows.
void EditChartRange(Workbook& workbook);

}  // namespace workbook
