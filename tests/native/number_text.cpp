// Numbers as text by this machine's own runtime.
#include "platform/number_text.h"

#include <cwchar>

namespace kor {

void FormatSignificant(double value, int digits, wchar_t (&text)[kNumberTextCapacity]) {
    std::swprintf(text, kNumberTextCapacity, L"%.*G", digits, value);
}

double NumberFromText(const wchar_t* text) { return std::wcstod(text, nullptr); }

}  // namespace kor
