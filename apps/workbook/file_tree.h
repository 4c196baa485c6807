// The side panel's tree: the open sheets, and below each its columns.
#pragma once

#include <windows.h>

namespace workbook {

struct Workbook;

HWND CreateFileTree(const Workbook& workbook);

// Lists the sheets anew when they have changed. What was unfolded stays so.
void RefreshFileTree(Workbook& workbook);

void OnTreeNotify(Workbook& workbook, const NMHDR& notification);

}  // namespace workbook
