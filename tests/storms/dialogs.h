// Dialogs of the chart that wait for somebody: the sheet of its properties, and the choice of a
// printer.
#pragma once

#include "storms/stage.h"

namespace kortest {

// A printer without a dialog: whoever asks gets a small bitmap's DC, or none. Traps at WM_ENTERIDLE
// in a host are sprung while the dialog would be open, and inside each step of the job.
void ReplacePrinter(Stage& stage);
void PrintChart(Stage& stage, HWND chart, bool isChosen);

// Opens the real sheet, types into its fields, and presses OK or Cancel.
void UseProperties(Stage& stage, HWND chart, const wchar_t* typed, bool isAccepted);

// How often that came to something.
int PagesPrinted();
int SheetsUsed();

}  // namespace kortest
