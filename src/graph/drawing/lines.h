// Line and area charts, and the markers of a line.
#pragma once

#include "graph/data/record.h"

namespace kor {

void DrawLineChart(GraphRecord& graph, HDC dc);
void DrawAreaChart(GraphRecord& graph, HDC dc);

// Draws a filled circle on each point, with the selected pen and a brush in the series' colour.
void DrawSeriesMarkers(const GraphRecord& graph, HDC dc, const GraphSeries& series);

}  // namespace kor
