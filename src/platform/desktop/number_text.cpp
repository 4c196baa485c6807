#include "platform/number_text.h"

#include <wchar.h>

namespace kor {

void FormatSignificant(double value, int digits, wchar_t (&text)[kNumberTextCapacity]) {
    _snwprintf(text, kNumberTextCapacity, L"%.*G", digits, value);
    text[kNumberTextCapacity - 1] = L'\0';
}

// The runtime's own reading: the compiler would put its replacement in place of wcstod.
double NumberFromText(const wchar_t* text) { return _wtof(text); }

}  // namespace kor
