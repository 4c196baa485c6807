// Prints a chart.
#pragma once

#include "graph/data/record.h"

namespace kor {

// Asks for a printer, prints the chart on one page, and leaves the record as it was and the window
// disabled. The window may be destroyed meanwhile.
void PrintGraph(GraphRecord& graph);

}  // namespace kor
