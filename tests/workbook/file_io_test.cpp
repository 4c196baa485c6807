#include "file_io.h"

#include "file_rights.h"
#include "support/import_spy.h"
#include "temporary_folder.h"

#include <gtest/gtest.h>

#include <optional>
#include <string>
#include <utility>
#include <vector>

namespace workbook {
namespace {

using Names = std::vector<std::wstring>;
constexpr size_t kLimit = size_t{4} << 20;

bool MessageNames(const std::wstring& message, const std::wstring& path) {
    return message.find(L"\"" + path + L"\"") != std::wstring::npos;
}

TEST(FileIo, ReadsAFile) {
    const TemporaryFolder folder;
    folder.put(L"a.csv", std::string_view("x\0\xFF", 3));
    const FileContents contents = ReadWholeFile(folder.at(L"a.csv"), kLimit);
    EXPECT_FALSE(contents.problem);
    EXPECT_EQ(contents.bytes, std::string("x\0\xFF", 3));
}

TEST(FileIo, ReadsFilesUpToTheLimit) {
    const TemporaryFolder folder;
    std::string bytes(kLimit, 'x');
    bytes.back() = 'y';
    folder.put(L"a.csv", bytes);
    EXPECT_EQ(ReadWholeFile(folder.at(L"a.csv"), kLimit).bytes, bytes);
    folder.put(L"a.csv", bytes + "z");
    const FileContents contents = ReadWholeFile(folder.at(L"a.csv"), kLimit);
    ASSERT_TRUE(contents.problem);
    EXPECT_TRUE(contents.bytes.empty());
    EXPECT_TRUE(contents.problem->message.ends_with(L"The file is larger than 4 MB."));
}

TEST(FileIo, ReadsAnEmptyFile) {
    const TemporaryFolder folder;
    folder.put(L"a.csv", "");
    const FileContents contents = ReadWholeFile(folder.at(L"a.csv"), kLimit);
    EXPECT_FALSE(contents.problem);
    EXPECT_EQ(contents.bytes, "");
}

TEST(FileIo, SaysWhichFileCannotBeRead) {
    const TemporaryFolder folder;
    const std::wstring path = folder.at(L"none.csv");
    const FileContents contents = ReadWholeFile(path, kLimit);
    ASSERT_TRUE(contents.problem);
    EXPECT_TRUE(MessageNames(contents.problem->message, path)) << contents.problem->message;
    EXPECT_TRUE(contents.problem->message.ends_with(L".")) << contents.problem->message;
    EXPECT_TRUE(ReadWholeFile(folder.at(L""), kLimit).problem);  // a folder
}

TEST(FileIo, WritesANewFile) {
    const TemporaryFolder folder;
    EXPECT_FALSE(ReplaceFileBytes(folder.at(L"a.csv"), "hello"));
    EXPECT_EQ(folder.get(L"a.csv"), "hello");
    EXPECT_EQ(folder.names(), Names{L"a.csv"});
}

TEST(FileIo, ReplacesAFile) {
    const TemporaryFolder folder;
    folder.put(L"a.csv", "something longer than what comes");
    EXPECT_FALSE(ReplaceFileBytes(folder.at(L"a.csv"), "new"));
    EXPECT_EQ(folder.get(L"a.csv"), "new");
    EXPECT_FALSE(ReplaceFileBytes(folder.at(L"a.csv"), ""));
    EXPECT_EQ(folder.get(L"a.csv"), "");
    EXPECT_EQ(folder.names(), Names{L"a.csv"});
}

TEST(FileIo, WritesLargeFilesInPieces) {
    const TemporaryFolder folder;
    std::string bytes;
    for (int i = 0; i < 300000; ++i) bytes += std::to_string(i) + "\n";
    EXPECT_FALSE(ReplaceFileBytes(folder.at(L"a.csv"), bytes));
    EXPECT_EQ(folder.get(L"a.csv"), bytes);
}

TEST(FileIo, LeavesForeignTemporaryFilesAlone) {
    const TemporaryFolder folder;
    const std::wstring taken = L"a.csv." + std::to_wstring(GetCurrentProcessId()) + L"-0.tmp";
    folder.put(taken, "somebody's");
    EXPECT_FALSE(ReplaceFileBytes(folder.at(L"a.csv"), "new"));
    EXPECT_EQ(folder.get(L"a.csv"), "new");
    EXPECT_EQ(folder.get(taken), "somebody's");
    EXPECT_EQ(folder.names(), (Names{L"a.csv", taken}));
}

TEST(FileIo, FailsWithoutAFolder) {
    const TemporaryFolder folder;
    const std::wstring path = folder.at(L"none\\a.csv");
    const auto problem = ReplaceFileBytes(path, "new");
    ASSERT_TRUE(problem);
    EXPECT_TRUE(MessageNames(problem->message, path)) << problem->message;
    EXPECT_TRUE(folder.names().empty());
}

TEST(FileIo, FailsOverAFolderAndCleansUp) {
    const TemporaryFolder folder;
    ASSERT_TRUE(CreateDirectoryW(folder.at(L"a.csv").c_str(), nullptr));
    EXPECT_TRUE(ReplaceFileBytes(folder.at(L"a.csv"), "new"));
    EXPECT_EQ(folder.names(), Names{L"a.csv"});
}

TEST(FileIo, KeepsAWriteProtectedFile) {
    const TemporaryFolder folder;
    folder.put(L"a.csv", "old");
    ASSERT_TRUE(SetFileAttributesW(folder.at(L"a.csv").c_str(), FILE_ATTRIBUTE_READONLY));
    EXPECT_TRUE(ReplaceFileBytes(folder.at(L"a.csv"), "new"));
    EXPECT_EQ(folder.get(L"a.csv"), "old");
    EXPECT_EQ(folder.names(), Names{L"a.csv"});
}

TEST(FileIo, KeepsAFileThatAnotherProgramHolds) {
    const TemporaryFolder folder;
    folder.put(L"a.csv", "old");
    const HANDLE holder = CreateFileW(folder.at(L"a.csv").c_str(), GENERIC_READ, FILE_SHARE_READ,
                                      nullptr, OPEN_EXISTING, 0, nullptr);
    ASSERT_NE(holder, INVALID_HANDLE_VALUE);
    EXPECT_TRUE(ReplaceFileBytes(folder.at(L"a.csv"), "new"));
    CloseHandle(holder);
    EXPECT_EQ(folder.get(L"a.csv"), "old");
    EXPECT_EQ(folder.names(), Names{L"a.csv"});
}

// ---- Calls of the system that fail

constexpr const char* kOld = "old";
constexpr const char* kNew = "new";

// What the call gives when it fails. It is made nevertheless where the system would do its work and
// fail all the same.
struct FailingCall {
    const char* function;
    int arguments;
    bool isMade = false;
    ULONG_PTR result = 0;
};

const auto kNoHandle = reinterpret_cast<ULONG_PTR>(INVALID_HANDLE_VALUE);
const FailingCall kCallsOfSaving[] = {{"CreateFileW", 7, false, kNoHandle},
                                      {"GetFileInformationByHandleEx", 4},
                                      {"GetKernelObjectSecurity", 5},
                                      {"GetFinalPathNameByHandleW", 4},
                                      {"SetFileInformationByHandle", 4},
                                      {"SetKernelObjectSecurity", 3},
                                      {"WriteFile", 5},
                                      {"FlushFileBuffers", 1},
                                      {"ReadFile", 5},
                                      {"CloseHandle", 1, true},
                                      {"DeleteFileW", 1},
                                      {"MoveFileExW", 3}};

struct Attempt {
    bool failed = false;  // the call was reached
    std::optional<FileProblem> problem;
};

// Replaces a file that must hold kOld while the nth call of the function fails.
Attempt ReplaceWithFailing(const std::wstring& path, const FailingCall& call, int nth) {
    kortest::ImportSpy spy(GetModuleHandleW(nullptr));
    EXPECT_TRUE(spy.watch(call.function, call.arguments, kortest::CallingConvention::Stdcall));
    Attempt attempt;
    int left = nth;
    spy.replace(call.function, [&](ULONG_PTR* arguments) -> ULONG_PTR {
        if (--left != 0) return spy.callReal(call.function, arguments);
        attempt.failed = true;
        if (call.isMade) spy.callReal(call.function, arguments);
        SetLastError(ERROR_GEN_FAILURE);
        return call.result;
    });
    attempt.problem = ReplaceFileBytes(path, kNew, MarkOf(kOld));
    return attempt;
}

// Where the system cannot tell the way behind links or rights, the file may be saved without.
void ExpectOldOrNew(const TemporaryFolder& folder, const Attempt& attempt) {
    EXPECT_EQ(folder.names(), Names{L"a.csv"});
    EXPECT_EQ(folder.get(L"a.csv"), attempt.problem ? kOld : kNew);
    if (attempt.problem) {
        EXPECT_EQ(attempt.problem->kind, FileProblemKind::Failed);
        EXPECT_TRUE(MessageNames(attempt.problem->message, folder.at(L"a.csv")))
            << attempt.problem->message;
    }
}

// How often saving gave up, over all calls of the function.
//   rights  of the file that is replaced; empty: those that a new file has
int CountProblems(const FailingCall& call, const std::wstring& rights) {
    int problems = 0;
    for (int nth = 1;; ++nth) {
        SCOPED_TRACE(call.function + std::string(" ") + std::to_string(nth));
        const TemporaryFolder folder;
        folder.put(L"a.csv", kOld);
        if (!rights.empty()) SetRights(folder.at(L"a.csv"), rights);
        const Attempt attempt = ReplaceWithFailing(folder.at(L"a.csv"), call, nth);
        ExpectOldOrNew(folder, attempt);
        if (!attempt.failed) return problems;
        problems += attempt.problem.has_value();
    }
}

TEST(FileIo, LeavesTheOldFileOrTheNewOneWhateverFails) {
    for (const FailingCall& call : kCallsOfSaving) {
        const int usual = CountProblems(call, {});
        const int locked = CountProblems(call, kEverybodysRights);
        const std::string function = call.function;
        if (function == "GetFinalPathNameByHandleW") {
            EXPECT_EQ(usual + locked, 0) << function;
        } else {
            EXPECT_GT(usual + locked, 0) << function;
        }
    }
}

TEST(FileIo, LeavesTheOldFileWhenALaterPieceFails) {
    const TemporaryFolder folder;
    folder.put(L"a.csv", kOld);
    kortest::ImportSpy spy(GetModuleHandleW(nullptr));
    ASSERT_TRUE(spy.watch("WriteFile", 5, kortest::CallingConvention::Stdcall));
    const ULONG_PTR succeeded = 1;  // but with a count of 0
    for (const ULONG_PTR result : {ULONG_PTR{0}, succeeded}) {
        spy.failNth("WriteFile", 3, result, ERROR_DISK_FULL);
        const auto problem =
            ReplaceFileBytes(folder.at(L"a.csv"), std::string(size_t{3} << 20, 'n'));
        ASSERT_TRUE(problem);
        EXPECT_EQ(folder.get(L"a.csv"), kOld);
        EXPECT_EQ(folder.names(), Names{L"a.csv"});
    }
}

TEST(FileIo, SaysWhyReadingFailedHalfWay) {
    const TemporaryFolder folder;
    folder.put(L"a.csv", std::string(size_t{3} << 20, 'x'));
    for (const auto& [function, arguments] :
         {std::pair<const char*, int>{"ReadFile", 5}, {"GetFileSizeEx", 2}}) {
        kortest::ImportSpy spy(GetModuleHandleW(nullptr));
        ASSERT_TRUE(spy.watch(function, arguments, kortest::CallingConvention::Stdcall));
        spy.failNth(function, 1, 0, ERROR_READ_FAULT);
        const FileContents contents = ReadWholeFile(folder.at(L"a.csv"), kLimit);
        ASSERT_TRUE(contents.problem) << function;
        EXPECT_TRUE(contents.bytes.empty());
        EXPECT_TRUE(MessageNames(contents.problem->message, folder.at(L"a.csv")));
    }
}

}  // namespace
}  // namespace workbook
