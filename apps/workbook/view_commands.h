// Zoom, scrolling, and what parts of the grid are shown.
#pragma once

#include <windows.h>

namespace workbook {

struct Workbook;

// How the sheet's used part lies in the scroll bars, with room to go on. To be called whenever it
// changes, and when the number of visible cells does: sizes, zoom.
void UpdateScrollRanges(const Workbook& workbook);

void SetZoom(Workbook& workbook, DWORD quarters);

void ToggleHeaders(Workbook& workbook);
void ToggleLines(Workbook& workbook);
void ToggleHorizontalBar(Workbook& workbook);
void ToggleVerticalBar(Workbook& workbook);
void ToggleTitleRow(Workbook& workbook);
void FitSizesAndRedraw(Workbook& workbook);

// The mouse wheel: rows; columns with Shift; zoom with Ctrl.
void OnMouseWheel(Workbook& workbook, WORD keys, int distance);

}  // namespace workbook
