// The status bar: the selection and its figures, whether text is being typed, and the zoom.
#pragma once

#include <windows.h>

namespace workbook {

struct Workbook;

HWND CreateStatusBar(HWND parent, HINSTANCE instance);

// Places the bar along the window's bottom edge and divides it.
//   result  its height in pixels
int LayoutStatusBar(const Workbook& workbook);

// Brings all parts up to date. Adding up a large block takes its time, so a drag only marks the
// line as stale and this runs when no more messages are waiting.
void UpdateStatusBar(Workbook& workbook);

}  // namespace workbook
