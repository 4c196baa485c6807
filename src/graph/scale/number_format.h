// Formats a chart's numbers as text.
#pragma once

#include "platform/number_text.h"

namespace kor {

// The graph's one number-to-text routine: "%.*G" with an exponent of two digits where two suffice.
// Returns 0 for a null buffer, else 1.
int FormatGraphNumber(double value, wchar_t* buffer, int precision);

constexpr int kGraphPrecision = 5;

}  // namespace kor
