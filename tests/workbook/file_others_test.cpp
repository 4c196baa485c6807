// What others do to a file while a document has it open.
#include "document.h"

#include "sheet_support.h"
#include "support/import_spy.h"
#include "temporary_folder.h"

#include <gtest/gtest.h>

#include <functional>
#include <optional>
#include <string>
#include <vector>

namespace workbook {
namespace {

using Names = std::vector<std::wstring>;

class FileOthers : public testing::Test {
protected:
    void SetUp() override {
        folder.put(L"a.csv", "1,2\n");
        ASSERT_FALSE(document.open(path));
        document.setCell(At(L"A1"), L"mine");
    }

    // Saving was refused, and changed nothing.
    void expectRefused(const std::optional<FileProblem>& problem, FileProblemKind kind,
                       const std::string& theirs) const {
        ASSERT_TRUE(problem);
        EXPECT_EQ(problem->kind, kind) << problem->message;
        EXPECT_NE(problem->message.find(L"\"" + path + L"\""), std::wstring::npos);
        EXPECT_TRUE(document.isModified());
        EXPECT_EQ(folder.get(L"a.csv"), theirs);
        EXPECT_LE(folder.names().size(), 1u);
    }
    void expectSaved(const std::optional<FileProblem>& problem) const {
        EXPECT_FALSE(problem) << problem->message;
        EXPECT_FALSE(document.isModified());
        EXPECT_EQ(folder.get(L"a.csv"), "mine,2\n");
        EXPECT_EQ(folder.names(), Names{L"a.csv"});
    }

    const TemporaryFolder folder;
    const std::wstring path = folder.at(L"a.csv");
    Document document;
};

TEST_F(FileOthers, AreNotOverwrittenUnasked) {
    folder.put(L"a.csv", "1,2\n3,4\n");
    for (int attempt = 0; attempt < 2; ++attempt)
        expectRefused(document.save(path), FileProblemKind::ChangedByOthers, "1,2\n3,4\n");
    expectSaved(document.saveOver(path));
}

TEST_F(FileOthers, AreNoticedByTheContentsNotByTheLength) {
    folder.put(L"a.csv", "1,3\n");
    expectRefused(document.save(path), FileProblemKind::ChangedByOthers, "1,3\n");
    folder.put(L"a.csv", "1,2");
    expectRefused(document.save(path), FileProblemKind::ChangedByOthers, "1,2");
    folder.put(L"a.csv", "");
    expectRefused(document.save(path), FileProblemKind::ChangedByOthers, "");
}

TEST_F(FileOthers, MayWriteTheSameAgain) {
    folder.put(L"a.csv", "something else");
    folder.put(L"a.csv", "1,2\n");
    expectSaved(document.save(path));
}

TEST_F(FileOthers, MayHaveRemovedTheFile) {
    DeleteFileW(path.c_str());
    expectRefused(document.save(path), FileProblemKind::RemovedByOthers, "(no file)");
    expectSaved(document.saveOver(path));
}

TEST_F(FileOthers, AreTheOnlyOnesWhoseChangesCount) {
    for (const wchar_t* text : {L"x", L"y", L"mine"}) {
        document.setCell(At(L"A1"), text);
        EXPECT_FALSE(document.save(path)) << text;
    }
    expectSaved(document.saveOver(path));
    document.setCell(At(L"A1"), L"z");
    document.setCell(At(L"A1"), L"mine");
    expectSaved(document.save(path));
}

TEST_F(FileOthers, AreNoticedAfterSavingUnderAnotherName) {
    const std::wstring other = folder.at(L"b.csv");
    folder.put(L"b.csv", "theirs");  // which the dialog has asked about
    ASSERT_FALSE(document.save(other));
    document.setCell(At(L"A1"), L"x");
    folder.put(L"b.csv", "theirs again");
    const auto problem = document.save(other);
    ASSERT_TRUE(problem);
    EXPECT_EQ(problem->kind, FileProblemKind::ChangedByOthers);
    EXPECT_EQ(folder.get(L"b.csv"), "theirs again");
}

// While the new file is being written.
TEST_F(FileOthers, AreNoticedToTheLast) {
    kortest::ImportSpy spy(GetModuleHandleW(nullptr));
    ASSERT_TRUE(spy.watch("FlushFileBuffers", 1, kortest::CallingConvention::Stdcall));
    spy.replace("FlushFileBuffers", [this](ULONG_PTR*) -> ULONG_PTR {
        folder.put(L"a.csv", "theirs");
        return TRUE;
    });
    const auto problem = document.save(path);
    spy.restore("FlushFileBuffers");
    expectRefused(problem, FileProblemKind::ChangedByOthers, "theirs");
}

// A file that cannot be read cannot be known to be the same.
TEST_F(FileOthers, MayKeepTheFileToThemselves) {
    const HANDLE theirs =
        CreateFileW(path.c_str(), GENERIC_READ, 0, nullptr, OPEN_EXISTING, 0, nullptr);
    ASSERT_NE(theirs, INVALID_HANDLE_VALUE);
    const auto problem = document.save(path);
    CloseHandle(theirs);
    expectRefused(problem, FileProblemKind::Failed, "1,2\n");
}

TEST_F(FileOthers, ReadLargeFilesInPieces) {
    const std::string large(size_t{3} << 20, 'x');
    folder.put(L"a.csv", large + "\n");
    EXPECT_FALSE(ReplaceFileBytes(path, large + "1", MarkOf(large + "\n")));
    EXPECT_TRUE(ReplaceFileBytes(path, "new", MarkOf(large + "2")));
    EXPECT_FALSE(ReplaceFileBytes(path, "new", MarkOf(large + "1")));
    EXPECT_EQ(folder.get(L"a.csv"), "new");
}

}  // namespace
}  // namespace workbook
