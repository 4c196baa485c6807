// Column widths and row heights that suit the contents.
#pragma once

namespace workbook {

struct Workbook;

// Makes columns wide enough for their contents and rows high enough for texts of several lines,
// within limits and judging by the sheet's beginning. Nothing becomes smaller than the grid's own
// default. Repaints nothing.
void FitSizes(Workbook& workbook);

// Gives a grid that was reset the sizes of the current sheet. Repaints nothing.
void ApplySizes(const Workbook& workbook);

}  // namespace workbook
