// The chart's side of its legend.
#pragma once

#include "graph/data/record.h"

namespace kor {

// Creates the legend in a rectangle of the chart, its height rounded up to whole lines, and shows
// it. Does nothing if the chart has made one already.
void ShowLegend(GraphRecord& graph, const RECT& place);

}  // namespace kor
