#include "numbers/pixel_scale.h"

namespace kor {

namespace {

// Up to this exponent, of either sign, neither the reciprocal nor a sum of exponents overflows.
constexpr int kMostExponent = 900;

constexpr int32_t kMostCentre = 1 << 30;

}  // namespace

PixelScale MakePixelScale(double centre, double unitsPerPixel) {
    const int exponent = BiasedExponentOf(unitsPerPixel) - kExponentBias;
    if (exponent < -kMostExponent || exponent > kMostExponent) return {};
    const double position = centre / unitsPerPixel * (1 << kPixelFraction);
    if (!(position > -kMostCentre && position < kMostCentre)) return {};
    const double reciprocal = 1.0 / unitsPerPixel;
    // Value and reciprocal are their leading bits times 2^(exponent - 31), the product's upper half
    // lacks 32 bits, and the position has kPixelFraction bits more.
    constexpr int kProductExponent = 31 + 31 - 32 - kPixelFraction;
    const int shift =
        kProductExponent + kExponentBias + kExponentBias - BiasedExponentOf(reciprocal);
    const auto cut = static_cast<int32_t>(position);
    return {LeadingBitsOf(reciprocal), shift, position < cut ? cut - 1 : cut};
}

}  // namespace kor
