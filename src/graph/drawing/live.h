// Live mode: new samples are drawn over the picture there is, instead of drawing it all again.
#pragma once

#include <korcontrols/graph.h>

#include "graph/data/record.h"

namespace kor {

// GN_LIVEUPDATE: stores what the data mode says and draws a step. Without live mode nothing
// happens.
void OnLiveUpdate(GraphRecord& graph, LPARAM argument);

// Works out the newest step's points and invalidates the rectangle they need.
void AdvanceLiveTrace(GraphRecord& graph);

// Draws the live traces within a rectangle of the window, straight into its DC. Titles, labels and
// the y axis stay as they are on the screen.
void PaintLiveRect(GraphRecord& graph, HDC dc, RECT area);

}  // namespace kor
