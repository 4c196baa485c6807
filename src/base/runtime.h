// The C runtime functions that the library uses. All of them are exports of the platform's own
// runtime (the core library on Windows CE, msvcrt on the desktop), never the compiler's
// replacements.
#pragma once

#include <stdlib.h>
#include <string.h>
#include <wchar.h>

namespace kor {

// Room for the decimal digits of any 32-bit integer, its sign and the terminator.
constexpr int kDecimalCapacity = 12;

inline long DecimalValue(const wchar_t* text) { return _wtol(text); }

inline void FormatDecimal(int value, wchar_t (&text)[kDecimalCapacity]) { _itow(value, text, 10); }

}  // namespace kor
