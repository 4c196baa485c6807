// The two colour tables and who takes which entry.
#include "graph/data/palette.h"

#include <gtest/gtest.h>

#include <climits>
#include <iterator>

namespace kortest {
namespace {

// Entry 20 lies behind the table.
constexpr COLORREF kColours[] = {0x000000, 0xFFFFFF, 0x0000FF, 0x00FF00, 0xFF0000, 0x00FFFF,
                                 0xFF00FF, 0xFFFF00, 0x000080, 0x008000, 0x800000, 0x008080,
                                 0x800080, 0x808000, 0x8080FF, 0x80FF80, 0xFF8080, 0x808080,
                                 0xC0C0C0, 0x000000, 0x000000};

class GraphPalette : public ::testing::Test {
protected:
    GraphPalette() {
        const HDC screen = GetDC(nullptr);
        kor::ChoosePalette(screen);
        ReleaseDC(nullptr, screen);
    }
};

TEST_F(GraphPalette, HasItsColours) {
    for (int i = 0; i < 20; ++i) EXPECT_EQ(kor::PaletteEntry(i), kColours[i]) << i;
}

TEST_F(GraphPalette, Entry20BehindTheTableIsBlack) { EXPECT_EQ(kor::PaletteEntry(20), 0x000000u); }

TEST_F(GraphPalette, HasNothingElse) {
    for (int index = -40; index < 0; ++index) EXPECT_EQ(kor::PaletteEntry(index), 0u) << index;
    for (int index = 21; index < 60; ++index) EXPECT_EQ(kor::PaletteEntry(index), 0u) << index;
    for (const int index : {INT_MIN, INT_MAX}) EXPECT_EQ(kor::PaletteEntry(index), 0u);
}

TEST_F(GraphPalette, FirstSeriesIsGreen) { EXPECT_EQ(kor::ColourOfSeriesNumber(1), 0x00FF00u); }

TEST_F(GraphPalette, SeriesTakeTheNextEntryEach) {
    for (int count = 1; count <= 18; ++count)
        EXPECT_EQ(kor::ColourOfSeriesNumber(count), kColours[count + 2]) << count;
}

TEST_F(GraphPalette, EighteenthSeriesTakesEntry20) {
    EXPECT_EQ(kor::ColourOfSeriesNumber(18), 0x000000u);
}

TEST_F(GraphPalette, NineteenthSeriesTakesTheFirstSeriesEntry) {
    EXPECT_EQ(kor::ColourOfSeriesNumber(19), 0x0000FFu);
    EXPECT_EQ(kor::ColourOfSeriesNumber(20), 0x00FF00u);
}

TEST_F(GraphPalette, FirstSliceIsRed) { EXPECT_EQ(kor::SliceColour(0), 0x0000FFu); }

TEST_F(GraphPalette, FifteenSlicesHaveColoursOfTheirOwn) {
    for (int slice = 0; slice < 15; ++slice)
        EXPECT_EQ(kor::SliceColour(slice), kColours[slice + 2]) << slice;
}

TEST_F(GraphPalette, SixteenthSliceHasTheColourOfTheFirst) {
    EXPECT_EQ(kor::SliceColour(15), 0x0000FFu);
    EXPECT_EQ(kor::SliceColour(16), 0x00FF00u);
    EXPECT_EQ(kor::SliceColour(30), 0x0000FFu);
}

}  // namespace
}  // namespace kortest
