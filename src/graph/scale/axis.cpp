#include "graph/scale/axis.h"

#include <algorithm>
#include <cmath>
#include <limits>

#include "numbers/comparable.h"
#include "numbers/truncate.h"

namespace kor {

namespace {

// The width of a very large range overflows; half of it does not.
double HalfRange(double low, double high) { return high * 0.5 - low * 0.5; }

double TickStep(double range, double unitsPerPixelBase, double zoom, double tickPixels) {
    double step;
    if (range < 1.0) {
        step = 1.0 / std::pow(10.0, std::ceil(std::log10(1.0 / std::fabs(range))));
    } else {
        step = std::fabs(std::ceil((1.0 / zoom) * tickPixels * unitsPerPixelBase));
    }
    return IsFinite(step) ? step : 1.0;
}

}  // namespace

int PixelAt(const Axis& axis, double value) {
    int pixels = kUnknownPixels;
    if constexpr (!kHasFloatingPoint) pixels = QuickPixels(*axis.quick, value);
    if (pixels == kUnknownPixels) {
        pixels = TruncateToInt((value - axis.centre) / axis.unitsPerPixel);
    }
    return axis.sign > 0 ? axis.centrePixel + pixels : axis.centrePixel - pixels;
}

double ValueAt(const Axis& axis, int pixel) {
    const int pixels = pixel - axis.centrePixel;
    return axis.centre + (axis.sign > 0 ? pixels : -pixels) * axis.unitsPerPixel;
}

Axis Reversed(const Axis& axis) {
    Axis reversed = axis;
    reversed.centrePixel = -axis.centrePixel;
    reversed.sign = -axis.sign;
    return reversed;
}

AxisScale ScaleAxis(double low, double high, int extent, double zoom, int seriesCount,
                    double tickPixels) {
    const double range = high - low;
    const int pixels = std::max(extent, 1);  // a window may be smaller than its margins
    AxisScale scale;
    if (IsFinite(range)) {
        scale.centre = range * 0.5 + low;
        scale.unitsPerPixelBase = std::fabs(range) / pixels;
    } else {
        scale.centre = high * 0.5 + low * 0.5;
        scale.unitsPerPixelBase = std::fabs(HalfRange(low, high)) / pixels * 2.0;
    }
    if (!IsFinite(scale.centre)) scale.centre = 0.0;
    if (!IsFinite(scale.unitsPerPixelBase) || scale.unitsPerPixelBase == 0.0) {
        scale.unitsPerPixelBase = 1.0;
    }
    scale.unitsPerPixel = (1.0 / zoom) * scale.unitsPerPixelBase;
    if (!IsFinite(scale.unitsPerPixel)) {
        scale.unitsPerPixel = std::numeric_limits<double>::max();
    }
    scale.barSize = seriesCount > 0 ? TruncateToInt(pixels / range / seriesCount) : 0;
    scale.tickStep = TickStep(range, std::fabs(range) / pixels, zoom, tickPixels);
    return scale;
}

}  // namespace kor
