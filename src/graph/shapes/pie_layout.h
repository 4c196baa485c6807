// Where a pie and its slices stand, for drawing and for the pointer. Numbers only.
#pragma once

#include "graph/shapes/slice_walk.h"
#include "numbers/shapes.h"

namespace kor {

// In image pixels.
struct PieLayout {
    Rect box;      // square; the outline's
    Point centre;  // of the pie
    int radius;
};

// What surrounds the pie takes room from the surface: percentage labels of a size on all sides, and
// a title above; 0 for none.
PieLayout LayoutPie(const Rect& surface, Size label, int titleHeight);

// Centre of the surface. Percentage labels are measured from it, not from the pie's own centre.
constexpr Point CentreOf(const Rect& surface) {
    return {(surface.left + surface.right) >> 1, (surface.top + surface.bottom) >> 1};
}

// The values of a pie. Owns nothing.
struct Slices {
    const double* values;
    int count;
    double absSum;  // of the absolute values; above 0 and finite
};

// A slice's share of the pie, 0 to 1.
double ShareOf(const Slices& slices, int slice);

// Index of the slice at an image position, or -1. `radius` is the pie's.
int FindSlice(const Slices& slices, Point surfaceCentre, int radius, Point at);

// Rotates a vector, in place: at 90 degrees (0, -1), straight up, points to the left.
void RotateVector(double& dx, double& dy, double degrees);

// The end of a radius, from the centre, in whole pixels.
Point RadiusEnd(int radius, double degrees);

// Where one slice ends and the next one begins. sin, cos and tan are expensive without a
// floating-point unit, so adjacent slices share a Boundary.
struct Boundary {
    SliceEdge edge;
    Point end;  // of its radius, from the centre
};

Boundary BoundaryAt(int radius, double degrees);

// Rows that hold pixels of a slice, and some more: from the centre to its arc, within the radius.
RowRange RowsOfSlice(int radius, const Boundary& start, const Boundary& end);

}  // namespace kor
