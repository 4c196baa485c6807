#include "utf8.h"

#include <gtest/gtest.h>

namespace workbook {
namespace {

std::wstring Wide(std::string_view bytes) {
    std::wstring text;
    AppendUtf16(text, bytes);
    return text;
}

std::string Narrow(std::wstring_view text) {
    std::string bytes;
    AppendUtf8(bytes, text);
    return bytes;
}

constexpr wchar_t kHigh = 0xD83D;
constexpr wchar_t kLow = 0xDE00;

TEST(Utf8, ReadsSequencesOfEveryLength) {
    EXPECT_EQ(Wide("A\xC3\xA9\xE2\x82\xAC"), L"A\u00E9\u20AC");
    EXPECT_EQ(Wide("\xF0\x9F\x98\x80"), (std::wstring{kHigh, kLow}));
    EXPECT_EQ(Wide(""), L"");
}

TEST(Utf8, WritesSequencesOfEveryLength) {
    EXPECT_EQ(Narrow(L"A\u00E9\u20AC"), "A\xC3\xA9\xE2\x82\xAC");
    EXPECT_EQ(Narrow(std::wstring{kHigh, kLow}), "\xF0\x9F\x98\x80");
}

TEST(Utf8, ReplacesHalfSurrogatePairs) {
    EXPECT_EQ(Narrow(std::wstring{kHigh}), "\xEF\xBF\xBD");
    EXPECT_EQ(Narrow(std::wstring{kLow, kHigh, L'x'}), "\xEF\xBF\xBD\xEF\xBF\xBDx");
}

TEST(Utf8, ComesBackForEveryCodePoint) {
    for (unsigned code = 1; code <= 0x10FFFF; code += code < 0x11000 ? 1 : 97) {
        if (code >= 0xD800 && code <= 0xDFFF) continue;
        std::wstring text;
        if (code < 0x10000) {
            text = static_cast<wchar_t>(code);
        } else {
            text = static_cast<wchar_t>(0xD800 + ((code - 0x10000) >> 10));
            text += static_cast<wchar_t>(0xDC00 + ((code - 0x10000) & 0x3FF));
        }
        const std::string bytes = Narrow(text);
        ASSERT_EQ(FindInvalidUtf8(bytes), std::nullopt) << code;
        ASSERT_EQ(Wide(bytes), text) << code;
    }
}

TEST(Utf8, AcceptsTheEdgesOfEachLength) {
    for (const char* bytes :
         {"\x7F", "\xC2\x80", "\xDF\xBF", "\xE0\xA0\x80", "\xED\x9F\xBF", "\xEE\x80\x80",
          "\xEF\xBF\xBF", "\xF0\x90\x80\x80", "\xF4\x8F\xBF\xBF"})
        EXPECT_EQ(FindInvalidUtf8(bytes), std::nullopt) << bytes;
}

TEST(Utf8, FindsWhereInvalidBytesBegin) {
    EXPECT_EQ(FindInvalidUtf8("ab\xFFz"), 2u);
    EXPECT_EQ(FindInvalidUtf8("ab\x80"), 2u);  // continuation without a beginning
    EXPECT_EQ(FindInvalidUtf8("a\xC3"), 1u);   // cut off at the end
    EXPECT_EQ(FindInvalidUtf8("a\xE2\x82"), 1u);
    EXPECT_EQ(FindInvalidUtf8("\xC3(z"), 0u);    // continuation missing
    EXPECT_EQ(FindInvalidUtf8("\xC0\xAF"), 0u);  // overlong
    EXPECT_EQ(FindInvalidUtf8("\xE0\x9F\xBF"), 0u);
    EXPECT_EQ(FindInvalidUtf8("\xF0\x8F\xBF\xBF"), 0u);
    EXPECT_EQ(FindInvalidUtf8("\xC3\xA9\xED\xA0\x80"), 2u);  // a surrogate
    EXPECT_EQ(FindInvalidUtf8("\xF4\x90\x80\x80"), 0u);      // above 10FFFF
    EXPECT_EQ(FindInvalidUtf8("\xF5\x80\x80\x80"), 0u);
}

}  // namespace
}  // namespace workbook
