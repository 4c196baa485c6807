// The menu: which function each command runs, and how its entries look before they are shown.
#pragma once

#include <windows.h>

namespace workbook {

struct Workbook;

void RunCommand(Workbook& workbook, UINT command);

// Check marks, greyed entries, and what Undo would undo.
void PrepareMenu(const Workbook& workbook, HMENU menu);

}  // namespace workbook
