// Memory runs out at every place where it can: an edit is then done as a whole or not at all, and a
// file is read or refused.
#include "document.h"

#include "failing_memory.h"
#include "sheet_support.h"
#include "temporary_folder.h"

#include <gtest/gtest.h>

#include <map>
#include <string>
#include <utility>
#include <vector>

namespace workbook {
namespace {

constexpr Block kWholeSheet = {0, 0, kColumnCount - 1, kRowCount - 1};

// What is typed and what is shown in every occupied cell.
std::map<std::wstring, std::wstring> Contents(const Sheet& sheet) {
    std::map<std::wstring, std::wstring> contents;
    for (const CellAddress cell : sheet.occupiedIn(kWholeSheet))
        contents[FormatAddress(cell)] = sheet.text(cell) + L" -> " + sheet.display(cell);
    return contents;
}

std::wstring Long(std::wstring_view text) {  // long enough for memory of its own
    return L"a long text about " + std::wstring(text);
}

Document MakeDocument() {
    Document document;
    document.setCells({{At(L"A1"), L"1"},
                       {At(L"A2"), L"=A1+1"},
                       {At(L"B300"), Long(L"B300")},
                       {At(L"C1"), L"=SUM(A1:B300)+A2"},
                       {At(L"D4"), L"=C1&\" and something else that is long\""}},
                      L"filling");
    return document;
}

std::vector<CellText> Pasted() {
    return {{At(L"A1"), L"=SUM(E5:F600)"},
            {At(L"A2"), L""},
            {At(L"B300"), L""},
            {At(L"B301"), Long(L"B301")},
            {At(L"C1"), L"=A1+A2+$A$1"},
            {At(L"E5"), L"7"}};
}

// Tries an edit with ever more memory until it has enough, and returns how many allocations it
// took. (It may succeed with less: sorting, for one, does without its buffer.) `edit` makes ready
// what it needs, begins the shortage, and answers whether the edit was done.
template <typename Edit>
int TryUntilItSucceeds(Edit edit) {
    const auto before = Contents(MakeDocument().sheet());
    for (int allocations = 0; allocations < 1000; ++allocations) {
        Document document = MakeDocument();
        const bool isDone = edit(document, allocations);
        if (MemoryShortage::refusals() == 0) {
            EXPECT_TRUE(isDone);
            return allocations;
        }
        if (isDone) continue;
        EXPECT_EQ(Contents(document.sheet()), before) << allocations;
        EXPECT_EQ(document.undoText(), L"Undo filling");
        EXPECT_FALSE(document.canRedo());
        // The dependencies are whole, too.
        document.setCell(At(L"A1"), L"2");
        EXPECT_EQ(Show(document.sheet(), L"C1"), L"8");
    }
    return -1;
}

TEST(MemoryFailure, EditsAreDoneAsAWholeOrNotAtAll) {
    for (const bool forGood : {false, true}) {
        const int allocations = TryUntilItSucceeds([=](Document& document, int limit) {
            std::vector<CellText> cells = Pasted();
            const MemoryShortage shortage(limit, forGood);
            return document.setCells(std::move(cells), {}) == EditResult::Done;
        });
        EXPECT_GT(allocations, 10);
    }
}

TEST(MemoryFailure, ClearingIsDoneAsAWholeOrNotAtAll) {
    for (const bool forGood : {false, true}) {
        const int allocations = TryUntilItSucceeds([=](Document& document, int limit) {
            const MemoryShortage shortage(limit, forGood);
            return document.clear(kWholeSheet) == EditResult::Done;
        });
        EXPECT_GT(allocations, 3);
    }
}

TEST(MemoryFailure, UndoIsDoneAsAWholeOrNotAtAll) {
    for (const bool forGood : {false, true}) {
        int limit = 0;
        for (bool succeeded = false; !succeeded; ++limit) {
            Document document = MakeDocument();
            const auto former = Contents(document.sheet());
            document.setCells(Pasted(), {});
            const auto later = Contents(document.sheet());
            {
                const MemoryShortage shortage(limit, forGood);
                succeeded = document.undo().has_value();
            }
            ASSERT_EQ(Contents(document.sheet()), succeeded ? former : later) << limit;
            ASSERT_EQ(document.canRedo(), succeeded);
        }
        EXPECT_GT(limit, 5);
    }
}

TEST(MemoryFailure, FilesAreReadOrRefused) {
    const std::string bytes = "a,\"a quoted field, long enough\"\n=SUM(A1:B9),=A2&\"long text\"\n";
    for (const bool forGood : {false, true}) {
        int limit = 0;
        for (bool succeeded = false; !succeeded; ++limit) {
            ASSERT_LT(limit, 1000);
            const MemoryShortage shortage(limit, forGood);
            const CsvResult result = ReadCsv(bytes);
            succeeded = result.document.has_value();
            const bool isRefused = result.problem && result.problem->error == CsvError::NoMemory;
            ASSERT_NE(succeeded, isRefused) << limit;
        }
        EXPECT_GT(limit, 10);
    }
}

TEST(MemoryFailure, OpeningAndSavingLeaveDocumentAndFileAlone) {
    const TemporaryFolder folder;
    folder.put(L"a.csv", "x,y\n1,=A2\n");
    folder.put(L"b.csv", "old\n");
    for (const bool forGood : {false, true}) {
        const std::wstring from = folder.at(L"a.csv");
        const std::wstring to = folder.at(L"b.csv");
        const int toOpen = TryUntilItSucceeds([&](Document& document, int limit) {
            const MemoryShortage shortage(limit, forGood);
            return !document.open(from);
        });
        EXPECT_GT(toOpen, 10);
        const int toSave = TryUntilItSucceeds([&](Document& document, int limit) {
            bool failed = false;
            {
                const MemoryShortage shortage(limit, forGood);
                failed = document.save(to).has_value();
            }
            EXPECT_EQ(document.isModified(), failed);
            EXPECT_EQ(folder.get(L"b.csv") == "old\n", failed);
            return !failed;
        });
        EXPECT_GT(toSave, 10);
        EXPECT_EQ(folder.names(), (std::vector<std::wstring>{L"a.csv", L"b.csv"}));
        folder.put(L"b.csv", "old\n");
    }
}

TEST(MemoryFailure, FormulasAnswerAnError) {
    const Document document = MakeDocument();
    const MemoryShortage shortage(0, true);
    const ValueView value = document.sheet().view(CellAddress{3, 3});
    EXPECT_EQ(value.kind, ValueKind::Error);
    EXPECT_EQ(value.error, ErrorCode::Value);
}

}  // namespace
}  // namespace workbook
