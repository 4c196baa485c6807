// Doubles in the form that the processor compares fastest: as they are, or as integers in the same
// order.
#pragma once

#include <type_traits>

#include "numbers/double_bits.h"
#include "numbers/processor.h"

namespace kor {

using Comparable = std::conditional_t<kHasFloatingPoint, double, int64_t>;

// Valid for finite values and infinities. A NaN is never between two finite values in either form,
// but single comparisons with a NaN differ between the forms.
constexpr Comparable ComparableOf(double value) {
    if constexpr (kHasFloatingPoint) {
        return value;
    } else {
        return OrderOf(value);
    }
}

constexpr bool IsFinite(double value) {
    if constexpr (kHasFloatingPoint) {
        return value - value == 0;
    } else {
        return IsFiniteByBits(value);
    }
}

}  // namespace kor
