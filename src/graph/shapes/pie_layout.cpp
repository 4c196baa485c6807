#include "graph/shapes/pie_layout.h"

#include <algorithm>
#include <cmath>

#include "numbers/truncate.h"

namespace kor {

namespace {

constexpr int kBoxGap = 4;
constexpr double kRadiansPerDegree = 0.017453292519943295;
constexpr double kDegreesPerRadian = 57.29577951308232;

// Angles are rounded to doubles before they are compared, whatever precision the processor computes
// with.
double Rounded(double value) {
    volatile double stored = value;
    return stored;
}

}  // namespace

PieLayout LayoutPie(const Rect& surface, Size label, int titleHeight) {
    Rect box = {surface.left + label.width + kBoxGap,
                surface.top + label.height + kBoxGap + titleHeight,
                surface.right - label.width - kBoxGap, surface.bottom - label.height - kBoxGap};
    const int width = box.right - box.left;
    const int height = box.bottom - box.top;
    if (width <= height) {
        const int middle = (box.top + box.bottom) / 2;
        box.top = middle - width / 2;
        box.bottom = middle + width / 2;
    } else {
        const int middle = (box.left + box.right) / 2;
        box.left = middle - height / 2;
        box.right = middle + height / 2;
    }
    const int radius = (box.bottom - box.top) / 2;
    return {box, {box.left + (box.right - box.left) / 2, box.top + radius}, radius};
}

double ShareOf(const Slices& slices, int slice) {
    const double value = slices.values[slice];
    return IsFinite(value) ? std::fabs(value) / slices.absSum : 0.0;
}

int FindSlice(const Slices& slices, Point surfaceCentre, int radius, Point at) {
    const double dx = at.x - surfaceCentre.x;
    const double dy = surfaceCentre.y - at.y;
    const double distance = std::sqrt(dx * dx + dy * dy);
    if (distance == 0 || TruncateToInt(distance) > radius) return -1;
    double angle = Rounded(std::acos(dy / distance) * kDegreesPerRadian);
    if (at.x > surfaceCentre.x) angle = Rounded(360.0 - angle);
    double end = 0;
    for (int k = 0; k < slices.count; ++k) {
        const double start = end;
        end = Rounded(end + ShareOf(slices, k) * 360.0);
        if (start <= angle && angle < end) return k;
    }
    return -1;
}

void RotateVector(double& dx, double& dy, double degrees) {
    const double angle = degrees * kRadiansPerDegree;
    const double sine = std::sin(angle);
    const double cosine = std::cos(angle);
    const double turnedX = dx * cosine + dy * sine;
    dy = -dx * sine + dy * cosine;
    dx = turnedX;
}

Point RadiusEnd(int radius, double degrees) {
    double dx = 0;
    double dy = -radius;
    RotateVector(dx, dy, degrees);
    return {TruncateToInt(dx), TruncateToInt(dy)};
}

Boundary BoundaryAt(int radius, double degrees) {
    return {MakeSliceEdge(degrees), RadiusEnd(radius, degrees)};
}

RowRange RowsOfSlice(int radius, const Boundary& start, const Boundary& end) {
    constexpr int kSpare = 2;
    const int startRow = start.end.y;
    const int endRow = end.end.y;
    const bool reachesBottom = start.edge.degrees <= 180.0 && end.edge.degrees >= 180.0;
    const int lowest = reachesBottom ? radius : std::max({startRow, endRow, 0});
    return {std::max(std::min({startRow, endRow, 0}) - kSpare, -radius),
            std::min(lowest + kSpare, radius)};
}

}  // namespace kor
