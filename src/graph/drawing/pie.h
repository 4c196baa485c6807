// The pie of a chart: its layout, which the hit test shares, and its drawing.
#pragma once

#include "graph/record.h"
#include "graph/shapes/pie_layout.h"

namespace kor {

PieLayout LayoutPie(const GraphRecord& graph);

// Whether the series makes a pie: it has values, and they are not all 0.
bool HasSlices(const GraphSeries* series);

// The slices of a series that has some.
Slices SlicesOf(const GraphSeries& series);

// The whole surface.
Rect SurfaceOf(const GraphRecord& graph);

void DrawPieChart(GraphRecord& graph, HDC dc);

}  // namespace kor
