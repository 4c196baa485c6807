// Numbers on their way into a DC, drawn with the pixels of DrawTextW in half its time.
//
// Numbers consist of few characters, whose widths are asked for once per font. After that a number
// needs no measuring: one call draws it, and is told where each character stands, so that the
// platform need not measure either.
#pragma once

#include <iterator>

#include "platform/platform.h"

namespace kor {

// Exponents are rare, and not every platform draws their letter as wide as it measures it.
constexpr wchar_t kNumberCharacters[] = L"0123456789-.%";
constexpr int kNumberCharacterCount = static_cast<int>(std::size(kNumberCharacters)) - 1;

// Widths of those characters in one font on one device, in pixels. As plain zeros it knows none,
// and numbers are drawn as any other text.
struct NumberWidths {
    int32_t known;    // 0 or 1
    int32_t stencil;  // 1: a pixel of a text has the text's colour or is left alone
    INT widths[kNumberCharacterCount];
};

// None known when the device does not tell, or does not draw characters as wide as it measures
// them. The device is a display, or a memory DC like one.
NumberWidths MeasureNumberCharacters(HDC dc, HFONT font);

// Draws a zero-terminated text in the font that is selected and that `widths` is of, clipped to the
// area. The format is DT_LEFT, DT_CENTER or DT_RIGHT.
void DrawNumberText(HDC dc, const NumberWidths& widths, const wchar_t* text, const RECT& area,
                    UINT format);

}  // namespace kor
