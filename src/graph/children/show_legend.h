// The chart's side of its legend.
#pragma once

#include "graph/data/record.h"

namespace kor {

// Creates the legend at a place in the chart, its height rounded up to whole lines, and shows it.
// While there is one, nothing happens.
void ShowLegend(GraphRecord& graph, const RECT& place);

}  // namespace kor
