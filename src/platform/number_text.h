// Numbers as text, by the platform's own runtime.
#pragma once

namespace kor {

// Room for a number in "%G" form with up to 17 digits, whatever the platform's exponent looks like.
constexpr int kNumberTextCapacity = 40;

// Writes `value` with so many significant digits in "%G" form. Differs between platforms in how it
// is called, and in the digits of the exponent.
void FormatSignificant(double value, int digits, wchar_t (&text)[kNumberTextCapacity]);

// The number at a text's beginning, whatever follows it; 0 where there is none.
double NumberFromText(const wchar_t* text);

}  // namespace kor
