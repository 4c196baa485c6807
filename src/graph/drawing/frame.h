// What all chart types but the pie share around their series: axes with ticks and pan arrows, grid
// lines, labels, titles, and the clip. Each function draws one element and restores what it
// selected.
#pragma once

#include "graph/data/record.h"

namespace kor {

// The whole surface in the background colour.
void FillBackground(const GraphRecord& graph, HDC dc);

void DrawGraphTitle(const GraphRecord& graph, HDC dc);

// `bounds` limits the lines; null means the plot area.
void DrawGridLines(const GraphRecord& graph, HDC dc, const RECT* bounds);

// These two also remember which pan arrows they drew, and where.
void DrawXAxis(GraphRecord& graph, HDC dc);
void DrawYAxis(GraphRecord& graph, HDC dc);

void DrawXAxisLabels(const GraphRecord& graph, HDC dc);
void DrawYAxisLabels(const GraphRecord& graph, HDC dc);
void DrawXAxisTitle(const GraphRecord& graph, HDC dc);
void DrawYAxisTitle(const GraphRecord& graph, HDC dc);

// Clip to an area, and to the whole surface again, with the record's one region.
void ClipToArea(const GraphRecord& graph, HDC dc, const RECT& area);
void ClipToPlot(const GraphRecord& graph, HDC dc);
void ClipToSurface(const GraphRecord& graph, HDC dc);

// What ClipToPlot lets through. In a window smaller than its margins the plot area's sides have
// changed places; a region's never do.
RECT PlotClip(const GraphRecord& graph);

// Before the series: background, title and grid lines, and the clip of the plot area. After them:
// all that lies over them; the window shows it at its next paint.
void BeginFrame(const GraphRecord& graph, HDC dc);
void EndFrame(GraphRecord& graph, HDC dc);

}  // namespace kor
