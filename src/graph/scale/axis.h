// One axis of a chart: a linear mapping of values to pixels, centred on the plot area and scaled by
// the zoom. Numbers only.
#pragma once

#include <cstdint>

#include "numbers/comparable.h"
#include "numbers/pixel_scale.h"
#include "numbers/truncate.h"

namespace kor {

// Pixels grow with the values (`sign` 1, columns) or against them (-1, rows).
struct Axis {
    double centre;         // data value at the centre pixel
    double unitsPerPixel;  // above 0, finite
    int32_t centrePixel;
    int32_t sign;
    PixelScale quick;  // of the same mapping, for processors without floating point
};

// The pixel of a value. Monotone, whatever the value.
inline int PixelAt(const Axis& axis, double value) {
    int pixels = kUnknownPixels;
    if constexpr (!kHasFloatingPoint) pixels = QuickPixels(axis.quick, value);
    if (pixels == kUnknownPixels) {
        pixels = TruncateToInt((value - axis.centre) / axis.unitsPerPixel);
    }
    return axis.sign > 0 ? axis.centrePixel + pixels : axis.centrePixel - pixels;
}

// The value at a pixel's centre.
inline double ValueAt(const Axis& axis, int pixel) {
    const int pixels = pixel - axis.centrePixel;
    return axis.centre + (axis.sign > 0 ? pixels : -pixels) * axis.unitsPerPixel;
}

// The axis with all pixels negated: on a reversed y axis pixels grow with the values.
inline Axis Reversed(const Axis& axis) {
    Axis reversed = axis;
    reversed.centrePixel = -axis.centrePixel;
    reversed.sign = -axis.sign;
    return reversed;
}

// What follows from a range of values, an extent in pixels and the zoom.
struct AxisScale {
    double centre;
    double unitsPerPixelBase;  // at 100 %
    double unitsPerPixel;
    double tickStep;  // may be 0
    int barSize;      // pixels of one of `seriesCount` bars side by side
};

AxisScale ScaleAxis(double low, double high, int extent, double zoom, int seriesCount,
                    double tickPixels);

}  // namespace kor
