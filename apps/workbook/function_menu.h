// The menu of functions behind the "fx" button, and what choosing one does.
#pragma once

#include <windows.h>

namespace workbook {

struct Workbook;

// Pops up below "fx". The choice arrives as WM_COMMAND IDM_FUNCTION_FIRST + its place in the list.
void ShowFunctionMenu(Workbook& workbook);

// Begins a formula with the function in the equation bar, or adds it to the current cell's formula.
// With a block selected the formula is about that block and goes into the first free cell below.
void InsertFunction(Workbook& workbook, UINT command);

}  // namespace workbook
