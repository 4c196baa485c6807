#include "open_sheets.h"

#include "sheet_support.h"
#include "temporary_folder.h"

#include <gtest/gtest.h>

#include <set>

namespace workbook {
namespace {

using Names = std::vector<std::wstring>;

Names NamesOf(const OpenSheets& sheets) {
    Names names;
    for (size_t index = 0; index < sheets.count(); ++index) {
        names.push_back(sheets.at(index).document.name());
    }
    return names;
}

class OpenSheets : public testing::Test {
protected:
    // A sheet that was opened from a file of this name.
    std::unique_ptr<OpenSheet> opened(const std::wstring& name) {
        folder.put(name, "1,2\r\n");
        auto sheet = std::make_unique<OpenSheet>();
        EXPECT_FALSE(sheet->document.open(folder.at(name)));
        return sheet;
    }

    TemporaryFolder folder;
    workbook::OpenSheets sheets;
};

TEST_F(OpenSheets, BeginWithOneNewSheet) {
    EXPECT_EQ(NamesOf(sheets), (Names{L"Untitled"}));
    EXPECT_EQ(sheets.currentIndex(), 0u);
    EXPECT_FALSE(sheets.current().document.isModified());
}

TEST_F(OpenSheets, NumberTheNewOnesWithTheLeastFreeNumber) {
    sheets.addNew();
    sheets.addNew();
    EXPECT_EQ(NamesOf(sheets), (Names{L"Untitled", L"Untitled 2", L"Untitled 3"}));
    EXPECT_EQ(sheets.currentIndex(), 2u);

    sheets.select(1);
    sheets.closeCurrent();
    sheets.addNew();
    EXPECT_EQ(NamesOf(sheets), (Names{L"Untitled", L"Untitled 3", L"Untitled 2"}));
}

TEST_F(OpenSheets, GiveTheNumberOfASavedSheetToAnother) {
    sheets.current().document.setCell(At(L"A1"), L"1");
    ASSERT_FALSE(sheets.current().document.save(folder.at(L"saved.csv")));
    sheets.addNew();
    EXPECT_EQ(NamesOf(sheets), (Names{L"saved.csv", L"Untitled"}));
}

TEST_F(OpenSheets, PutAFileInThePlaceOfAnUntouchedNewSheet) {
    sheets.add(opened(L"one.csv"));
    EXPECT_EQ(NamesOf(sheets), (Names{L"one.csv"}));
    sheets.add(opened(L"two.csv"));
    EXPECT_EQ(NamesOf(sheets), (Names{L"one.csv", L"two.csv"}));
    EXPECT_EQ(sheets.currentIndex(), 1u);
}

TEST_F(OpenSheets, KeepANewSheetThatWasTouched) {
    sheets.current().document.setCell(At(L"A1"), L"1");
    sheets.current().document.undo();  // unmodified, but there is something to redo
    sheets.add(opened(L"one.csv"));
    EXPECT_EQ(NamesOf(sheets), (Names{L"Untitled", L"one.csv"}));
}

TEST_F(OpenSheets, KeepAnUntouchedNewSheetThatIsNotCurrent) {
    sheets.add(opened(L"one.csv"));
    sheets.addNew();
    sheets.select(0);
    sheets.add(opened(L"two.csv"));
    EXPECT_EQ(NamesOf(sheets), (Names{L"one.csv", L"Untitled", L"two.csv"}));
}

TEST_F(OpenSheets, FindASheetByItsFileInWhateverLetters) {
    sheets.add(opened(L"one.csv"));
    sheets.add(opened(L"two.csv"));
    EXPECT_EQ(sheets.find(folder.at(L"TWO.csv")), 1u);
    EXPECT_EQ(sheets.find(folder.at(L"three.csv")), std::nullopt);
    sheets.addNew();
    EXPECT_EQ(sheets.find(L""), std::nullopt);  // unnamed sheets have no file in common
}

TEST_F(OpenSheets, ShowTheNextSheetWhenOneIsClosed) {
    sheets.add(opened(L"one.csv"));
    sheets.add(opened(L"two.csv"));
    sheets.add(opened(L"three.csv"));
    sheets.select(1);
    sheets.closeCurrent();
    EXPECT_EQ(sheets.current().document.name(), L"three.csv");
    sheets.closeCurrent();
    EXPECT_EQ(sheets.current().document.name(), L"one.csv");
}

TEST_F(OpenSheets, AreNeverNone) {
    sheets.add(opened(L"one.csv"));
    sheets.closeCurrent();
    EXPECT_EQ(NamesOf(sheets), (Names{L"Untitled"}));
    EXPECT_TRUE(sheets.current().document.sheet().isEmpty(At(L"A1")));
}

TEST_F(OpenSheets, HaveDifferentColoursAsLongAsThereAreAny) {
    for (int i = 1; i < kSheetColours; ++i) sheets.addNew();
    std::set<int> colours;
    for (size_t index = 0; index < sheets.count(); ++index) {
        colours.insert(sheets.at(index).colour);
    }
    EXPECT_EQ(colours.size(), static_cast<size_t>(kSheetColours));

    // The colour of a closed sheet is free again; with all in use the first one comes again.
    sheets.select(3);
    const int closed = sheets.current().colour;
    sheets.closeCurrent();
    EXPECT_EQ(sheets.addNew().colour, closed);
    EXPECT_EQ(sheets.add(opened(L"one.csv")).colour, closed);  // takes an untouched one's place
    EXPECT_EQ(sheets.add(opened(L"two.csv")).colour, 0);
}

TEST_F(OpenSheets, KeepEachSheetsEditsToItself) {
    OpenSheet& first = sheets.current();
    first.document.setCell(At(L"A1"), L"1");
    OpenSheet& second = sheets.addNew();
    second.document.setCell(At(L"A1"), L"2");
    second.document.undo();
    EXPECT_EQ(first.document.sheet().text(At(L"A1")), L"1");
    EXPECT_TRUE(first.document.isModified());
    EXPECT_FALSE(second.document.isModified());
}

}  // namespace
}  // namespace workbook
