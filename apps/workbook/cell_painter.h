// Draws the cells that the grid asks for, inside GRIDN_PAINTCELLS.
#pragma once

#include <windows.h>

#include <korcontrols/grid.h>

namespace workbook {

struct Workbook;

void PaintCells(const Workbook& workbook, const GridVisibleRange& range);

}  // namespace workbook
