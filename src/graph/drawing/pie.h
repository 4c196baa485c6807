// Pie charts.
#pragma once

#include "graph/data/record.h"

namespace kor {

void DrawPieChart(GraphRecord& graph, HDC dc);

}  // namespace kor
