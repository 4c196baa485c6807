// Which of the open sheets is shown, and showing another one.
#pragma once

#include <cstddef>

namespace workbook {

struct Workbook;

// Stores what is being typed and notes how the sheet is shown. To be called before another sheet
// becomes the current one.
void LeaveSheet(Workbook& workbook);

// Shows the current sheet: as it was left, or, one that was never shown, from its beginning with
// sizes that fit.
void ShowSheet(Workbook& workbook);
void ShowSheetFirstTime(Workbook& workbook);

// Leaves the current sheet and shows another one.
void SelectSheet(Workbook& workbook, size_t index);

// The next or previous one, round the ends: step is 1 or -1.
void StepToSheet(Workbook& workbook, int step);

void AddNewSheet(Workbook& workbook);

}  // namespace workbook
