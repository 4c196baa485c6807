#include "number_text.h"

#include <gtest/gtest.h>

#include <limits>
#include <random>

namespace workbook {
namespace {

TEST(NumberText, ReadsNumbers) {
    EXPECT_EQ(ReadNumber(L"0"), 0.0);
    EXPECT_EQ(ReadNumber(L"12"), 12.0);
    EXPECT_EQ(ReadNumber(L"-12.5"), -12.5);
    EXPECT_EQ(ReadNumber(L"+.5"), 0.5);
    EXPECT_EQ(ReadNumber(L"7."), 7.0);
    EXPECT_EQ(ReadNumber(L"007"), 7.0);
    EXPECT_EQ(ReadNumber(L"1.5e3"), 1500.0);
    EXPECT_EQ(ReadNumber(L"1E-2"), 0.01);
    EXPECT_EQ(ReadNumber(L"2e+2"), 200.0);
    EXPECT_EQ(ReadNumber(L"12%"), 0.12);
    EXPECT_EQ(ReadNumber(L"-150%"), -1.5);
    EXPECT_EQ(ReadNumber(L"  42 "), 42.0);
    EXPECT_EQ(ReadNumber(L"1.7976931348623157e308"), std::numeric_limits<double>::max());
}

TEST(NumberText, LeavesOtherTextsAlone) {
    for (const wchar_t* text :
         {L"",    L" ",     L".",    L"-",     L"+",      L"%",     L"-%",    L".%",
          L"e5",  L".e5",   L"1e",   L"1e+",   L"1,5",    L"1 000", L"1'000", L"--5",
          L"+-5", L"1.2.3", L"12%%", L"12 %",  L"%12",    L"0x10",  L"inf",   L"nan",
          L"1f",  L"1e5.5", L"- 5",  L"1e309", L"\u0661", L"5\t",   L"1d5"})
        EXPECT_EQ(ReadNumber(text), std::nullopt) << text;
}

TEST(NumberText, NeverReadsANegativeZero) {
    EXPECT_FALSE(std::signbit(ReadNumber(L"-0").value()));
    EXPECT_FALSE(std::signbit(ReadNumber(L"-0.0%").value()));
}

TEST(NumberText, ShowsWholeNumbersUpToElevenDigits) {
    EXPECT_EQ(DisplayNumber(0), L"0");
    EXPECT_EQ(DisplayNumber(-0.0), L"0");
    EXPECT_EQ(DisplayNumber(12), L"12");
    EXPECT_EQ(DisplayNumber(-12345678901.0), L"-12345678901");
    EXPECT_EQ(DisplayNumber(99999999999.0), L"99999999999");
    EXPECT_EQ(DisplayNumber(100000000000.0), L"1E+11");
    EXPECT_EQ(DisplayNumber(123456789012.0), L"1.23457E+11");
}

TEST(NumberText, ShowsFractionsInElevenCharacters) {
    EXPECT_EQ(DisplayNumber(1.0 / 3), L"0.333333333");
    EXPECT_EQ(DisplayNumber(-2.0 / 3), L"-0.666666667");
    EXPECT_EQ(DisplayNumber(100.0 / 3), L"33.33333333");
    EXPECT_EQ(DisplayNumber(1234567.891), L"1234567.891");
    EXPECT_EQ(DisplayNumber(12345678.9012), L"12345678.9");
    EXPECT_EQ(DisplayNumber(1234567890.5), L"1234567891");
    EXPECT_EQ(DisplayNumber(0.1 + 0.2), L"0.3");
    EXPECT_EQ(DisplayNumber(2.5), L"2.5");
    EXPECT_EQ(DisplayNumber(0.99999999999), L"1");
    EXPECT_EQ(DisplayNumber(1e10 + 0.4), L"10000000000");
}

TEST(NumberText, RoundsHalvesUp) {
    EXPECT_EQ(DisplayNumber(1234567892.5), L"1234567893");
    EXPECT_EQ(DisplayNumber(-1234567892.5), L"-1234567893");
    EXPECT_EQ(DisplayNumber(1.0000000005), L"1.000000001");
    EXPECT_EQ(DisplayNumber(1.9999999995), L"2");
    EXPECT_EQ(DisplayNumber(1.5e11 + 5e5), L"1.50001E+11");
}

TEST(NumberText, ShowsSmallNumbersWithAnExponent) {
    EXPECT_EQ(DisplayNumber(0.0001), L"0.0001");
    EXPECT_EQ(DisplayNumber(0.000123456789), L"0.000123457");
    EXPECT_EQ(DisplayNumber(0.00001), L"1E-05");
    EXPECT_EQ(DisplayNumber(0.0000123456789), L"1.23457E-05");
    EXPECT_EQ(DisplayNumber(-1.5e-300), L"-1.5E-300");
    EXPECT_EQ(DisplayNumber(-1.234567e-280), L"-1.23457E-280");
    EXPECT_EQ(DisplayNumber(0.0000999999999), L"0.0001");
}

TEST(NumberText, CarriesIntoTheExponentWhenRounding) {
    EXPECT_EQ(DisplayNumber(99999999999.7), L"1E+11");
    EXPECT_EQ(DisplayNumber(9.999999e20), L"1E+21");
    EXPECT_EQ(DisplayNumber(9999999999.5), L"10000000000");
}

TEST(NumberText, NeverShowsMoreThanElevenCharactersAndASign) {
    std::mt19937 random(1);
    std::uniform_real_distribution<double> mantissa(-10, 10);
    std::uniform_int_distribution<int> exponent(-30, 30);
    for (int i = 0; i < 20000; ++i) {
        const double number = mantissa(random) * std::pow(10.0, exponent(random));
        const std::wstring text = DisplayNumber(number);
        EXPECT_LE(text.size(), number < 0 ? 12u : 11u) << number;
        // Five digits behind the first one are always there: half a unit of them may be lost.
        ASSERT_TRUE(ReadNumber(text));
        EXPECT_NEAR(*ReadNumber(text), number, std::fabs(number) * 5.1e-6) << text;
    }
}

TEST(NumberText, JoinsWithFifteenDigits) {
    EXPECT_EQ(JoinNumber(1.0 / 3), L"0.333333333333333");
    EXPECT_EQ(JoinNumber(0.1 + 0.2), L"0.3");
    EXPECT_EQ(JoinNumber(-12), L"-12");
    EXPECT_EQ(JoinNumber(123456789012.0), L"123456789012");
    EXPECT_EQ(JoinNumber(1e20), L"1E+20");
    EXPECT_EQ(JoinNumber(0), L"0");
}

TEST(NumberText, ShowsAnErrorForWhatIsNoNumber) {
    EXPECT_EQ(DisplayNumber(std::numeric_limits<double>::infinity()), L"#NUM!");
    EXPECT_EQ(JoinNumber(std::numeric_limits<double>::quiet_NaN()), L"#NUM!");
}

}  // namespace
}  // namespace workbook
