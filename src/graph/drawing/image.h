// The off-screen image: created in the window's size, copied to the window.
#pragma once

#include "graph/data/record.h"

namespace kor {

// Both sizes of the image's bitmap are multiples of 4.
constexpr int RoundedUpTo4(int pixels) { return (pixels + 3) / 4 * 4; }

// Creates the image for a client size, rescales both axes and draws.
void ResizeImage(GraphRecord& graph, int width, int height);

// Paints the window on WM_PAINT.
void PaintFromImage(GraphRecord& graph);

}  // namespace kor
