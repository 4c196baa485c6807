// Edits of the sheet, and taking them back.
#pragma once

#include <string>
#include <vector>

#include "model/document.h"

namespace workbook {

struct Workbook;

// Stores what was committed in the equation bar. Redraws nothing: the grid does that.
void StoreText(Workbook& workbook, CellAddress cell, std::wstring text);

// Stores several cells as one step; `what` completes "Undo ...". Redraws.
void StoreCells(Workbook& workbook, std::vector<CellText> cells, std::wstring what);

void ClearSelection(Workbook& workbook);
void Undo(Workbook& workbook);
void Redo(Workbook& workbook);

void SelectAllCells(Workbook& workbook);
void GoToFirstCell(Workbook& workbook);
void GoToLastCell(Workbook& workbook);

}  // namespace workbook
