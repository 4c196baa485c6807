// The small dialogs: going to a cell, the list of keys, and what the program is.
#pragma once

namespace workbook {

struct Workbook;

void GoToWithDialog(Workbook& workbook);
void ShowKeys(const Workbook& workbook);
void ShowAbout(const Workbook& workbook);

}  // namespace workbook
