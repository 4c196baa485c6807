// The mapping of a chart's data to its surface, as stored in its record, and the functions that
// change it.
#pragma once

#include "graph/data/record.h"
#include "graph/scale/axis.h"
#include "graph/shapes/pie_layout.h"

namespace kor {

// The two current mappings, to columns and rows of the image.
Axis XAxis(const GraphRecord& graph);
Axis YAxis(const GraphRecord& graph);

// The same for a single value. Monotone, whatever the value.
int xPixel(const GraphRecord& graph, double x);
int yPixel(const GraphRecord& graph, double y);

PieLayout LayoutPie(const GraphRecord& graph);

// Compute an axis' mapping, tick step and bar size from its range, the zoom and the plot area. They
// do nothing without a window.
void RescaleX(GraphRecord& graph);
void RescaleY(GraphRecord& graph);
void Rescale(GraphRecord& graph);  // both

// Move the data value at the plot's centre, and the mapping with it.
void MoveXCentre(GraphRecord& graph, double by);
void MoveYCentre(GraphRecord& graph, double by);

// `axis` is KORGRAPH_X or KORGRAPH_Y; any other number changes nothing.
void AutoRange(GraphRecord& graph, int axis);
void SetRange(GraphRecord& graph, int axis, double low, double high);

// Sets the zoom factor, without its sign, and rescales both axes.
void SetZoomFactor(GraphRecord& graph, double factor);

// Thickness of one column or bar at the current zoom. Zooming out narrows it, zooming in does not
// widen it.
int ZoomedThickness(const GraphRecord& graph, int thickness);

}  // namespace kor
