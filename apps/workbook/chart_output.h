// The chart's property sheet, and taking its picture elsewhere: clipboard, printer.
#pragma once

namespace workbook {

struct Workbook;

// Runs the chart's own property sheet, and learns from the chart what was changed there.
void EditChartProperties(Workbook& workbook);

void CopyChart(Workbook& workbook);

// Whether there is a chart to see, and a way to print it.
bool CanPrintChart(const Workbook& workbook);
void PrintChart(Workbook& workbook);

}  // namespace workbook
