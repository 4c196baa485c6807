// The multiples of a tick step along each axis of a chart, with their pixels.
#pragma once

#include "graph/record.h"
#include "graph/scale/scale.h"
#include "graph/scale/ticks.h"

namespace kor {

inline double xValueAt(const GraphRecord& graph, int pixel) {
    return graph.xCentre + (pixel - graph.xCentrePixel) * graph.xUnitsPerPixel;
}

inline double yValueAt(const GraphRecord& graph, int pixel) {
    return graph.yCentre - (pixel - graph.yCentrePixel) * graph.yUnitsPerPixel;
}

// draw(value, column) for the multiples of `step` between two columns.
template <typename Draw>
void WalkXTicks(const GraphRecord& graph, double step, int left, int right, Draw draw) {
    const TickRange range =
        TicksBetween(xValueAt(graph, left - 1), xValueAt(graph, right + 1), step);
    WalkTicks(
        range, left, right, [&](double k) { return xPixel(graph, k * step); },
        [&](double k, int column) { draw(k * step, column); });
}

// draw(value, row) for the multiples of `step` between two rows. Values grow upwards, rows do not:
// the walk below 0 runs towards the bottom.
template <typename Draw>
void WalkYTicks(const GraphRecord& graph, double step, int top, int bottom, Draw draw) {
    const TickRange range =
        TicksBetween(yValueAt(graph, top - 1), yValueAt(graph, bottom + 1), step);
    WalkTicks(
        range, -bottom, -top, [&](double k) { return -yPixel(graph, k * step); },
        [&](double k, int negatedRow) { draw(k * step, -negatedRow); });
}

}  // namespace kor
