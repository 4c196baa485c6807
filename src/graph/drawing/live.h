// Live mode: new samples are drawn over the existing picture, instead of redrawing all of it.
#pragma once

#include <korcontrols/graph.h>

#include "graph/data/record.h"

namespace kor {

// GN_LIVEUPDATE: stores the new data as the data mode says and advances the trace by one step. Does
// nothing without live mode.
void OnLiveUpdate(GraphRecord& graph, LPARAM argument);

// Computes the points of the newest step and invalidates the rectangle that they need.
void AdvanceLiveTrace(GraphRecord& graph);

// Draws the live traces within a rectangle of the window, directly into its DC. Titles, labels and
// the y axis stay as they are on the screen.
void PaintLiveRect(GraphRecord& graph, HDC dc, RECT area);

}  // namespace kor
