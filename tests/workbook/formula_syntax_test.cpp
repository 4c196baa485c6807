// Which formulas can be read, and what is said about the others.
#include "formula.h"

#include "sheet_support.h"

#include <gtest/gtest.h>

namespace workbook {
namespace {

FormulaProblem ProblemOf(std::wstring_view formula) { return CompileFormula(formula).problem; }

TEST(FormulaSyntax, IgnoresSpacesBetweenTokens) {
    EXPECT_EQ(Result(L"= 1 + \t2\r\n* ( 3 \u00A0) "), L"7");
    EXPECT_EQ(Result(L"=SUM ( 1 , 2 )"), L"3");
    EXPECT_EQ(Result(L"=SUM(A1 : A2)", {{L"A1", L"1"}, {L"A2", L"2"}}), L"3");
}

TEST(FormulaSyntax, MissesOperands) {
    for (const wchar_t* formula : {L"1+", L"-", L"(", L"(1+", L"SUM(1,2+", L"A1:", L" "})
        EXPECT_EQ(ProblemOf(formula), FormulaProblem::Incomplete) << formula;
}

TEST(FormulaSyntax, MissesClosingSigns) {
    for (const wchar_t* formula : {L"(1", L"SUM(1", L"((1)", L"IF(1,(2)"})
        EXPECT_EQ(ProblemOf(formula), FormulaProblem::MissingParenthesis) << formula;
    for (const wchar_t* formula : {L"\"abc", L"\"", L"\"a\"\"", L"1&\"x"})
        EXPECT_EQ(ProblemOf(formula), FormulaProblem::MissingQuote) << formula;
}

TEST(FormulaSyntax, FindsSymbolsThatCannotStandThere) {
    for (const wchar_t* formula :
         {L"1)", L"*2", L"1**2", L"1 2", L"A1 A2", L"1=<2", L"()", L"#REF!", L"{1}", L"1,2",
          L"A1:5", L"1:2", L"2A", L".", L"\"a\"\"b\" \"c\"", L"%5", L"A1:B2:C3", L"@A1", L"1!"})
        EXPECT_EQ(ProblemOf(formula), FormulaProblem::UnexpectedSymbol) << formula;
}

TEST(FormulaSyntax, CountsArguments) {
    for (const wchar_t* formula : {L"SUM()", L"IF(1)", L"IF(1,2,3,4)", L"COUNT( )"})
        EXPECT_EQ(ProblemOf(formula), FormulaProblem::WrongArgumentCount) << formula;
    EXPECT_EQ(ProblemOf(L"SUM(,)"), FormulaProblem::None);
    EXPECT_EQ(Result(L"=COUNT(,)"), L"2");
    EXPECT_EQ(Result(L"=UNKNOWN()"), L"#NAME?");
}

TEST(FormulaSyntax, RefusesNumbersOutOfRange) {
    EXPECT_EQ(ProblemOf(L"1e999"), FormulaProblem::NumberTooLarge);
    EXPECT_EQ(ProblemOf(L"1e308"), FormulaProblem::None);
}

TEST(FormulaSyntax, LimitsNesting) {
    const auto nested = [](int depth) {
        return std::wstring(static_cast<size_t>(depth), L'(') + L"1" +
               std::wstring(static_cast<size_t>(depth), L')');
    };
    EXPECT_EQ(ProblemOf(nested(kDeepestNesting)), FormulaProblem::None);
    EXPECT_EQ(ProblemOf(nested(kDeepestNesting + 1)), FormulaProblem::NestedTooDeeply);
    EXPECT_EQ(ProblemOf(nested(16000)), FormulaProblem::NestedTooDeeply);
    EXPECT_EQ(Result(L"=" + nested(64)), L"1");
    EXPECT_EQ(Result(L"=" + nested(65)), L"#VALUE!");

    std::wstring calls;
    for (int i = 0; i < 5000; ++i) calls += L"SUM(";
    EXPECT_EQ(ProblemOf(calls), FormulaProblem::NestedTooDeeply);
}

TEST(FormulaSyntax, TakesParenthesesOneAfterTheOtherWithoutLimit) {
    std::wstring formula = L"=(1)";
    for (int i = 0; i < 5000; ++i) formula += L"+(1)";
    EXPECT_EQ(Result(formula), L"5001");
}

TEST(FormulaSyntax, SurvivesTheLongestFormulas) {
    EXPECT_EQ(Result(L"=" + std::wstring(kLongestCellText - 2, L'-') + L"1"), L"-1");
    EXPECT_EQ(Result(L"=0" + std::wstring(kLongestCellText - 2, L'%')), L"0");
    std::wstring powers = L"=1";
    while (powers.size() + 2 <= kLongestCellText) powers += L"^1";
    EXPECT_EQ(Result(powers), L"1");
    std::wstring sum = L"=SUM(1";
    while (sum.size() + 3 <= kLongestCellText) sum += L",1";
    EXPECT_EQ(Result(sum + L")"), std::to_wstring((sum.size() - 6) / 2 + 1));
}

TEST(FormulaSyntax, RefusedFormulasReadNoCells) {
    const Program program = CompileFormula(L"A1+B2:C3+");
    EXPECT_TRUE(program.references.empty());
    EXPECT_EQ(program.instructions.size(), 1u);
    EXPECT_EQ(Result(L"=IV16384+"), L"#VALUE!");  // not #CIRC!
}

TEST(FormulaSyntax, HasASentenceForEachProblem) {
    EXPECT_EQ(ProblemMessage(FormulaProblem::None), L"");
    for (int i = 1; i <= static_cast<int>(FormulaProblem::NestedTooDeeply); ++i)
        EXPECT_TRUE(ProblemMessage(static_cast<FormulaProblem>(i)).ends_with(L".")) << i;
}

}  // namespace
}  // namespace workbook
