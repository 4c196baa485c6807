// Texts whose letters are larger than the surface they are drawn on. Rasterising them takes the
// platform seconds, and nearly always none of their pixels is visible.
#pragma once

#include "platform/platform.h"

namespace kor {

// Whether a text in the selected font, its upper left corner at `at`, may draw a pixel inside
// `surface`. False is certain: the same text in a small font stays clear of the corresponding area,
// by more than letter shapes change with their size. Always true for fonts of ordinary size.
bool MayShowInk(HDC dc, const wchar_t* text, int length, POINT at, const RECT& surface);

// Draws what such a text leaves on `area`: its background, if the DC draws one.
void DrawTextBackground(HDC dc, POINT at, int width, const RECT& area);

}  // namespace kor
