// Numbers as text by the core library. Its swprintf takes no capacity, unlike the one that the
// headers declare, and its wcstod has a replacement there; so both are declared here by their
// names.
#include "platform/number_text.h"

namespace kor {

namespace {

extern "C" {
int CoreFormat(wchar_t* text, const wchar_t* format, ...) __asm__("swprintf");
double CoreNumber(const wchar_t* text, wchar_t** rest) __asm__("wcstod");
}

// A sign, the digits with a point, "E", and a signed exponent of three digits.
constexpr int kDigitsLimit = kNumberTextCapacity - 8;

}  // namespace

void FormatSignificant(double value, int digits, wchar_t (&text)[kNumberTextCapacity]) {
    CoreFormat(text, L"%.*G", digits < kDigitsLimit ? digits : kDigitsLimit, value);
}

double NumberFromText(const wchar_t* text) { return CoreNumber(text, nullptr); }

}  // namespace kor
