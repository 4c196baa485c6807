// Draws the whole chart into its off-screen image.
#pragma once

#include "graph/data/record.h"

namespace kor {

// By chart type, into hdcMem; an unknown type draws nothing.
void DrawGraph(GraphRecord& graph);

// The same; does nothing for a chart without a window.
void RedrawGraph(GraphRecord& graph);

}  // namespace kor
