#include "sheet_images.h"

#include <gtest/gtest.h>

#include <cmath>
#include <set>

namespace workbook {
namespace {

double Linear(int part) { return std::pow(part / 255.0, 2.2); }

double Brightness(COLORREF colour) {
    return 0.2126 * Linear(GetRValue(colour)) + 0.7152 * Linear(GetGValue(colour)) +
           0.0722 * Linear(GetBValue(colour));
}

double Contrast(COLORREF one, COLORREF other) {
    const double ratio = (Brightness(one) + 0.05) / (Brightness(other) + 0.05);
    return ratio < 1 ? 1 / ratio : ratio;
}

constexpr COLORREF kLightMenu = RGB(240, 240, 240);
constexpr COLORREF kDarkBlue = RGB(0, 0, 128);
constexpr COLORREF kMiddleBlue = RGB(0, 120, 215);

TEST(SheetColours, AreDifferentOnes) {
    std::set<COLORREF> colours;
    for (int colour = 0; colour < kSheetColours; ++colour) colours.insert(SheetColour(colour));
    EXPECT_EQ(colours.size(), static_cast<size_t>(kSheetColours));
}

TEST(SheetColours, CanBeReadOnTheMenuAndOnItsHighlight) {
    for (int colour = 0; colour < kSheetColours; ++colour) {
        for (const COLORREF highlight : {kDarkBlue, kMiddleBlue}) {
            const COLORREF shade = ReadableSheetColour(colour, kLightMenu, highlight);
            EXPECT_GT(Contrast(shade, kLightMenu), 2.5) << colour;
            EXPECT_GT(Contrast(shade, highlight), 2.5) << colour;
        }
    }
}

TEST(SheetColours, BecomeTheShadeThatIsReadBest) {
    for (int colour = 0; colour < kSheetColours; ++colour) {
        const COLORREF black = RGB(0, 0, 0);
        const COLORREF white = RGB(255, 255, 255);
        EXPECT_EQ(ReadableSheetColour(colour, black, black), white) << colour;
        EXPECT_EQ(ReadableSheetColour(colour, white, white), black) << colour;
    }
}

TEST(SheetColours, KeepTheirHueWhenTheyAreMadeReadable) {
    const COLORREF green = ReadableSheetColour(0, kLightMenu, kDarkBlue);
    EXPECT_GT(GetGValue(green), GetRValue(green));
    EXPECT_GT(GetGValue(green), GetBValue(green));
}

}  // namespace
}  // namespace workbook
