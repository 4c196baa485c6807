// Doubles to whole numbers and to text, whatever the double.
#pragma once

#include "numbers/comparable.h"
#include "platform/number_text.h"

namespace kor {

// Largest pixel distance that ever comes out of a data value: far outside every window, and small
// enough for the platform's drawing to compute with.
constexpr int kPixelLimitBits = 26;
constexpr int kPixelLimit = 1 << kPixelLimitBits;

// Truncated toward zero, cut to +-kPixelLimit; 0 for what is not a number.
int TruncateToInt(double value);

// The graph's one number-to-text routine: "%.*G" with the exponent of two digits where two do.
// Returns 0 for a null buffer, else 1.
int FormatGraphNumber(double value, wchar_t* buffer, int precision);

constexpr int kGraphPrecision = 5;

}  // namespace kor
