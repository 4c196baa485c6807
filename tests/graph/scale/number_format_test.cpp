// Numbers as the chart writes them.
#include "graph/scale/number_format.h"
#include "numbers/truncate.h"

#include <gtest/gtest.h>

#include <cfloat>
#include <cwchar>
#include <limits>
#include <ostream>
#include <string>

namespace kortest {
namespace {

struct Written {
    double value;
    int precision;
    const wchar_t* text;
};

void PrintTo(const Written& written, std::ostream* stream) {
    *stream << written.value << " with " << written.precision << " digits";
}

std::wstring Format(double value, int precision) {
    wchar_t buffer[64];
    wmemset(buffer, L'?', 64);
    EXPECT_EQ(kor::FormatGraphNumber(value, buffer, precision), 1);
    buffer[63] = L'\0';
    return buffer;
}

class GraphNumberText : public ::testing::TestWithParam<Written> {};

TEST_P(GraphNumberText, IsAsStated) {
    EXPECT_EQ(Format(GetParam().value, GetParam().precision), GetParam().text);
}

INSTANTIATE_TEST_SUITE_P(
    Plain, GraphNumberText,
    ::testing::Values(Written{0.5, 5, L"0.5"}, Written{0, 5, L"0"}, Written{1, 5, L"1"},
                      Written{-1.5, 5, L"-1.5"}, Written{12345, 5, L"12345"},
                      Written{-12345, 5, L"-12345"}, Written{123.456, 5, L"123.46"},
                      Written{0.0001, 5, L"0.0001"}, Written{1.0 / 3, 5, L"0.33333"},
                      Written{1.0 / 3 * 100, 2, L"33"}, Written{12.6, 2, L"13"},
                      Written{99.4, 2, L"99"}));

// The exponent has two digits where two do, whatever the platform prints.
INSTANTIATE_TEST_SUITE_P(
    Exponents, GraphNumberText,
    ::testing::Values(Written{123456789, 5, L"1.2346E+08"}, Written{-123456789, 5, L"-1.2346E+08"},
                      Written{100000, 5, L"1E+05"}, Written{99999.6, 5, L"1E+05"},
                      Written{0.00001, 5, L"1E-05"}, Written{1.5e-10, 5, L"1.5E-10"},
                      Written{1e99, 5, L"1E+99"}, Written{100, 2, L"1E+02"}));

INSTANTIATE_TEST_SUITE_P(ThreeDigits, GraphNumberText,
                         ::testing::Values(Written{1e100, 5, L"1E+100"},
                                           Written{1.25e-105, 5, L"1.25E-105"},
                                           Written{DBL_MAX, 5, L"1.7977E+308"},
                                           Written{-DBL_MAX, 5, L"-1.7977E+308"}));

TEST(GraphNumberTextRefusals, NullBufferGivesZero) {
    EXPECT_EQ(kor::FormatGraphNumber(1, nullptr, 5), 0);
}

TEST(GraphNumberTextRefusals, WritesNothingBehindTheText) {
    wchar_t buffer[64];
    wmemset(buffer, L'?', 64);
    kor::FormatGraphNumber(-123456789, buffer, 5);
    EXPECT_EQ(std::wstring(buffer), L"-1.2346E+08");
    for (size_t i = 16; i < 64; ++i) EXPECT_EQ(buffer[i], L'?') << i;
}

TEST(GraphNumberTextRefusals, WhatIsNoNumberStillGivesAText) {
    for (const double value :
         {std::numeric_limits<double>::infinity(), -std::numeric_limits<double>::infinity(),
          std::numeric_limits<double>::quiet_NaN()}) {
        const std::wstring text = Format(value, 5);
        EXPECT_GT(text.size(), 0u);
        EXPECT_LT(text.size(), 16u);
    }
}

TEST(GraphNumberToInt, TruncatesTowardZero) {
    EXPECT_EQ(kor::TruncateToInt(2.9), 2);
    EXPECT_EQ(kor::TruncateToInt(-2.9), -2);
    EXPECT_EQ(kor::TruncateToInt(0.999), 0);
}

TEST(GraphNumberToInt, IsCutToWhatDrawingCanTake) {
    EXPECT_EQ(kor::TruncateToInt(1e300), kor::kPixelLimit);
    EXPECT_EQ(kor::TruncateToInt(-1e300), -kor::kPixelLimit);
    EXPECT_EQ(kor::TruncateToInt(std::numeric_limits<double>::infinity()), kor::kPixelLimit);
    EXPECT_EQ(kor::TruncateToInt(std::numeric_limits<double>::quiet_NaN()), 0);
}

TEST(GraphNumberToInt, KnowsFiniteNumbers) {
    EXPECT_TRUE(kor::IsFinite(0));
    EXPECT_TRUE(kor::IsFinite(-DBL_MAX));
    EXPECT_FALSE(kor::IsFinite(std::numeric_limits<double>::infinity()));
    EXPECT_FALSE(kor::IsFinite(-std::numeric_limits<double>::infinity()));
    EXPECT_FALSE(kor::IsFinite(std::numeric_limits<double>::quiet_NaN()));
}

}  // namespace
}  // namespace kortest
