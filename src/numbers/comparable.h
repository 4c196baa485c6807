// Doubles in the form that the processor compares fastest: themselves, or whole numbers in the same
// order.
#pragma once

#include <type_traits>

#include "numbers/double_bits.h"
#include "numbers/processor.h"

namespace kor {

using Comparable = std::conditional_t<kHasFloatingPoint, double, int64_t>;

// Of numbers, infinite ones included. What is no number lies between no two finite ones in either
// form, but the forms differ where it is compared with one alone.
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
