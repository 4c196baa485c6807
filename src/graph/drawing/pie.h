// The pie: its layout, which the hit test shares, and its drawing.
#pragma once

#include "graph/record.h"

namespace kor {

// Where the pie stands, in image pixels.
struct PieLayout {
    RECT box;      // square; the outline's
    POINT centre;  // of the pie
    int radius;
};

PieLayout LayoutPie(const GraphRecord& graph);

// Centre of the surface. Percentage labels are measured from it, not from the pie's own centre.
POINT SurfaceCentre(const GraphRecord& graph);

// A slice's share of the pie, 0 to 1, or none for a pie without slices.
double SliceShare(const GraphSeries& series, int slice);

// Whether the series makes a pie: it has values, and they are not all 0.
bool HasSlices(const GraphSeries* series);

// Turns a vector, in place: at 90 degrees (0, -1), straight up, points to the left.
void RotateVector(double& dx, double& dy, double degrees);

void DrawPieChart(GraphRecord& graph, HDC dc);

}  // namespace kor
