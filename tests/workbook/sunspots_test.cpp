// The data file that comes with the workbook.
#include "document.h"
#include "survey.h"

#include "sheet_support.h"
#include "temporary_folder.h"

#include <gtest/gtest.h>

namespace workbook {
namespace {

const std::wstring kPath = WORKBOOK_DATA L"/sunspots.csv";

TEST(Sunspots, OpensWithHeadingsAndMeans) {
    Document document;
    const auto problem = document.open(kPath);
    ASSERT_FALSE(problem) << problem->message;
    const Sheet& sheet = document.sheet();
    EXPECT_EQ(sheet.extent(), (SheetExtent{14, 266}));
    EXPECT_TRUE(FirstRowIsHeader(sheet));
    EXPECT_EQ(Show(sheet, L"A1"), L"Year");
    EXPECT_EQ(Show(sheet, L"A2"), L"1749");
    EXPECT_EQ(Show(sheet, L"B2"), L"58");
    EXPECT_EQ(Show(sheet, L"N2"), L"80.925");
    EXPECT_EQ(Show(sheet, L"N266"), L"58.05555556");  // nine months
    EXPECT_EQ(SurveyBlock(sheet, BlockAt(L"B2:M266")).numbers, 3177u);
    EXPECT_EQ(SurveyBlock(sheet, BlockAt(L"N2:N266")).numbers, 265u);
}

TEST(Sunspots, ComesOutByteForByteWhenSaved) {
    const TemporaryFolder folder;
    Document document;
    ASSERT_FALSE(document.open(kPath));
    EXPECT_EQ(Show(document.sheet(), L"N2"), L"80.925");
    ASSERT_FALSE(document.save(folder.at(L"copy.csv")));
    const FileContents original = ReadWholeFile(kPath, kLargestFile);
    ASSERT_FALSE(original.problem);
    EXPECT_GT(original.bytes.size(), 20000u);
    EXPECT_TRUE(folder.get(L"copy.csv") == original.bytes);
}

TEST(Sunspots, ComesOutByteForByteAfterAnEditIsUndone) {
    const TemporaryFolder folder;
    Document document;
    ASSERT_FALSE(document.open(kPath));
    document.clear(BlockAt(L"A100:N266"));
    document.setCell(At(L"Z400"), L"far away");
    document.undo();
    document.undo();
    EXPECT_FALSE(document.isModified());
    ASSERT_FALSE(document.save(folder.at(L"copy.csv")));
    EXPECT_TRUE(folder.get(L"copy.csv") == ReadWholeFile(kPath, kLargestFile).bytes);
}

}  // namespace
}  // namespace workbook
