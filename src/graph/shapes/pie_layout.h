// The geometry of a pie and its slices, for drawing and hit-testing. Arithmetic only.
#pragma once

#include "graph/shapes/slice_walk.h"
#include "numbers/shapes.h"

namespace kor {

// In image pixels.
struct PieLayout {
    Rect box;      // square, around the outline
    Point centre;  // of the pie
    int radius;
};

// Fits a pie into the surface, less the room for percentage labels of a given size on all sides and
// for a title above. 0 stands for none.
PieLayout LayoutPie(const Rect& surface, Size label, int titleHeight);

// Centre of the surface. Compatibility: percentage labels and hits are measured from it, not from
// the pie's own centre (GraphPie.LabelsAreMeasuredFromTheClientCentre).
constexpr Point CentreOf(const Rect& surface) {
    return {(surface.left + surface.right) >> 1, (surface.top + surface.bottom) >> 1};
}

// The values of a pie. Owns nothing.
struct Slices {
    const double* values;
    int count;
    double absSum;  // sum of the absolute values; above 0 and finite
};

// A slice's share of the pie, 0 to 1.
double ShareOf(const Slices& slices, int slice);

// Index of the slice at an image position, or -1. `radius` is the pie's.
int FindSlice(const Slices& slices, Point surfaceCentre, int radius, Point at);

// Rotates a vector in place. 90 degrees turn (0, -1), straight up, to the left.
void RotateVector(double& dx, double& dy, double degrees);

// The end of a radius relative to the centre, truncated to whole pixels.
Point RadiusEnd(int radius, double degrees);

// Where one slice ends and the next one begins. sin, cos and tan are expensive without a
// floating-point unit, so adjacent slices share a Boundary.
struct Boundary {
    SliceEdge edge;
    Point end;  // of its radius, relative to the centre
};

Boundary BoundaryAt(int radius, double degrees);

// The rows that contain pixels of a slice, plus a few spare ones: from the centre to its arc,
// clamped to the radius.
RowRange RowsOfSlice(int radius, const Boundary& start, const Boundary& end);

}  // namespace kor
