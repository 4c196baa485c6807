// Sizes of the grid's own columns and rows: lookup, storage and changes.
#pragma once

#include "grid/geometry.h"

namespace kor {

constexpr int kDefaultColumnWidth = 60;  // units
constexpr int kDefaultRowHeight = 16;

// The two axes with their current sizes; valid until the next size is stored or forgotten.
GridAxis ColumnAxis();
GridAxis RowAxis();

// At the current zoom, in pixels.
int ColumnWidth(int column);
int RowHeight(int row);
int ColumnsWidth(int first, int end);  // `end` exclusive
int RowsHeight(int first, int end);

// Stores a size. False when there is no memory, or when the index lies outside the sheet.
bool StoreColumnWidth(int column, uint16_t units);
bool StoreRowHeight(int row, uint16_t units);

// Frees all stored sizes.
void ForgetSizes();

}  // namespace kor
