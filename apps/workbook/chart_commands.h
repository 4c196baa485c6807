// What the Chart menu does, and how it looks.
#pragma once

#include <windows.h>

namespace workbook {

struct Workbook;

void RunChartCommand(Workbook& workbook, UINT command);

void PrepareChartMenu(const Workbook& workbook, HMENU menu);

}  // namespace workbook
