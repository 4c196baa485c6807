#include "text/zoomed_font.h"
#include "zoom/zoom.h"

#include <gtest/gtest.h>

namespace kor {
namespace {

TEST(ZoomedFont, KeepsEverythingButHeightAndWidth) {
    LOGFONTW description{};
    description.lfHeight = -20;
    description.lfWidth = 9;
    description.lfWeight = FW_BOLD;
    description.lfUnderline = 1;
    lstrcpyW(description.lfFaceName, L"Arial");
    HFONT font = CreateFontIndirectW(&description);
    zoomLevel = 6;
    HFONT zoomed = CreateZoomedFont(font);
    zoomLevel = 4;
    LOGFONTW result{};
    ASSERT_NE(GetObjectW(zoomed, sizeof result, &result), 0);
    EXPECT_EQ(result.lfHeight, -30);
    EXPECT_EQ(result.lfWidth, 0);
    EXPECT_EQ(result.lfWeight, FW_BOLD);
    EXPECT_EQ(result.lfUnderline, 1);
    EXPECT_STREQ(result.lfFaceName, L"Arial");
    DeleteObject(zoomed);
    DeleteObject(font);
}

TEST(ZoomedFont, IsNoneWithoutAFont) { EXPECT_EQ(CreateZoomedFont(nullptr), nullptr); }

}  // namespace
}  // namespace kor
