#include "zoom/zoom.h"

#include <gtest/gtest.h>

namespace kor {
namespace {

TEST(Zoom, Is100PercentAtLoad) { EXPECT_EQ(zoomLevel, 4u); }

TEST(Zoom, ScalesUnitsInQuarters) {
    EXPECT_EQ(PixelsFromUnits(60, 4), 60);
    EXPECT_EQ(PixelsFromUnits(60, 2), 30);
    EXPECT_EQ(PixelsFromUnits(60, 8), 120);
    EXPECT_EQ(PixelsFromUnits(16, 3), 12);
    EXPECT_EQ(PixelsFromUnits(0, 5), 0);
}

TEST(Zoom, CutsPartsOfAPixelOff) {
    EXPECT_EQ(PixelsFromUnits(81, 2), 40);
    EXPECT_EQ(PixelsFromUnits(7, 1), 1);
    EXPECT_EQ(PixelsFromUnits(3, 1), 0);
    EXPECT_EQ(PixelsFromUnits(5, 3), 3);
}

TEST(Zoom, KeepsSixteenBits) {
    EXPECT_EQ(PixelsFromUnits(65535, 4), 65535);
    EXPECT_EQ(PixelsFromUnits(40000, 8), static_cast<uint16_t>(80000));
}

TEST(Zoom, MakesAColumnHeaderAsHighAsARow) {
    EXPECT_EQ(HeaderHeightAt(4), 16);
    EXPECT_EQ(HeaderHeightAt(1), 4);
    EXPECT_EQ(HeaderHeightAt(8), 32);
    EXPECT_LE(HeaderHeightAt(0xFFFFFFFF), 0x7FFF);
    EXPECT_GT(HeaderHeightAt(0xFFFFFFFF), 0);
}

TEST(Zoom, ScalesACharacterHeight) {
    EXPECT_EQ(ZoomedFontHeight(-16, 2), -8);
    EXPECT_EQ(ZoomedFontHeight(-16, 4), -16);
    EXPECT_EQ(ZoomedFontHeight(-16, 8), -32);
    EXPECT_EQ(ZoomedFontHeight(-13, 3), -9);   // -9.75
    EXPECT_EQ(ZoomedFontHeight(-13, 5), -16);  // -16.25
    EXPECT_EQ(ZoomedFontHeight(-3, 1), 0);
}

TEST(Zoom, TurnsALineHeightIntoACharacterHeight) {
    EXPECT_EQ(ZoomedFontHeight(16, 2), -8);
    EXPECT_EQ(ZoomedFontHeight(13, 3), -9);
    EXPECT_EQ(ZoomedFontHeight(3, 1), 0);
    EXPECT_EQ(ZoomedFontHeight(0, 8), 0);
}

TEST(Zoom, SurvivesAbsurdLevels) {
    EXPECT_LT(ZoomedFontHeight(-16, 0xFFFFFFFF), 0);
    EXPECT_LT(ZoomedFontHeight(0x7FFFFFFF, 0xFFFFFFFF), 0);
}

}  // namespace
}  // namespace kor
