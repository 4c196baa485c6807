// Answers the grid's notifications.
#pragma once

#include <windows.h>

namespace workbook {

struct Workbook;

// Whether a window is one of the grid's two header strips.
bool IsGridHeader(const Workbook& workbook, HWND window);

// WM_NOTIFY with one of the grid's codes. lParam is the data itself, as each code defines it.
//   result  whether the code was the grid's
bool OnGridNotify(Workbook& workbook, UINT code, LPARAM lParam);

// GRIDN_EQUATIONENTERED and GRIDN_EQUATIONEMPTY. The grid redraws all cells afterwards.
void OnEquationEntered(Workbook& workbook, const wchar_t* text, LPARAM cell);
void OnEquationEmptied(Workbook& workbook, LPARAM cell);

// Delete was pressed in the grid.
void OnDeleteKey(Workbook& workbook);

// What the grid did without telling: its headers and its corner button select silently. Runs when
// no message is waiting.
void CatchUpWithGrid(Workbook& workbook);

}  // namespace workbook
