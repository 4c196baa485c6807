// Draws numbers with the pixels of DrawTextW in half its time.
//
// Numbers consist of few characters, whose widths are measured once per font. After that a single
// call draws a number. It is given the width of each character, so the platform need not measure
// either.
#pragma once

#include <iterator>

#include "platform/platform.h"

namespace kor {

// Without the "E" of exponents: it is rare, and not every platform draws it as wide as it measures
// it.
constexpr wchar_t kNumberCharacters[] = L"0123456789-.%";
constexpr int kNumberCharacterCount = static_cast<int>(std::size(kNumberCharacters)) - 1;

// Widths of those characters in one font on one device, in pixels. All zeros: no width is known,
// and numbers are drawn like any other text.
struct NumberWidths {
    int32_t known;    // 0 or 1
    int32_t stencil;  // 1: each pixel of a text has the text's colour or is left alone
    INT widths[kNumberCharacterCount];
};

// Measures the widths. None is known when the device does not report them, or does not draw
// characters as wide as it measures them. The device is a display, or a memory DC compatible with
// one.
NumberWidths MeasureNumberCharacters(HDC dc, HFONT font);

// Draws a zero-terminated text in the selected font, the one that `widths` was measured with,
// clipped to the area. The format is DT_LEFT, DT_CENTER or DT_RIGHT.
void DrawNumberText(HDC dc, const NumberWidths& widths, const wchar_t* text, const RECT& area,
                    UINT format);

}  // namespace kor
