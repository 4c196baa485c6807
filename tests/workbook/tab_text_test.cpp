#include "tab_text.h"

#include <gtest/gtest.h>

namespace workbook {
namespace {

using Rows = std::vector<TextRow>;

TEST(TabText, SeparatesCellsByTabsAndEndsEachLine) {
    EXPECT_EQ(WriteTabText({{L"a", L"b"}, {L"1", L""}}), L"a\tb\r\n1\t\r\n");
    EXPECT_EQ(WriteTabText({}), L"");
}

TEST(TabText, QuotesWhatWouldBeReadAsSomethingElse) {
    EXPECT_EQ(WriteTabText({{L"a\tb", L"c\nd", L"e\rf"}}), L"\"a\tb\"\t\"c\nd\"\t\"e\rf\"\r\n");
    EXPECT_EQ(WriteTabText({{L"say \"so\"", L"\"", L"a, b"}}),
              L"\"say \"\"so\"\"\"\t\"\"\"\"\ta, b\r\n");
}

TEST(TabText, ReadsLinesOfAnyProgram) {
    const Rows expected = {{L"a", L"b"}, {L"c", L"d"}};
    EXPECT_EQ(ReadTabText(L"a\tb\r\nc\td\r\n"), expected);
    EXPECT_EQ(ReadTabText(L"a\tb\nc\td\n"), expected);
    EXPECT_EQ(ReadTabText(L"a\tb\rc\td\r"), expected);
    EXPECT_EQ(ReadTabText(L"a\tb\nc\td"), expected);  // the last line need not end
}

TEST(TabText, ReadsEmptyCellsAndRowsOfDifferentLengths) {
    EXPECT_EQ(ReadTabText(L"\t\na\n\n\tb\n"), (Rows{{L"", L""}, {L"a"}, {L""}, {L"", L"b"}}));
    EXPECT_EQ(ReadTabText(L""), Rows{});
}

TEST(TabText, TakesQuotesForQuotesOnlyAroundAWholeCell) {
    EXPECT_EQ(ReadTabText(L"\"a\tb\"\tc"), (Rows{{L"a\tb", L"c"}}));
    EXPECT_EQ(ReadTabText(L"say \"so\"\tx"), (Rows{{L"say \"so\"", L"x"}}));
    EXPECT_EQ(ReadTabText(L"\"a\"b\tc"), (Rows{{L"\"a\"b", L"c"}}));
}

TEST(TabText, TakesAQuoteThatIsNeverClosedForItself) {
    EXPECT_EQ(ReadTabText(L"\"a\tb\nc"), (Rows{{L"\"a", L"b"}, {L"c"}}));
    EXPECT_EQ(ReadTabText(L"\""), (Rows{{L"\""}}));
}

}  // namespace
}  // namespace workbook
