#include <algorithm>
#include <array>
#include <cmath>

#include "open_sheets.h"
#include "sheet_images.h"

namespace workbook {

namespace {

constexpr std::array<COLORREF, kSheetColours> kColours = {
    RGB(46, 125, 50),  RGB(21, 101, 192), RGB(198, 40, 40), RGB(239, 108, 0),
    RGB(106, 27, 154), RGB(0, 131, 143),  RGB(109, 76, 65), RGB(173, 20, 87)};

constexpr int kSteps = 20;  // shades that are looked at, from black to white

double Linear(int part) { return std::pow(part / 255.0, 2.2); }

// How bright a colour looks, from 0 to 1.
double Luminance(COLORREF colour) {
    return 0.2126 * Linear(GetRValue(colour)) + 0.7152 * Linear(GetGValue(colour)) +
           0.0722 * Linear(GetBValue(colour));
}

double Contrast(COLORREF one, COLORREF other) {
    // By value: of two temporaries std::minmax gives references that dangle.
    const auto [low, high] = std::minmax({Luminance(one), Luminance(other)});
    return (high + 0.05) / (low + 0.05);
}

// `step` runs from 0, black, over kSteps / 2, the colour itself, to kSteps, white.
COLORREF Shade(COLORREF colour, int step) {
    const auto part = [step](int value) {
        constexpr int kHalf = kSteps / 2;
        if (step <= kHalf) return value * step / kHalf;
        return value + (255 - value) * (step - kHalf) / kHalf;
    };
    return RGB(part(GetRValue(colour)), part(GetGValue(colour)), part(GetBValue(colour)));
}

}  // namespace

COLORREF SheetColour(int colour) { return kColours[static_cast<size_t>(colour)]; }

COLORREF ReadableSheetColour(int colour, COLORREF menu, COLORREF highlight) {
    const auto worst = [&](COLORREF shade) {
        return std::min(Contrast(shade, menu), Contrast(shade, highlight));
    };
    COLORREF best = SheetColour(colour);
    for (int step = 0; step <= kSteps; ++step) {
        const COLORREF shade = Shade(SheetColour(colour), step);
        if (worst(shade) > worst(best)) best = shade;
    }
    return best;
}

}  // namespace workbook
