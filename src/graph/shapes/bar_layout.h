// The geometry of the bars of a column or bar chart, for drawing and hit-testing. Arithmetic only.
#pragma once

#include "graph/scale/axis.h"
#include "graph/shapes/points.h"
#include "numbers/shapes.h"

namespace kor {

// The two axes as a bar sees them, so that the same code serves columns and bars. Pixels grow with
// the point numbers along one axis and with the values along the other.
struct BarAxes {
    Axis along;
    Axis value;
    bool upright;  // columns: `along` runs right and `value` up; bars: the other way round
};

inline BarAxes AxesOfColumns(const Axis& x, const Axis& y) { return {x, Reversed(y), true}; }
inline BarAxes AxesOfBars(const Axis& x, const Axis& y) { return {Reversed(y), x, false}; }

// The image position of one pixel on each axis.
constexpr Point PlaceOf(const BarAxes& axes, int along, int value) {
    return axes.upright ? Point{along, -value} : Point{value, -along};
}

// Offset in pixels of the bar of series `index`, counted from 0, from the position of its category,
// on which the group of bars is centred.
constexpr int OffsetInGroup(int index, int seriesCount, int thickness) {
    return index * thickness - (seriesCount * thickness) / 2;
}

// Index of the value whose bar contains an image position, edges included, or -1.
int FindBar(const BarAxes& axes, const double* values, int count, int offset, int thickness,
            Point at);

}  // namespace kor
