// Number formatting and parsing by the core library. Its swprintf takes no capacity, unlike the one
// that the headers declare, and the headers replace its wcstod. So both are declared here by their
// symbol names.
#include "platform/number_text.h"

namespace kor {

namespace {

extern "C" {
int CoreFormat(wchar_t* text, const wchar_t* format, ...) __asm__("swprintf");
double CoreNumber(const wchar_t* text, wchar_t** rest) __asm__("wcstod");
}

// Leaves room for a sign, a point, "E", a signed exponent of three digits and the terminator.
constexpr int kDigitsLimit = kNumberTextCapacity - 8;

}  // namespace

void FormatSignificant(double value, int digits, wchar_t (&text)[kNumberTextCapacity]) {
    CoreFormat(text, L"%.*G", digits < kDigitsLimit ? digits : kDigitsLimit, value);
}

double NumberFromText(const wchar_t* text) { return CoreNumber(text, nullptr); }

}  // namespace kor
