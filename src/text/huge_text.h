// Texts whose letters are larger than what they are drawn on. Making their pixels takes the
// platform seconds, and nearly always none of them is to be seen.
#pragma once

#include "platform/platform.h"

namespace kor {

// Whether a text in the selected font, its upper left corner at `at`, may have a drawn pixel inside
// `surface`. False is certain: the same text in a small font keeps clear of that part of it, by
// more than letters change with their size. Always true for fonts of a usual size.
bool MayShowInk(HDC dc, const wchar_t* text, int length, POINT at, const RECT& surface);

// What such a text leaves on `area`: its background, where the DC draws one.
void DrawTextBackground(HDC dc, POINT at, int width, const RECT& area);

}  // namespace kor
