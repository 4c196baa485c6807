// One axis of a chart: a linear mapping of values to pixels, centred on the plot area and scaled by
// the zoom. Arithmetic only.
#pragma once

#include <cstdint>

#include "numbers/pixel_scale.h"

namespace kor {

// Pixels grow with the values (`sign` 1, columns) or against them (-1, rows).
struct Axis {
    double centre;         // data value at the centre pixel
    double unitsPerPixel;  // above 0, finite
    int32_t centrePixel;
    int32_t sign;
    const PixelScale* quick;  // the same mapping, for processors without an FPU
};

// The pixel of a value. Monotone, whatever the value.
int PixelAt(const Axis& axis, double value);

// The value at a pixel's centre.
double ValueAt(const Axis& axis, int pixel);

// The axis with all pixels negated: on a reversed y axis pixels grow with the values.
Axis Reversed(const Axis& axis);

// The scale that follows from a range of values, an extent in pixels and the zoom.
struct AxisScale {
    double centre;
    double unitsPerPixelBase;  // at 100 %
    double unitsPerPixel;
    double tickStep;  // may be 0
    int barSize;      // thickness in pixels of one of `seriesCount` bars side by side
};

AxisScale ScaleAxis(double low, double high, int extent, double zoom, int seriesCount,
                    double tickPixels);

}  // namespace kor
