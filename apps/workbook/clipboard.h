// Cells to the clipboard and back, as lines of text with tabs: what other spreadsheets understand.
#pragma once

namespace workbook {

struct Workbook;

void CopySelection(Workbook& workbook);
void CutSelection(Workbook& workbook);

// Fills cells from the current one on to the right and down.
void PasteAtCurrentCell(Workbook& workbook);

bool CanPaste();

}  // namespace workbook
