// Column and bar charts.
#pragma once

#include "graph/data/record.h"

namespace kor {

void DrawColumnChart(GraphRecord& graph, HDC dc);
void DrawBarChart(GraphRecord& graph, HDC dc);

}  // namespace kor
