// A press on the chart: it shows the value under it, or pans by an arrow.
#pragma once

#include "graph/data/record.h"

namespace kor {

// Image position, read signed.
LRESULT OnGraphButtonDown(GraphRecord& graph, int x, int y);

// The release hides the value again.
LRESULT OnGraphButtonUp(const GraphRecord& graph);

}  // namespace kor
