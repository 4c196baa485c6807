// The version as a function and as a resource.
#include "pe_image.h"
#include "support/import_spy.h"

#include <korcontrols/korcontrols.h>

#include <gtest/gtest.h>

#include <cstring>

namespace kortest {
namespace {

TEST(Version, Is49) { EXPECT_EQ(KORCONTROLS_Version(), 49); }

// The number is kept as text and converted on each call.
TEST(Version, IsConvertedFromItsTextOnEachCall) {
    ImportSpy spy;
    ASSERT_TRUE(spy.watch("_wtol"));
    std::wstring text;
    spy.replace("_wtol", [&](ULONG_PTR* arguments) {
        text = reinterpret_cast<const wchar_t*>(arguments[0]);
        return spy.callReal("_wtol", arguments);
    });
    EXPECT_EQ(KORCONTROLS_Version(), 49);
    EXPECT_EQ(KORCONTROLS_Version(), 49);
    EXPECT_EQ(spy.count("_wtol"), 2);
    EXPECT_EQ(text, L"0049");
}

TEST(Version, StandsInTheResources) {
    constexpr int kVersionType = 16;
    const std::string bytes = ResourceBytes(LibraryModule(), 1, kVersionType);
    const std::string_view key("V\0S\0_\0V\0E\0R\0S\0I\0O\0N\0_\0I\0N\0F\0O\0", 30);
    ASSERT_NE(bytes.find(key), std::string::npos);

    VS_FIXEDFILEINFO info{};
    const std::string_view signature("\xBD\x04\xEF\xFE", 4);
    const size_t place = bytes.find(signature);
    ASSERT_NE(place, std::string::npos);
    ASSERT_LE(place + sizeof info, bytes.size());
    std::memcpy(&info, bytes.data() + place, sizeof info);
    EXPECT_EQ(HIWORD(info.dwFileVersionMS), 0);
    EXPECT_EQ(LOWORD(info.dwFileVersionMS), KORCONTROLS_Version());
    EXPECT_EQ(info.dwFileType, DWORD{VFT_DLL});
}

}  // namespace
}  // namespace kortest
