// Doubles by their bits: questions that a processor without floating point answers in a few integer
// instructions. The answers are those of C++'s comparisons and conversions, for every double.
#pragma once

#include <bit>
#include <cstdint>

namespace kor {

constexpr int kExponentBias = 1023;
constexpr uint32_t kExponentMask = 0x7FF;  // also the exponent of infinities and NaNs

constexpr uint64_t BitsOf(double value) { return std::bit_cast<uint64_t>(value); }
constexpr uint32_t HighBitsOf(double value) { return static_cast<uint32_t>(BitsOf(value) >> 32); }

constexpr bool IsNegativeByBits(double value) { return (HighBitsOf(value) >> 31) != 0; }

constexpr int BiasedExponentOf(double value) {
    return static_cast<int>(HighBitsOf(value) >> 20 & kExponentMask);
}

// The first 32 bits of the significand, the highest one set: the truncated value is that times
// 2^(exponent - 31). Not for 0 and subnormal values, which lack the highest bit.
constexpr uint32_t LeadingBitsOf(double value) {
    return 0x80000000u | static_cast<uint32_t>(BitsOf(value) >> 21 & 0x7FFFFFFF);
}

constexpr bool IsFiniteByBits(double value) {
    constexpr uint32_t kMask = kExponentMask << 20;
    return (HighBitsOf(value) & kMask) != kMask;
}

// An integer that orders as the doubles do; both zeros give the same. Infinities lie outside all
// finite values. NaNs lie beyond the infinities and equal themselves; test for NaN first where it
// matters.
constexpr int64_t OrderOf(double value) {
    const auto bits = static_cast<int64_t>(BitsOf(value));
    const int64_t magnitude = bits & INT64_MAX;
    return bits < 0 ? -magnitude : magnitude;
}

// Truncated toward zero and clamped to +-2^limitBits, with limitBits at most 30; 0 for a NaN.
constexpr int TruncateByBits(double value, int limitBits) {
    constexpr uint64_t kInfinity = static_cast<uint64_t>(kExponentMask) << 52;
    const int exponent = BiasedExponentOf(value) - kExponentBias;
    if (exponent < 0) return 0;
    int magnitude = 1 << limitBits;
    if (exponent < limitBits) {
        magnitude = static_cast<int>(LeadingBitsOf(value) >> (31 - exponent));
    } else if ((BitsOf(value) & INT64_MAX) > kInfinity) {
        return 0;
    }
    return IsNegativeByBits(value) ? -magnitude : magnitude;
}

}  // namespace kor
