// Brings data of the sheet into the chart.
#pragma once

#include <windows.h>

#include "chart.h"
#include "model/address.h"

namespace workbook {

struct Workbook;

// Charts a block, with titles of the sheet and automatic ranges.
void ChartBlockOf(Workbook& workbook, const Block& selection);

// Charts what was chosen of the current sheet, at first all of it. Does nothing while the chart is
// hidden.
void ShowChartOfSheet(Workbook& workbook);

// After edits: changes values in place where it can, or hands over everything anew. To be called
// when no message waits.
void RefreshChart(Workbook& workbook);

// Hands over titles and range, and as many of the categories as have room with the chart's size,
// type and zoom.
void ApplyCategories(const Workbook& workbook);
void ApplyTitles(const Workbook& workbook);
void ApplyRange(const Workbook& workbook);

// As the chart shows them now.
ChartTitles ShownTitles(const Workbook& workbook);
ValueRange ShownRange(const Workbook& workbook, LONG axis);

// Draws the chart and lets the screen show it: the chart only draws its image.
void DrawChart(const Workbook& workbook);

// Which axis has the values: in a bar chart x, otherwise y. The other one has the categories.
LONG ValueAxis(const Workbook& workbook);
LONG OtherAxis(LONG axis);

}  // namespace workbook
