#include "functions.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <string>

namespace workbook {
namespace {

TEST(Functions, ListsAllInAlphabeticalOrder) {
    std::wstring names;
    for (const FunctionDescription& function : Functions())
        names += std::wstring(function.name) + L" ";
    EXPECT_EQ(names, L"AVERAGE COUNT IF MAX MIN SUM ");
}

TEST(Functions, ExplainsEachInOneLine) {
    for (const FunctionDescription& function : Functions()) {
        EXPECT_TRUE(function.arguments.starts_with(std::wstring(function.name) + L"("));
        EXPECT_TRUE(function.help.ends_with(L"."));
        EXPECT_LE(function.help.size(), 90u);
        EXPECT_EQ(function.help.find(L'\n'), std::wstring_view::npos);
    }
}

TEST(Functions, FindsNamesInCapitalAndSmallLetters) {
    for (const FunctionDescription& function : Functions())
        EXPECT_EQ(FindFunction(function.name), &function);
    ASSERT_NE(FindFunction(L"aVeRage"), nullptr);
    EXPECT_EQ(FindFunction(L"aVeRage")->id, FunctionId::Average);
    EXPECT_EQ(FindFunction(L"SUMX"), nullptr);
    EXPECT_EQ(FindFunction(L"SU"), nullptr);
    EXPECT_EQ(FindFunction(L""), nullptr);
}

TEST(Functions, DescribesEachByItsNumber) {
    for (const FunctionDescription& function : Functions())
        EXPECT_EQ(&DescribeFunction(function.id), &function);
}

}  // namespace
}  // namespace workbook
