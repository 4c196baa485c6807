// Which cells are selected, and selecting others so that they are seen.
#pragma once

#include "model/address.h"

namespace workbook {

struct Workbook;

// The selected block; its first cell, at the top left, is the current one.
Block SelectedBlock();
CellAddress CurrentCell();

// The cell at the view's top left.
CellAddress FirstVisibleCell();

// Selects a block, scrolls to its first cell and shows that cell in the equation bar.
void GoTo(Workbook& workbook, const Block& block);

// Selects a whole column and brings it into view; the rows in view stay.
void GoToColumn(Workbook& workbook, int column);

// Selects without scrolling.
void Select(Workbook& workbook, const Block& block);

// Scrolls until the cell is wholly in view, or as far as its size allows.
void MakeVisible(Workbook& workbook, CellAddress cell);

// Keys can leave the grid with a block that is turned round or leaves the sheet (Page Down at the
// end, Shift+arrow after a selection was extended and left). Replaces it by a single cell.
void RepairSelection();

// The selection with Shift. The grid forgets where a selection began when the button is released,
// so a click with Shift would select just the clicked cell: these extend from the cell that was
// chosen last.
void OnPressed(Workbook& workbook, CellAddress cell, bool withShift);
void OnReleased(Workbook& workbook, bool withShift);

}  // namespace workbook
