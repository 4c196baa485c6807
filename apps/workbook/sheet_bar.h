// The bar above the sheet that shows which one is open and offers the others in a menu.
#pragma once

#include <windows.h>

#include <cstddef>

#include <korcontrols/funkybar.h>

namespace workbook {

struct Workbook;

//   result  whether the bar exists
bool CreateSheetBar(Workbook& workbook);

// Before the window goes: frees the images.
void DestroySheetBar(Workbook& workbook);

// A sheet was chosen in the bar.
void OnSheetChosen(Workbook& workbook, const FunkyBarNotification& chosen);

// A sheet is about to be closed.
void RemoveFromSheetBar(const Workbook& workbook, size_t index);

// Shows in the bar the sheets that are open, their names and marks, and which one is shown. To be
// called when no message waits.
void RefreshSheetBar(const Workbook& workbook);

}  // namespace workbook
