// The polygon between a series and its zero line.
#pragma once

#include "graph/data/record.h"

namespace kor {

// A polygon whose first and last corners lie on one row and whose columns never fall.
struct AreaOutline {
    POINT* corners;  // with one spare place behind them, which is overwritten
    int count;
};

// Fills with the DC's brush and outlines with its pen, pixel for pixel as Polygon does, in time
// bounded by the pixels of `view`, however many corners there are and however far away they lie.
void DrawArea(HDC dc, const RECT& view, const AreaOutline& outline);

}  // namespace kor
