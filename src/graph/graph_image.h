// The off-screen image: made in the window's size, copied to the window.
#pragma once

#include "graph/graph_record.h"

namespace kor {

// Makes the image for a client size, scales both axes and draws.
void ResizeImage(GraphRecord& graph, int width, int height);

// WM_PAINT's part of the work.
void PaintFromImage(GraphRecord& graph);

}  // namespace kor
