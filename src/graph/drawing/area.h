// The polygon between a series and its zero line.
#pragma once

#include "graph/data/record.h"

namespace kor {

// A polygon whose first and last corners lie on one row and whose columns never decrease.
struct AreaOutline {
    POINT* corners;  // followed by one spare element, which is overwritten
    int count;
};

// Fills with the DC's brush and outlines with its pen, pixel for pixel as Polygon does. The time is
// bounded by the pixels of `view`, however many corners there are and however far away they lie.
void DrawArea(HDC dc, const RECT& view, const AreaOutline& outline);

}  // namespace kor
