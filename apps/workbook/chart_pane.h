// The right part of the window: the chart, its legend, and below it the live chart while there is
// one.
//
// The charts are children of a pane of their own, without a frame, as the chart places its tooltip
// by its parent's window.
#pragma once

#include <windows.h>

namespace workbook {

struct Workbook;

// Creates the pane, hidden.
//   result  whether the pane and the chart exist
bool CreateChartPane(Workbook& workbook);

// How wide the pane is to be in a window of this width; 0 while it is hidden.
int ChartPaneWidth(const Workbook& workbook, int windowWidth);

// Gives the charts and the legend their places in the pane.
void LayOutChartPane(const Workbook& workbook);

bool IsLegendShown(const Workbook& workbook);
void ToggleLegend(Workbook& workbook);

// A tooltip near the right edge reaches beyond it: the chart keeps it left of a limit that is right
// only for a parent at the screen's left edge. To be called when no message waits.
void KeepTooltipsInPane(const Workbook& workbook);

}  // namespace workbook
