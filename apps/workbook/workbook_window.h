// The main window: it holds the grid and the status bar and passes messages to whoever answers
// them.
#pragma once

#include <windows.h>

#include <string>
#include <vector>

namespace workbook {

struct Workbook;

// Creates and shows the window and opens the files, each as a sheet. `workbook` must outlive the
// window.
//   result  whether the window exists
bool CreateWorkbookWindow(Workbook& workbook, const std::vector<std::wstring>& files, int show);

// "*sunspots.csv - Workbook"; the star means unsaved changes.
void ShowTitle(Workbook& workbook);

// Gives bars, panes and the grid their places.
void LayOutWindow(const Workbook& workbook);

// To be called when no message is waiting.
void OnIdle(Workbook& workbook) noexcept;

}  // namespace workbook
