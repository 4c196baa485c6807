// Conversion of any double to an integer.
#pragma once

#include "numbers/comparable.h"

namespace kor {

// Largest pixel distance that a data value ever gives: far outside every window, and small enough
// for the platform's drawing to compute with.
constexpr int kPixelLimitBits = 26;
constexpr int kPixelLimit = 1 << kPixelLimitBits;

// Truncated toward zero, clamped to +-kPixelLimit; 0 for a NaN.
constexpr int TruncateToInt(double value) {
    if constexpr (!kHasFloatingPoint) return TruncateByBits(value, kPixelLimitBits);
    if (value >= kPixelLimit) return kPixelLimit;
    if (value <= -kPixelLimit) return -kPixelLimit;
    return value == value ? static_cast<int>(value) : 0;
}

}  // namespace kor
