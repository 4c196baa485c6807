// The side panel's list: a row of statistics for each column of the current sheet.
#pragma once

#include <windows.h>

namespace workbook {

struct SidePanel;
struct Workbook;

HWND CreateStatisticsList(const Workbook& workbook);

// Brings the rows up to date: in place while they are about the same columns, otherwise anew.
void RefreshStatisticsList(Workbook& workbook);

// Empties the list, which frees its rows' data.
void ClearStatisticsList(SidePanel& panel);

void OnListNotify(Workbook& workbook, const NMHDR& notification);

}  // namespace workbook
