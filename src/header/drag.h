// The pointer on a strip: pressing items, dragging borders, telling the parent.
#pragma once

#include "header/record.h"

namespace kor {

// `position` is the pointer along the strip, read unsigned: left of or above the strip it is very
// large, and so beyond everything.
LRESULT OnHeaderButtonDown(HeaderRecord& header, int position);
LRESULT OnHeaderPointerMove(HeaderRecord& header, int position);
LRESULT OnHeaderButtonUp(HeaderRecord& header);

// The strip has lost the capture: what was pressed or dragged in it is over, and the parent is not
// notified. A dragged item keeps its size.
void LoseHeaderDrag(const HeaderRecord& header);

// The strip goes: so does a drag in it.
void EndHeaderDrag(const HeaderRecord& header);

// Client size of the strip changed: how far its items may be dragged follows.
void UpdateSizeBounds(const HeaderRecord& header, int clientWidth, int clientHeight);

// The item's size after the pointer moved from `from` to `to`, between the minimum and `maximum`.
int DraggedSize(int size, int from, int to, int maximum);

// A size in pixels as units (pixels at 100 %), rounded to the middle of the pixel.
int UnitsOfDraggedSize(int pixels, uint32_t zoom);

}  // namespace kor
