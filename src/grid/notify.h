// The grid's notifications to its parent: one function per message, the only place that packs
// GRIDN_ codes. All but the last are sent, and the parent may call back into the library before
// they return.
#pragma once

#include "grid/block.h"

namespace kor {

void NotifyPaintCells();  // the visible range
void NotifyCellClicked(Cell cell);
void NotifyCurrentCell();  // the selection's top left cell
void NotifySelecting();
void NotifySelectionDone();
void NotifyColumnResized(int column, int units);
void NotifyRowResized(int row, int units);
void NotifyEditFocus();
void NotifyEditKillFocus();
void NotifyEquationEntered(const wchar_t* text);  // for the current cell
void NotifyEquationEmpty();
void NotifyDeleteKey();

// The only one that is posted: the command of the "fx" button.
void PostFunctionCommand();

}  // namespace kor
