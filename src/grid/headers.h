// Keeps the two header strips in step with the view. The visible counts are a by-product: as many
// columns, or rows, are visible as the strip needs items to fill its length.
#pragma once

#include "platform/platform.h"

namespace kor {

// Room for two letters and the terminator.
constexpr int kColumnNameCapacity = 3;

// A to Z, AA to IV.
void FormatColumnName(int column, wchar_t (&name)[kColumnNameCapacity]);

// Gives the strip as many items as fit into `width` (`height`) pixels, labels and sizes them, and
// repaints it. The result is 1.
LRESULT UpdateColumnHeader(int width);
LRESULT UpdateRowHeader(int height);

// Labels and sizes the items that a strip has, and repaints it.
void FillColumnHeader();
void FillRowHeader();

// UpdateColumnHeader and UpdateRowHeader with the extent of the cell area: client size less
// cellsLeft or cellsTop.
LRESULT UpdateColumnHeaderOverCells();
LRESULT UpdateRowHeaderOverCells();

}  // namespace kor
