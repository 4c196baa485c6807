// What all chart types except the pie draw around their series: axes with ticks and pan arrows,
// grid lines, labels and titles, and the clipping. Each function draws one element and restores
// what it selected.
#pragma once

#include "graph/data/record.h"

namespace kor {

// The whole surface in the background colour.
void FillBackground(const GraphRecord& graph, HDC dc);

void DrawGraphTitle(const GraphRecord& graph, HDC dc);

// `bounds` limits the lines; null means the plot area.
void DrawGridLines(const GraphRecord& graph, HDC dc, const RECT* bounds);

// These two also record which pan arrows they drew, and where.
void DrawXAxis(GraphRecord& graph, HDC dc);
void DrawYAxis(GraphRecord& graph, HDC dc);

void DrawXAxisLabels(const GraphRecord& graph, HDC dc);
void DrawYAxisLabels(const GraphRecord& graph, HDC dc);
void DrawXAxisTitle(const GraphRecord& graph, HDC dc);
void DrawYAxisTitle(const GraphRecord& graph, HDC dc);

// Clip to an area, and to the whole surface again. All use the record's one region.
void ClipToArea(const GraphRecord& graph, HDC dc, const RECT& area);
void ClipToPlot(const GraphRecord& graph, HDC dc);
void ClipToSurface(const GraphRecord& graph, HDC dc);

// The rectangle that ClipToPlot clips to. When the window is smaller than its margins the plot
// rectangle is inverted; regions are always normalised.
RECT PlotClip(const GraphRecord& graph);

// BeginFrame draws what lies below the series (background, title and grid lines) and clips to the
// plot area. EndFrame draws all that lies over them and invalidates the window.
void BeginFrame(const GraphRecord& graph, HDC dc);
void EndFrame(GraphRecord& graph, HDC dc);

}  // namespace kor
