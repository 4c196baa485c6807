// Selecting with the left button or the stylus, and scrolling while it is held near an edge.
#pragma once

#include "platform/platform.h"

namespace kor {

constexpr UINT_PTR kAutoScrollTimerId = 10101;

// Client positions; `y` is read signed.
// Compatibility: `x` is read unsigned, so left of the window counts as far right of it; pinned by
// MouseDrag.LeftOfTheWindowIsFarRightOfIt.
LRESULT OnGridButtonDown(WPARAM keys, int x, int y);
LRESULT OnGridPointerMove(int x, int y);
LRESULT OnGridButtonUp(WPARAM keys);

// The capture is lost, or has to be released: the drag ends as with a release, but the parent is
// not notified.
void LoseGridDrag();

// One step of the timer that runs while the button is down.
void OnAutoScroll();

}  // namespace kor
