// What a saved file keeps besides its place.
#include "file_io.h"
#include "file_rights.h"

#include "support/import_spy.h"
#include "temporary_folder.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace workbook {
namespace {

using Names = std::vector<std::wstring>;

void ExpectKeepsRights(const std::wstring& rights) {
    const TemporaryFolder folder;
    const std::wstring path = folder.at(L"a.csv");
    folder.put(L"a.csv", "old");
    if (!rights.empty()) SetRights(path, rights);
    const std::wstring before = RightsOfFile(path);
    EXPECT_FALSE(ReplaceFileBytes(path, "new"));
    EXPECT_EQ(RightsOfFile(path), before);
    EXPECT_EQ(folder.get(L"a.csv"), "new");
    EXPECT_EQ(folder.names(), Names{L"a.csv"});
}

TEST(FileNature, KeepsTheUsualRights) { ExpectKeepsRights({}); }
TEST(FileNature, KeepsPrivateFilesPrivate) { ExpectKeepsRights(OwnRights()); }
TEST(FileNature, KeepsFilesForEverybody) { ExpectKeepsRights(kEverybodysRights); }

TEST(FileNature, KeepsAFileHidden) {
    const TemporaryFolder folder;
    const std::wstring path = folder.at(L"a.csv");
    folder.put(L"a.csv", "old");
    ASSERT_TRUE(SetFileAttributesW(path.c_str(), FILE_ATTRIBUTE_HIDDEN));
    EXPECT_FALSE(ReplaceFileBytes(path, "new"));
    EXPECT_EQ(GetFileAttributesW(path.c_str()) & FILE_ATTRIBUTE_HIDDEN,
              static_cast<DWORD>(FILE_ATTRIBUTE_HIDDEN));
    EXPECT_EQ(folder.get(L"a.csv"), "new");
}

TEST(FileNature, HandsDownTheTimeOfCreation) {
    const TemporaryFolder folder;
    folder.put(L"a.csv", "old");
    LONGLONG old = 0;
    LONGLONG given = 0;
    {
        kortest::ImportSpy spy(GetModuleHandleW(nullptr));
        const auto watch = [&](const char* name, LONGLONG& time) {
            ASSERT_TRUE(spy.watch(name, 4, kortest::CallingConvention::Stdcall));
            spy.replace(name, [&spy, name, &time](ULONG_PTR* arguments) {
                const ULONG_PTR result = spy.callReal(name, arguments);
                time = reinterpret_cast<FILE_BASIC_INFO*>(arguments[2])->CreationTime.QuadPart;
                return result;
            });
        };
        watch("GetFileInformationByHandleEx", old);
        watch("SetFileInformationByHandle", given);
        EXPECT_FALSE(ReplaceFileBytes(folder.at(L"a.csv"), "new"));
    }
    EXPECT_NE(old, 0);
    EXPECT_EQ(given, old);
}

// The end-to-end tests have real links, which Wine cannot make.
TEST(FileNature, ReplacesWhatIsBehindALink) {
    const TemporaryFolder folder;
    folder.put(L"link.csv", "old");
    folder.put(L"target.csv", "old");
    const std::wstring target = folder.at(L"target.csv");
    {
        kortest::ImportSpy spy(GetModuleHandleW(nullptr));
        ASSERT_TRUE(spy.watch("GetFinalPathNameByHandleW", 4, kortest::CallingConvention::Stdcall));
        spy.replace("GetFinalPathNameByHandleW", [&](ULONG_PTR* arguments) -> ULONG_PTR {
            if (arguments[2] <= target.size()) return target.size() + 1;
            lstrcpyW(reinterpret_cast<LPWSTR>(arguments[1]), target.c_str());
            return target.size();
        });
        EXPECT_FALSE(ReplaceFileBytes(folder.at(L"link.csv"), "new"));
    }
    EXPECT_EQ(folder.get(L"link.csv"), "old");
    EXPECT_EQ(folder.get(L"target.csv"), "new");
    EXPECT_EQ(folder.names(), (Names{L"link.csv", L"target.csv"}));
}

}  // namespace
}  // namespace workbook
