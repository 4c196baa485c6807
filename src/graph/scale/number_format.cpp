#include "graph/scale/number_format.h"

#include <string.h>
#include <wchar.h>

namespace kor {

namespace {

// Platforms print exponents with two or three digits. Removes the first of three if it is 0.
void ShortenExponent(wchar_t* text) {
    wchar_t* exponent = wcschr(text, L'E');
    if (!exponent) return;
    ++exponent;
    if (*exponent == L'-' || *exponent == L'+') ++exponent;
    const size_t digits = wcslen(exponent);
    if (*exponent == L'0' && digits >= 3) memmove(exponent, exponent + 1, digits * sizeof(wchar_t));
}

}  // namespace

int FormatGraphNumber(double value, wchar_t* buffer, int precision) {
    if (!buffer) return 0;
    wchar_t text[kNumberTextCapacity];
    FormatSignificant(value, precision, text);
    ShortenExponent(text);
    memcpy(buffer, text, (wcslen(text) + 1) * sizeof(wchar_t));
    return 1;
}

}  // namespace kor
