#include "file_io.h"

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

struct Failure {
    const char* function;
    int arguments;
    int call;  // which one, from 1
    ULONG_PTR result;
};

// Makes one of the program's own calls fail, as on a full disk.
std::optional<FileProblem> ReplaceWithFailure(const std::wstring& path, const Failure& failure) {
    kortest::ImportSpy spy(GetModuleHandleW(nullptr));
    if (!spy.watch(failure.function, failure.arguments, kortest::CallingConvention::Stdcall))
        return std::nullopt;
    spy.failNth(failure.function, failure.call, failure.result, ERROR_DISK_FULL);
    const std::string bytes(size_t{3} << 20, 'n');
    return ReplaceFileBytes(path, bytes);
}

TEST(FileIo, KeepsTheOldFileWhateverFails) {
    const auto invalid = reinterpret_cast<ULONG_PTR>(INVALID_HANDLE_VALUE);
    for (const Failure& failure : {Failure{"CreateFileW", 7, 1, invalid},
                                   {"WriteFile", 5, 1, 0},
                                   {"WriteFile", 5, 3, 0},
                                   {"FlushFileBuffers", 1, 1, 0},
                                   {"MoveFileExW", 3, 1, 0}}) {
        const TemporaryFolder folder;
        folder.put(L"a.csv", "old");
        const auto problem = ReplaceWithFailure(folder.at(L"a.csv"), failure);
        ASSERT_TRUE(problem) << failure.function;
        EXPECT_TRUE(MessageNames(problem->message, folder.at(L"a.csv")));
        EXPECT_EQ(folder.get(L"a.csv"), "old") << failure.function;
        EXPECT_EQ(folder.names(), Names{L"a.csv"}) << failure.function;
    }
}

TEST(FileIo, KeepsTheOldFileWhenClosingTheNewOneFails) {
    const TemporaryFolder folder;
    folder.put(L"a.csv", "old");
    kortest::ImportSpy spy(GetModuleHandleW(nullptr));
    ASSERT_TRUE(spy.watch("CloseHandle", 1, kortest::CallingConvention::Stdcall));
    spy.replace("CloseHandle", [&spy](ULONG_PTR* arguments) -> ULONG_PTR {
        spy.callReal("CloseHandle", arguments);
        SetLastError(ERROR_DISK_FULL);
        return 0;
    });
    const auto problem = ReplaceFileBytes(folder.at(L"a.csv"), "new");
    spy.restore("CloseHandle");
    ASSERT_TRUE(problem);
    EXPECT_EQ(folder.get(L"a.csv"), "old");
    EXPECT_EQ(folder.names(), Names{L"a.csv"});
}

TEST(FileIo, FailsWhenNothingMoreIsWritten) {
    const TemporaryFolder folder;
    folder.put(L"a.csv", "old");
    // Success that wrote nothing: the count stays 0.
    const auto problem = ReplaceWithFailure(folder.at(L"a.csv"), {"WriteFile", 5, 2, 1});
    ASSERT_TRUE(problem);
    EXPECT_EQ(folder.get(L"a.csv"), "old");
    EXPECT_EQ(folder.names(), Names{L"a.csv"});
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
