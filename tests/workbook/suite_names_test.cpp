// CTest runs the suites by names that it makes from the files' names. A suite with another name
// would never be run; this test finds it.
#include <gtest/gtest.h>

#include <cctype>
#include <string>

namespace {

std::string SuiteNameOf(std::string file) {
    file.erase(0, file.find_last_of("/\\") + 1);
    file.erase(file.rfind("_test.cpp"));
    std::string suite;
    bool isFirst = true;
    for (const char c : file) {
        if (c != '_') suite += isFirst ? static_cast<char>(std::toupper(c)) : c;
        isFirst = c == '_';
    }
    return suite;
}

TEST(SuiteNames, AreThoseOfTheFiles) {
    const testing::UnitTest& all = *testing::UnitTest::GetInstance();
    ASSERT_GT(all.total_test_suite_count(), 1);
    for (int i = 0; i < all.total_test_suite_count(); ++i) {
        const testing::TestSuite& suite = *all.GetTestSuite(i);
        for (int j = 0; j < suite.total_test_count(); ++j)
            EXPECT_EQ(suite.name(), SuiteNameOf(suite.GetTestInfo(j)->file()));
    }
}

}  // namespace
