#include "address.h"

#include <gtest/gtest.h>

namespace workbook {
namespace {

TEST(Address, NamesTheColumns) {
    EXPECT_EQ(ColumnName(0), L"A");
    EXPECT_EQ(ColumnName(25), L"Z");
    EXPECT_EQ(ColumnName(26), L"AA");
    EXPECT_EQ(ColumnName(51), L"AZ");
    EXPECT_EQ(ColumnName(52), L"BA");
    EXPECT_EQ(ColumnName(255), L"IV");
    EXPECT_EQ(ColumnName(256), L"");
    EXPECT_EQ(ColumnName(-1), L"");
}

TEST(Address, FormatsCells) {
    EXPECT_EQ(FormatAddress({1, 3}), L"B4");
    EXPECT_EQ(FormatAddress({255, 16383}), L"IV16384");
    EXPECT_EQ(FormatAddress({256, 0}), L"");
    EXPECT_EQ(FormatAddress({0, 16384}), L"");
    EXPECT_EQ(FormatAddress({0, -1}), L"");
}

TEST(Address, FormatsBlocks) {
    EXPECT_EQ(FormatBlock({0, 0, 2, 2}), L"A1:C3");
    EXPECT_EQ(FormatBlock({1, 3, 1, 3}), L"B4");
    EXPECT_EQ(FormatBlock({1, 3, 1, 4}), L"B4:B5");
}

TEST(Address, ReadsEveryCellItWrites) {
    for (int column = 0; column < kColumnCount; ++column) {
        for (const int row : {0, 8, 9, 998, 16383}) {
            const CellAddress cell{column, row};
            EXPECT_EQ(ParseAddress(FormatAddress(cell)), cell);
        }
    }
}

TEST(Address, ReadsSmallLettersAndDollarSigns) {
    EXPECT_EQ(ParseAddress(L"b4"), (CellAddress{1, 3}));
    EXPECT_EQ(ParseAddress(L"$B$4"), (CellAddress{1, 3}));
    EXPECT_EQ(ParseAddress(L"$B4"), (CellAddress{1, 3}));
    EXPECT_EQ(ParseAddress(L"B$4"), (CellAddress{1, 3}));
    EXPECT_EQ(ParseAddress(L"B0004"), (CellAddress{1, 3}));
}

TEST(Address, RefusesOtherTexts) {
    for (const wchar_t* text : {L"", L"B", L"4", L"$", L"$4", L"B$", L"4B", L"B 4", L" B4", L"B4 ",
                                L"B4x", L"B-4", L"$$B4", L"B$$4", L"ABCD1", L"B4:C5", L"\u00C41"})
        EXPECT_EQ(ParseAddress(text), std::nullopt) << text;
}

TEST(Address, TellsCellsOutsideTheSheetFromOtherTexts) {
    for (const wchar_t* text :
         {L"IW1", L"ZZZ1", L"A16385", L"A0", L"A99999999999999999999", L"$IW$1"})
        EXPECT_EQ(ScanReference(text).syntax, ReferenceSyntax::OutsideSheet) << text;
    EXPECT_EQ(ScanReference(L"IV16384").syntax, ReferenceSyntax::Cell);
    EXPECT_EQ(ScanReference(L"TOTAL").syntax, ReferenceSyntax::NotAReference);
    EXPECT_EQ(ScanReference(L"YEAR1").syntax, ReferenceSyntax::NotAReference);
}

TEST(Address, ReadsBlocksWithCornersInAnyOrder) {
    const Block block{1, 2, 3, 4};
    for (const wchar_t* text : {L"B3:D5", L"D5:B3", L"B5:D3", L"D3:B5", L"$b$3:d5"})
        EXPECT_EQ(ParseBlock(text), block) << text;
    EXPECT_EQ(ParseBlock(L"B3"), (Block{1, 2, 1, 2}));
    for (const wchar_t* text : {L"", L":", L"B3:", L":B3", L"B3:D5:E6", L"B3:IW1"})
        EXPECT_EQ(ParseBlock(text), std::nullopt) << text;
}

TEST(Address, ClipsBlocksToTheSheet) {
    EXPECT_EQ(ClipToSheet({-5, -1, 3, 4}), (Block{0, 0, 3, 4}));
    EXPECT_EQ(ClipToSheet({250, 16000, 400, 20000}), (Block{250, 16000, 255, 16383}));
    EXPECT_EQ(ClipToSheet({256, 0, 300, 5}), std::nullopt);
    EXPECT_EQ(ClipToSheet({3, 0, 2, 5}), std::nullopt);
}

TEST(Address, FindsTheBlockBetweenTwoCorners) {
    EXPECT_EQ(BlockBetween({3, 1}, {1, 4}), (Block{1, 1, 3, 4}));
    EXPECT_TRUE(Contains({1, 1, 3, 4}, {3, 4}));
    EXPECT_FALSE(Contains({1, 1, 3, 4}, {3, 5}));
    EXPECT_FALSE(Contains({1, 1, 3, 4}, {0, 2}));
}

}  // namespace
}  // namespace workbook
