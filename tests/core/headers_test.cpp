// The public headers where C, old C++ and today's C++ meet. Most checks are made by the compiler,
// in headers_c90.c.
#include <korcontrols/grid.h>
#include <korcontrols/header.h>

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
}

}  // namespace
