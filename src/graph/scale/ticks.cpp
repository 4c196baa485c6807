#include "graph/scale/ticks.h"

#include <algorithm>
#include <cmath>

#include "numbers/comparable.h"

namespace kor {

namespace {

// Beyond it neighbouring multiples are one number, and a walk would not move.
constexpr double kLargestMultiple = 4503599627370496.0;  // 2 to the 52nd
// No axis shows as many; a step that small against the view draws nothing.
constexpr double kMostTicks = 100000.0;
constexpr TickRange kNoTicks = {1, 0};

}  // namespace

TickRange TicksBetween(double valueA, double valueB, double step) {
    if (!(step > 0) || !IsFinite(step)) return kNoTicks;
    const double low = std::floor(std::min(valueA, valueB) / step) - 1;
    const double high = std::ceil(std::max(valueA, valueB) / step) + 1;
    const bool countable = low >= -kLargestMultiple && high <= kLargestMultiple;
    if (!countable || high - low > kMostTicks) return kNoTicks;
    return {low, high};
}

}  // namespace kor
