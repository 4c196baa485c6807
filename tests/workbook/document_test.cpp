#include "document.h"

#include "sheet_support.h"
#include "temporary_folder.h"

#include <gtest/gtest.h>

namespace workbook {
namespace {

TEST(Document, StartsEmptyUnnamedAndUnmodified) {
    const Document document;
    EXPECT_EQ(document.name(), L"Untitled");
    EXPECT_EQ(document.path(), L"");
    EXPECT_FALSE(document.isModified());
    EXPECT_FALSE(document.canUndo());
    EXPECT_FALSE(document.canRedo());
    EXPECT_EQ(document.undoText(), L"Undo");
    EXPECT_EQ(document.redoText(), L"Redo");
}

TEST(Document, UndoesAndRedoesTyping) {
    Document document;
    EXPECT_EQ(document.setCell(At(L"B4"), L"1"), EditResult::Done);
    EXPECT_EQ(document.setCell(At(L"B4"), L"2"), EditResult::Done);
    EXPECT_EQ(document.undoText(), L"Undo typing in B4");
    EXPECT_EQ(document.undo(), BlockAt(L"B4"));
    EXPECT_EQ(document.sheet().text(At(L"B4")), L"1");
    EXPECT_EQ(document.redoText(), L"Redo typing in B4");
    EXPECT_EQ(document.undo(), BlockAt(L"B4"));
    EXPECT_TRUE(document.sheet().isEmpty(At(L"B4")));
    EXPECT_EQ(document.undo(), std::nullopt);
    EXPECT_EQ(document.redo(), BlockAt(L"B4"));
    EXPECT_EQ(document.redo(), BlockAt(L"B4"));
    EXPECT_EQ(document.redo(), std::nullopt);
    EXPECT_EQ(document.sheet().text(At(L"B4")), L"2");
}

TEST(Document, RecalculatesAfterUndo) {
    Document document;
    document.setCell(At(L"A1"), L"1");
    document.setCell(At(L"A2"), L"=A1*2");
    document.setCell(At(L"A1"), L"5");
    EXPECT_EQ(Show(document.sheet(), L"A2"), L"10");
    document.undo();
    EXPECT_EQ(Show(document.sheet(), L"A2"), L"2");
    document.undo();
    EXPECT_EQ(Show(document.sheet(), L"A2"), L"");
    document.redo();
    EXPECT_EQ(Show(document.sheet(), L"A2"), L"2");
}

TEST(Document, NamesEachKindOfEdit) {
    Document document;
    document.setCell(At(L"A1"), L"1");
    document.setCell(At(L"A1"), L"");
    EXPECT_EQ(document.undoText(), L"Undo clearing A1");
    document.setCells({{At(L"A1"), L"x"}, {At(L"C3"), L"y"}}, L"pasting into A1:C3");
    EXPECT_EQ(document.undoText(), L"Undo pasting into A1:C3");
    document.clear(BlockAt(L"A1:C3"));
    EXPECT_EQ(document.undoText(), L"Undo clearing A1:C3");
}

TEST(Document, ChangesSeveralCellsInOneStep) {
    Document document;
    document.setCell(At(L"A1"), L"old");
    document.setCells({{At(L"A1"), L"1"}, {At(L"B2"), L"2"}, {At(L"A1"), L"3"}}, L"pasting");
    EXPECT_EQ(document.sheet().text(At(L"A1")), L"3");  // the last one counts
    EXPECT_EQ(document.undo(), BlockAt(L"A1:B2"));
    EXPECT_EQ(document.sheet().text(At(L"A1")), L"old");
    EXPECT_TRUE(document.sheet().isEmpty(At(L"B2")));
}

TEST(Document, ClearsABlockInOneStep) {
    Document document;
    document.setCells({{At(L"A1"), L"1"}, {At(L"B2"), L"2"}, {At(L"D4"), L"3"}}, L"pasting");
    EXPECT_EQ(document.clear(BlockAt(L"A1:C3")), EditResult::Done);
    EXPECT_EQ(document.sheet().occupiedCells(), 1u);
    EXPECT_EQ(document.undo(), BlockAt(L"A1:B2"));
    EXPECT_EQ(document.sheet().occupiedCells(), 3u);
    EXPECT_EQ(document.clear(BlockAt(L"E1:F9")), EditResult::Unchanged);
}

TEST(Document, MakesNoStepWithoutAChange) {
    Document document;
    document.setCell(At(L"A1"), L"1");
    EXPECT_EQ(document.setCell(At(L"A1"), L"1"), EditResult::Unchanged);
    EXPECT_EQ(document.setCell(At(L"A2"), L""), EditResult::Unchanged);
    EXPECT_EQ(document.setCells({}, L"pasting"), EditResult::Unchanged);
    document.undo();
    EXPECT_FALSE(document.canUndo());
    EXPECT_EQ(document.setCell(At(L"A2"), L""), EditResult::Unchanged);
    EXPECT_TRUE(document.canRedo());  // not forgotten, since nothing happened
}

TEST(Document, RefusesImpossibleEditsAsAWhole) {
    Document document;
    EXPECT_EQ(document.setCells({{At(L"A1"), L"1"}, {{256, 0}, L"2"}}, L"pasting"),
              EditResult::OutsideSheet);
    EXPECT_EQ(document.setCells({{At(L"A1"), L"1"}, {At(L"A2"), std::wstring(32768, L'x')}}, L""),
              EditResult::TooLong);
    EXPECT_EQ(document.setCell({0, 16384}, L"x"), EditResult::OutsideSheet);
    EXPECT_EQ(document.sheet().occupiedCells(), 0u);
    EXPECT_FALSE(document.canUndo());
    EXPECT_FALSE(document.isModified());
    EXPECT_NE(EditMessage(EditResult::OutsideSheet), L"");
    EXPECT_NE(EditMessage(EditResult::TooLong), L"");
    EXPECT_EQ(EditMessage(EditResult::Done), L"");
}

TEST(Document, ForgetsUndoneStepsAtTheNextEdit) {
    Document document;
    document.setCell(At(L"A1"), L"1");
    document.setCell(At(L"A1"), L"2");
    document.undo();
    document.setCell(At(L"A2"), L"x");
    EXPECT_FALSE(document.canRedo());
    document.undo();
    document.undo();
    EXPECT_EQ(document.sheet().occupiedCells(), 0u);
}

TEST(Document, ForgetsTheOldestOfVeryManySteps) {
    Document document;
    for (int i = 1; i <= 1500; ++i) document.setCell(At(L"A1"), std::to_wstring(i));
    int undone = 0;
    while (document.undo()) ++undone;
    EXPECT_EQ(undone, 1000);
    EXPECT_EQ(document.sheet().text(At(L"A1")), L"500");
    EXPECT_TRUE(document.isModified());  // the state that was saved cannot be reached any more
}

TEST(Document, KeepsTheSavedPointWhileOldStepsAreForgotten) {
    const TemporaryFolder folder;
    Document document;
    for (int i = 1; i <= 600; ++i) document.setCell(At(L"A1"), std::to_wstring(i));
    ASSERT_FALSE(document.save(folder.at(L"a.csv")));
    for (int i = 601; i <= 1200; ++i) document.setCell(At(L"A1"), std::to_wstring(i));
    for (int i = 0; i < 600; ++i) document.undo();
    EXPECT_EQ(document.sheet().text(At(L"A1")), L"600");
    EXPECT_FALSE(document.isModified());
}

// ---- The modified flag

TEST(Document, IsCleanAgainWhenTheSavedPointIsReached) {
    const TemporaryFolder folder;
    Document document;
    document.setCell(At(L"A1"), L"1");
    EXPECT_TRUE(document.isModified());
    document.undo();
    EXPECT_FALSE(document.isModified());
    document.redo();
    EXPECT_TRUE(document.isModified());
    ASSERT_FALSE(document.save(folder.at(L"a.csv")));
    EXPECT_FALSE(document.isModified());
    document.undo();
    EXPECT_TRUE(document.isModified());
    document.redo();
    EXPECT_FALSE(document.isModified());
}

TEST(Document, StaysModifiedWhenTheSavedPointIsGone) {
    const TemporaryFolder folder;
    Document document;
    document.setCell(At(L"A1"), L"1");
    ASSERT_FALSE(document.save(folder.at(L"a.csv")));
    document.undo();
    document.setCell(At(L"A1"), L"2");
    EXPECT_TRUE(document.isModified());
    document.undo();
    EXPECT_TRUE(document.isModified());
}

// ---- Files

TEST(Document, OpensAndSavesAFile) {
    const TemporaryFolder folder;
    folder.put(L"a.csv", "x;y\n1;=A2+1\n");
    Document document;
    document.setCell(At(L"Z9"), L"gone afterwards");
    ASSERT_FALSE(document.open(folder.at(L"a.csv")));
    EXPECT_EQ(document.name(), L"a.csv");
    EXPECT_EQ(document.path(), folder.at(L"a.csv"));
    EXPECT_EQ(document.format().separator, L';');
    EXPECT_FALSE(document.isModified());
    EXPECT_FALSE(document.canUndo());
    EXPECT_TRUE(document.sheet().isEmpty(At(L"Z9")));
    EXPECT_EQ(Show(document.sheet(), L"B2"), L"2");

    document.setCell(At(L"A2"), L"5");
    ASSERT_FALSE(document.save(folder.at(L"b.csv")));
    EXPECT_EQ(folder.get(L"b.csv"), "x;y\n5;=A2+1\n");
    EXPECT_EQ(folder.get(L"a.csv"), "x;y\n1;=A2+1\n");
    EXPECT_EQ(document.name(), L"b.csv");
}

TEST(Document, IsLeftAloneByAFileThatCannotBeOpened) {
    const TemporaryFolder folder;
    folder.put(L"bad.csv", "a,b\n\"c\n");
    Document document;
    document.setCell(At(L"A1"), L"mine");
    const auto problem = document.open(folder.at(L"bad.csv"));
    ASSERT_TRUE(problem);
    EXPECT_EQ(problem->message, L"Cannot open \"" + folder.at(L"bad.csv") +
                                    L"\": Line 2 opens a quote that is never closed.");
    EXPECT_TRUE(document.open(folder.at(L"none.csv")));
    EXPECT_EQ(document.sheet().text(At(L"A1")), L"mine");
    EXPECT_EQ(document.name(), L"Untitled");
    EXPECT_TRUE(document.isModified());
    EXPECT_TRUE(document.canUndo());
}

TEST(Document, StaysModifiedWhenSavingFails) {
    const TemporaryFolder folder;
    folder.put(L"a.csv", "1\n");
    Document document;
    ASSERT_FALSE(document.open(folder.at(L"a.csv")));
    document.setCell(At(L"A1"), L"2");
    EXPECT_TRUE(document.save(folder.at(L"none\\b.csv")));
    EXPECT_TRUE(document.isModified());
    EXPECT_EQ(document.path(), folder.at(L"a.csv"));
    EXPECT_EQ(folder.get(L"a.csv"), "1\n");
}

TEST(Document, StartsAnew) {
    const TemporaryFolder folder;
    folder.put(L"a.csv", "x;y\n");
    Document document;
    ASSERT_FALSE(document.open(folder.at(L"a.csv")));
    document.setCell(At(L"A1"), L"2");
    document.startNew();
    EXPECT_EQ(document.sheet().occupiedCells(), 0u);
    EXPECT_EQ(document.name(), L"Untitled");
    EXPECT_EQ(document.format().separator, L',');
    EXPECT_FALSE(document.isModified());
    EXPECT_FALSE(document.canUndo());
}

}  // namespace
}  // namespace workbook
