#include "graph/scale/ticks.h"

#include <algorithm>
#include <cmath>

#include "numbers/comparable.h"

namespace kor {

namespace {

// Beyond it neighbouring multiples are the same double, and a walk would not advance.
constexpr double kLargestMultiple = 4503599627370496.0;  // 2 to the 52nd
// No axis shows this many; a step this small relative to the view draws nothing.
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

TickWalk::TickWalk(const Axis& axis, double step, int lowEdge, int highEdge)
    : axis_(axis.sign > 0 ? axis : Reversed(axis)), isReversed_(axis.sign < 0), step_(step),
      range_(TicksBetween(ValueAt(axis, lowEdge - 1), ValueAt(axis, highEdge + 1), step)),
      low_(isReversed_ ? -highEdge : lowEdge), high_(isReversed_ ? -lowEdge : highEdge),
      k_(range_.last < 0 ? range_.last : 0) {}

bool TickWalk::Next() {
    for (;;) {
        if (!isForward_ && k_ < range_.first) {
            isForward_ = true;
            k_ = range_.first > 0 ? range_.first : 0;
        }
        if (isForward_ && k_ > range_.last) return false;
        value_ = k_ * step_;
        const int pixel = PixelAt(axis_, value_);
        k_ += isForward_ ? 1 : -1;
        if (IsDrawn(pixel)) {
            pixel_ = isReversed_ ? -pixel : pixel;
            return true;
        }
    }
}

bool TickWalk::IsDrawn(int pixel) const {
    return isForward_ ? pixel > low_ && pixel <= high_ : pixel >= low_ && pixel < high_;
}

}  // namespace kor
