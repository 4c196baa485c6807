// Where the bars of a column or bar chart stand, for drawing and for the pointer. Numbers only.
#pragma once

#include "graph/scale/axis.h"
#include "graph/shapes/points.h"
#include "numbers/shapes.h"

namespace kor {

// The two axes in the sense of a bar, so that columns and bars are the same: pixels grow with the
// numbers of the points along one and with the values along the other.
struct BarAxes {
    Axis along;
    Axis value;
    bool upright;  // columns: `along` counts columns, and `value` rows upwards; bars: the reverse
};

inline BarAxes AxesOfColumns(const Axis& x, const Axis& y) { return {x, Reversed(y), true}; }
inline BarAxes AxesOfBars(const Axis& x, const Axis& y) { return {Reversed(y), x, false}; }

// The image position of a pixel of each axis.
constexpr Point PlaceOf(const BarAxes& axes, int along, int value) {
    return axes.upright ? Point{along, -value} : Point{value, -along};
}

// Where series number `index`, from 0, stands across a group that is centred on its category, in
// pixels from the category's own.
constexpr int OffsetInGroup(int index, int seriesCount, int thickness) {
    return index * thickness - (seriesCount * thickness) / 2;
}

// Index of the value whose bar holds an image position, its edges included, or -1.
int FindBar(const BarAxes& axes, const double* values, int count, int offset, int thickness,
            Point at);

}  // namespace kor
