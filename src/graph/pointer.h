// Presses on the chart: they show the value under the pointer, or pan by an arrow.
#pragma once

#include "graph/data/record.h"

namespace kor {

// x and y are image coordinates and may be negative.
LRESULT OnGraphButtonDown(GraphRecord& graph, int x, int y);

// The release hides the value again.
LRESULT OnGraphButtonUp(const GraphRecord& graph);

}  // namespace kor
