// The chart's tool bar: showing the chart, its properties, its legend, and combo boxes for zoom and
// type. The library fills it; what is chosen in it runs the Chart menu's commands.
#pragma once

#include <windows.h>

namespace workbook {

struct Workbook;

// Creates the bar.
//   result  whether it exists with its combo boxes
bool CreateChartBar(Workbook& workbook);

int ChartBarHeight(const Workbook& workbook);

// Whether WM_COMMAND came from one of the combo boxes; what was chosen there is done then.
bool OnChartBarCommand(Workbook& workbook, UINT id, UINT code);

// Shows in the bar what the chart is like, whoever changed it. To be called when no message waits.
void RefreshChartBar(const Workbook& workbook);

}  // namespace workbook
