// The host's side of the footprint: windows of a handheld's size with the library's controls in
// them.
#pragma once

#include <windows.h>

#include <vector>

namespace footprint {

constexpr int kWidth = 240;
constexpr int kHeight = 320;
constexpr int kInputPanelHeight = 80;

// A top-level window with the controls of one run; it answers the grid's requests for cells with a
// short text for each.
void OpenHost();
void CloseHost();
HWND Host();

// Delivers what has been posted and paints what is invalid, as the host's loop would, except that
// no timer runs: what is measured does not depend on the time of day.
void Settle();

HWND CreateGrid();  // at A1, 100 %, with cells of 60 x 16 pixels
HWND ColumnStrip(HWND grid);
HWND RowStrip(HWND grid);
HWND CreateStrip();  // one without a grid, of four items
HWND CreateChart(int type);
HWND CreateToolTip();
HWND CreateFunctionBar();  // with six items
HWND CreateListView();     // with two columns

// Numbers between -20 and 80 without order, the same each time.
std::vector<double> Noise(int count);
void AddSeries(HWND chart, int points);

// A press and its release at a position in client coordinates.
void Press(HWND window, int x, int y);
void Release(HWND window, int x, int y);

}  // namespace footprint
