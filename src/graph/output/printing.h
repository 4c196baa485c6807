// A chart on paper.
#pragma once

#include "graph/data/record.h"

namespace kor {

// Asks for a printer, draws the chart on one page of it, and leaves the record as it was and the
// window disabled. The window may go meanwhile.
void PrintGraph(GraphRecord& graph);

}  // namespace kor
