// Selecting with the left button or the stylus, and scrolling while it is held near an edge.
#pragma once

#include "platform/platform.h"

namespace kor {

constexpr UINT_PTR kAutoScrollTimerId = 10101;

// Client positions: `x` read unsigned, `y` signed.
LRESULT OnGridButtonDown(WPARAM keys, int x, int y);
LRESULT OnGridPointerMove(int x, int y);
LRESULT OnGridButtonUp(WPARAM keys);

// The capture has gone to another window, or is to be given up: the drag ends as a release ends it,
// but the parent is not notified.
void LoseGridDrag();

// One step of the timer that runs while the button is down.
void OnAutoScroll();

}  // namespace kor
