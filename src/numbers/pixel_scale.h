// A chart's mapping of values to pixels without floating point:
//
//     pixels = (value - centre) / unitsPerPixel, truncated toward zero
//
// Both operations round to a double, which may put a value near a pixel's edge on either side of
// it. So the integers answer only where the value is far enough from an edge. The rest, a few in
// ten thousand, are left to the doubles.
#pragma once

#include <cstdint>

#include "numbers/double_bits.h"

namespace kor {

constexpr int kPixelFraction = 16;  // bits of a position below the pixel

// Positions are pixels from the value 0, in units of 1 / 2^kPixelFraction. All zeros: no position
// is known.
struct PixelScale {
    uint32_t reciprocal;  // leading bits of 1 / unitsPerPixel
    int32_t shift;        // less the value's exponent: right shift from product to position
    int32_t centre;       // position of the centre, rounded down
};

// All zeros when the axis is so far from 0 or so steep that positions would overflow.
PixelScale MakePixelScale(double centre, double unitsPerPixel);

constexpr int kUnknownPixels = INT32_MIN;

// The pixels of a value, or kUnknownPixels.
//
// A position is at most 2.5 units above the product, since both factors are truncated to 32 bits
// and the shift is at least 2. The centre's position is off by 1, and the doubles' roundings by
// less than 2^-20. The margin is twice all that.
inline int QuickPixels(const PixelScale& scale, double value) {
    constexpr uint32_t kMargin = 8;
    constexpr uint32_t kPixel = 1u << kPixelFraction;
    const int shift = scale.shift - BiasedExponentOf(value);
    if (shift < 2) return kUnknownPixels;
    const uint64_t product = static_cast<uint64_t>(LeadingBitsOf(value)) * scale.reciprocal;
    const uint32_t leading = static_cast<uint32_t>(product >> 32);
    const int32_t away = shift < 32 ? static_cast<int32_t>(leading >> shift) : 0;
    const int32_t position = (IsNegativeByBits(value) ? -away : away) - scale.centre;
    const uint32_t magnitude =
        position < 0 ? 0u - static_cast<uint32_t>(position) : static_cast<uint32_t>(position);
    if ((magnitude + kMargin) % kPixel < 2 * kMargin) return kUnknownPixels;
    const auto pixels = static_cast<int32_t>(magnitude >> kPixelFraction);
    return position < 0 ? -pixels : pixels;
}

}  // namespace kor
