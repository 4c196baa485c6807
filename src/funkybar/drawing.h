// What the bar and its menu's entries look like.
#pragma once

#include "funkybar/record.h"
#include "numbers/shapes.h"

namespace kor {

// Answers WM_PAINT.
void PaintBar(HWND hwnd);

// Size of an item's menu entry. Measured in a window DC's own font, not in the menu's.
Size MeasureEntry(HWND hwnd, const FunkyBarItem& item);

// Draws an entry into `area`, in dc's coordinates; without an item just its background.
void DrawEntry(HDC dc, const RECT& area, const FunkyBarItem* item, bool selected);

}  // namespace kor
