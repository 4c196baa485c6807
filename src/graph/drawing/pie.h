// Pie charts.
#pragma once

#include "graph/record.h"

namespace kor {

void DrawPieChart(GraphRecord& graph, HDC dc);

}  // namespace kor
