// The pointer on a strip: pressing items, dragging borders, notifying the parent.
#pragma once

#include "header/record.h"

namespace kor {

// `position` is the pointer position along the strip, read unsigned: left of or above the strip it
// is very large, beyond all items.
LRESULT OnHeaderButtonDown(HeaderRecord& header, int position);
LRESULT OnHeaderPointerMove(HeaderRecord& header, int position);
LRESULT OnHeaderButtonUp(HeaderRecord& header);

// The strip has lost the capture: its press or drag ends, and the parent is not notified. A dragged
// item keeps its size.
void LoseHeaderDrag(const HeaderRecord& header);

// The strip is being destroyed: a drag in it ends.
void EndHeaderDrag(const HeaderRecord& header);

// The strip's client size has changed: updates how large its items may be dragged.
void UpdateSizeBounds(const HeaderRecord& header, int clientWidth, int clientHeight);

// The item's size after the pointer moved from `from` to `to`, kept between the minimum and
// `maximum`.
int DraggedSize(int size, int from, int to, int maximum);

// Converts a size in pixels to units (pixels at 100 %), measured to the middle of the pixel.
int UnitsOfDraggedSize(int pixels, uint32_t zoom);

}  // namespace kor
