#include "platform/number_text.h"

#include <wchar.h>

namespace kor {

void FormatSignificant(double value, int digits, wchar_t (&text)[kNumberTextCapacity]) {
    _snwprintf(text, kNumberTextCapacity, L"%.*G", digits, value);
    text[kNumberTextCapacity - 1] = L'\0';
}

// Parsed by the platform's runtime: the compiler would replace wcstod with its own.
double NumberFromText(const wchar_t* text) { return _wtof(text); }

}  // namespace kor
