// What all chart types but the pie share around their series: axes with ticks and pan arrows, grid
// lines, labels, titles, and the clip. Each function draws one element and restores what it
// selected.
#pragma once

#include "graph/record.h"

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

// Background, title and grid lines, then the series inside the plot's clip, then all that lies over
// them; the window shows it at its next paint.
template <typename DrawSeries>
void DrawInFrame(GraphRecord& graph, HDC dc, DrawSeries drawSeries) {
    FillBackground(graph, dc);
    DrawGraphTitle(graph, dc);
    DrawGridLines(graph, dc, nullptr);
    ClipToPlot(graph, dc);
    drawSeries();
    ClipToSurface(graph, dc);
    DrawXAxis(graph, dc);
    DrawYAxis(graph, dc);
    DrawXAxisLabels(graph, dc);
    DrawYAxisLabels(graph, dc);
    DrawXAxisTitle(graph, dc);
    DrawYAxisTitle(graph, dc);
    if (graph.hwnd) InvalidateRect(graph.hwnd, nullptr, FALSE);
}

}  // namespace kor
