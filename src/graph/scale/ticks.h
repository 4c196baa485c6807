// Where ticks, grid lines and number labels stand on an axis: at the multiples of a step, as two
// walks from 0 outwards would find them. Numbers only.
#pragma once

#include "graph/scale/axis.h"

namespace kor {

// The multiples k whose pixels may lie in view, both ends included; empty when last < first.
struct TickRange {
    double first;
    double last;
};

// The multiples of `step` between two data values, one more on each side; none when the step is too
// small against the values to change them.
TickRange TicksBetween(double valueA, double valueB, double step);

// Whether the walks from 0 draw at a multiple: both ends of the view take part only on the side
// that a walk reaches last. `pixel` runs in the walk's own sense from `lowEdge` to `highEdge`.
constexpr bool IsDrawnBackward(int pixel, int lowEdge, int highEdge) {
    return pixel >= lowEdge && pixel < highEdge;
}

constexpr bool IsDrawnForward(int pixel, int lowEdge, int highEdge) {
    return pixel > lowEdge && pixel <= highEdge;
}

// Calls draw(k, pixel) for every multiple k that the walk below 0 and the walk above 0 draw, in
// that order; the one at 0 may come twice. toPixel(k) must be monotone.
template <typename ToPixel, typename Draw>
void WalkTicks(TickRange range, int lowEdge, int highEdge, ToPixel toPixel, Draw draw) {
    for (double k = range.last < 0 ? range.last : 0; k >= range.first; k -= 1) {
        const int pixel = toPixel(k);
        if (IsDrawnBackward(pixel, lowEdge, highEdge)) draw(k, pixel);
    }
    for (double k = range.first > 0 ? range.first : 0; k <= range.last; k += 1) {
        const int pixel = toPixel(k);
        if (IsDrawnForward(pixel, lowEdge, highEdge)) draw(k, pixel);
    }
}

// draw(value, pixel) for the multiples of `step` between two pixels of an axis, lowEdge <=
// highEdge. Where pixels grow against the values, the walk below 0 runs towards the higher pixels.
template <typename Draw>
void WalkAxisTicks(const Axis& axis, double step, int lowEdge, int highEdge, Draw draw) {
    const TickRange range =
        TicksBetween(ValueAt(axis, lowEdge - 1), ValueAt(axis, highEdge + 1), step);
    const Axis upwards = axis.sign > 0 ? axis : Reversed(axis);
    const int low = axis.sign > 0 ? lowEdge : -highEdge;
    const int high = axis.sign > 0 ? highEdge : -lowEdge;
    WalkTicks(
        range, low, high, [&](double k) { return PixelAt(upwards, k * step); },
        [&](double k, int pixel) { draw(k * step, axis.sign > 0 ? pixel : -pixel); });
}

}  // namespace kor
