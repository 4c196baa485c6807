// What the bar and its menu's entries look like.
#pragma once

#include "funkybar/record.h"
#include "numbers/shapes.h"

namespace kor {

// Answers WM_PAINT.
void PaintBar(HWND hwnd);

// Size of an item's menu entry in pixels.
// Compatibility: measured in the font of a window DC, not in the menu's; pinned by
// BarMenuDrawing.MeasuresOnTheBarsOwnDC.
Size MeasureEntry(HWND hwnd, const FunkyBarItem& item);

// Draws an entry into `area`, in the DC's coordinates; only its background when `item` is null.
void DrawEntry(HDC dc, const RECT& area, const FunkyBarItem* item, bool selected);

}  // namespace kor
