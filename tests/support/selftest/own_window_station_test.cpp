// The station that belongs to this process alone.
#include <gtest/gtest.h>

#include <windows.h>

#include <string>

namespace kortest {
namespace {

std::wstring NameOf(HANDLE object) {
    wchar_t name[64]{};
    DWORD bytes = 0;
    GetUserObjectInformationW(object, UOI_NAME, name, sizeof name, &bytes);
    return name;
}

TEST(OwnWindowStation, IsNamedAfterThisProcessAsIsItsDesktop) {
    const std::wstring name = L"tests-" + std::to_wstring(GetCurrentProcessId());
    EXPECT_EQ(NameOf(GetProcessWindowStation()), name);
    EXPECT_EQ(NameOf(GetThreadDesktop(GetCurrentThreadId())), name);
}

}  // namespace
}  // namespace kortest
