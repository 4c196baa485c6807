// Number formatting and parsing by the platform's own runtime.
#pragma once

namespace kor {

// Room for a number in "%G" form with up to 17 digits, whatever the platform's exponent looks like.
constexpr int kNumberTextCapacity = 40;

// Formats `value` in "%G" form with `digits` significant digits. Platforms differ in the runtime's
// call and in the number of exponent digits.
void FormatSignificant(double value, int digits, wchar_t (&text)[kNumberTextCapacity]);

// Parses the number at the beginning of a text and ignores the rest; 0 when there is none.
double NumberFromText(const wchar_t* text);

}  // namespace kor
