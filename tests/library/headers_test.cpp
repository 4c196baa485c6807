// The public headers where C, old C++ and today's C++ meet. Most checks are made by the compiler,
// in headers_c90.c.
#include <korcontrols/funkybar.h>
#include <korcontrols/graph.h>
#include <korcontrols/grid.h>
#include <korcontrols/header.h>
#include <korcontrols/legend.h>
#include <korcontrols/listhelpers.h>
#include <korcontrols/tooltip.h>

#include <gtest/gtest.h>

#include <string>

extern "C" DWORD sizesSeenByC(void);
DWORD sizesSeenByOldCpp();

namespace {

TEST(PublicHeaders, GiveEveryLanguageTheSameSizes) {
    const auto expected = static_cast<DWORD>(8 << 16 | 2 * sizeof(void*));
    EXPECT_EQ(sizesSeenByC(), expected);
    EXPECT_EQ(sizesSeenByOldCpp(), expected);
    EXPECT_EQ(sizeof(GridSelection) << 16 | sizeof(HeaderItemDesc), expected);
}

TEST(PublicHeaders, NameTheClasses) {
    EXPECT_EQ(std::wstring(KORGRID_CLASS), L"KV Grid Control");
    EXPECT_EQ(std::wstring(KORHEADER_CLASS), L"korvane Header");
    EXPECT_EQ(std::wstring(KORGRAPH_CLASS), L"KORVANE Corporation GraphControl");
    EXPECT_EQ(std::wstring(KORLEGEND_CLASS), L"KORVANE Corporation LegendControl");
    EXPECT_EQ(std::wstring(KORTOOLTIP_CLASS), L"KORVANE Corporation ToolTipControl");
    EXPECT_EQ(std::wstring(KORFUNKYBAR_CLASS), L"FunkyBarControl");
}

}  // namespace
