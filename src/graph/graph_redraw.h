// Drawing the whole chart into its off-screen image.
#pragma once

#include "graph/graph_record.h"

namespace kor {

// By chart type; does nothing for a chart without a window, or of a type there is not.
void RedrawGraph(GraphRecord& graph);

}  // namespace kor
