#include "csv_separator.h"

#include <gtest/gtest.h>

#include <string>

namespace workbook {
namespace {

TEST(CsvSeparator, FindsTheOnlyOne) {
    EXPECT_EQ(DetectSeparator("a,b\nc,d\n"), ',');
    EXPECT_EQ(DetectSeparator("a;b\nc;d\n"), ';');
    EXPECT_EQ(DetectSeparator("a\tb\nc\td\n"), '\t');
    EXPECT_EQ(DetectSeparator("a b\nc d\n"), std::nullopt);
    EXPECT_EQ(DetectSeparator(""), std::nullopt);
}

TEST(CsvSeparator, LooksOutsideQuotesOnly) {
    EXPECT_EQ(DetectSeparator("\"a,b,c\";\"d,e,f\"\n"), ';');
    EXPECT_EQ(DetectSeparator("\"a,b\"\n\"c\"\"d,e\"\n"), std::nullopt);
    EXPECT_EQ(DetectSeparator("\"a\n,b,\n,c\";d\n"), ';');
    EXPECT_EQ(DetectSeparator("5\" disk;a,b\n6\" disk;c\n"), ';');  // no quoted field
}

TEST(CsvSeparator, PrefersTheOneThatLinesAgreeOn) {
    EXPECT_EQ(DetectSeparator("name;remark\nx;one, two, three\ny;none\n"), ';');
    EXPECT_EQ(DetectSeparator("name,remark\nx,one; two; three\ny,none\n"), ',');
    EXPECT_EQ(DetectSeparator("A title, with a comma\na\tb\n1\t2\n"), '\t');
}

TEST(CsvSeparator, TakesCommasBetweenDigitsForDecimalOnes) {
    EXPECT_EQ(DetectSeparator("1,5;2,5;3,5\n4,5;5,5;6,5\n"), ';');
    EXPECT_EQ(DetectSeparator("1,5\t2,5\n4,5\t5,5\n"), '\t');
    EXPECT_EQ(DetectSeparator("1,5\n4,5\n"), ',');
}

TEST(CsvSeparator, PrefersMoreFieldsOtherwise) {
    EXPECT_EQ(DetectSeparator("a,b,c;d\ne,f,g;h\n"), ',');
    EXPECT_EQ(DetectSeparator("a;b;c,d\ne;f;g,h\n"), ';');
}

TEST(CsvSeparator, PassesOverLinesWithoutAny) {
    std::string bytes;
    for (int line = 0; line < 1000; ++line) bytes += "remark\n";
    EXPECT_EQ(DetectSeparator(bytes + "a;b\n"), ';');
}

}  // namespace
}  // namespace workbook
