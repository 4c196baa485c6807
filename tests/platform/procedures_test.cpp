// Procedures are found by names of plain letters.
#include "platform/procedures.h"

#include <gtest/gtest.h>

#include <string>

namespace {

TEST(Procedures, AreFoundByTheirNames) {
    const HMODULE module = GetModuleHandleW(L"kernel32.dll");
    EXPECT_EQ(kor::FindProcedure(module, L"GetTickCount"), GetProcAddress(module, "GetTickCount"));
    EXPECT_EQ(kor::FindProcedure(module, L"GetTickCoun"), nullptr);
}

// Cut off or narrowed it would be another's name.
TEST(Procedures, HaveNoLongOrForeignNames) {
    const HMODULE module = GetModuleHandleW(L"kernel32.dll");
    EXPECT_EQ(kor::FindProcedure(module, L"GetTickCoun\u0174"), nullptr);
    EXPECT_EQ(kor::FindProcedure(module, std::wstring(63, L'a').c_str()), nullptr);
    EXPECT_EQ(kor::FindProcedure(module, std::wstring(64, L'a').c_str()), nullptr);
    EXPECT_EQ(kor::FindProcedure(module, std::wstring(100000, L'a').c_str()), nullptr);
}

}  // namespace
