// What formulas come to: operators, functions, errors.
#include "sheet_support.h"

#include <gtest/gtest.h>

#include <cmath>
#include <string>

namespace workbook {
namespace {

TEST(Formula, Calculates) {
    EXPECT_EQ(Result(L"=1+2"), L"3");
    EXPECT_EQ(Result(L"=7-2-1"), L"4");
    EXPECT_EQ(Result(L"=2*3*4"), L"24");
    EXPECT_EQ(Result(L"=24/4/2"), L"3");
    EXPECT_EQ(Result(L"=2^10"), L"1024");
    EXPECT_EQ(Result(L"=1.5e3+.5"), L"1500.5");
}

TEST(Formula, BindsStrongOperatorsFirst) {
    EXPECT_EQ(Result(L"=1+2*3"), L"7");
    EXPECT_EQ(Result(L"=(1+2)*3"), L"9");
    EXPECT_EQ(Result(L"=2*3^2"), L"18");
    EXPECT_EQ(Result(L"=10-4/2"), L"8");
    EXPECT_EQ(Result(L"=1+1&2*2"), L"24");
    EXPECT_EQ(Result(L"=\"a\"&\"b\"=\"ab\""), L"TRUE");
    EXPECT_EQ(Result(L"=1+1=2"), L"TRUE");
}

TEST(Formula, PowersGoFromLeftToRight) { EXPECT_EQ(Result(L"=2^3^2"), L"64"); }

TEST(Formula, ASignBindsMoreStronglyThanAPower) {
    EXPECT_EQ(Result(L"=-2^2"), L"4");
    EXPECT_EQ(Result(L"=0-2^2"), L"-4");
    EXPECT_EQ(Result(L"=2^-1"), L"0.5");
    EXPECT_EQ(Result(L"=-(2^2)"), L"-4");
}

TEST(Formula, TakesSeveralSigns) {
    EXPECT_EQ(Result(L"=--5"), L"5");
    EXPECT_EQ(Result(L"=-+-+-5"), L"-5");
    EXPECT_EQ(Result(L"=3--2"), L"5");
    EXPECT_EQ(Result(L"=--\"5\"+1"), L"6");
    EXPECT_EQ(Result(L"=+\"x\""), L"x");
    EXPECT_EQ(Result(L"=--\"x\""), L"#VALUE!");
}

TEST(Formula, TakesPercentSigns) {
    EXPECT_EQ(Result(L"=50%"), L"0.5");
    EXPECT_EQ(Result(L"=200*5%"), L"10");
    EXPECT_EQ(Result(L"=4^50%"), L"2");
    EXPECT_EQ(Result(L"=-50%%"), L"-0.005");
}

TEST(Formula, ReadsCells) {
    EXPECT_EQ(Result(L"=A1+b2*$A$1", {{L"A1", L"2"}, {L"B2", L"5"}}), L"12");
    EXPECT_EQ(Result(L"=A1", {{L"A1", L"text"}}), L"text");
    EXPECT_EQ(Result(L"=A1", {{L"A1", L"true"}}), L"TRUE");
    EXPECT_EQ(Result(L"=A1"), L"0");  // an empty cell
    EXPECT_EQ(Result(L"=A1:A1+1", {{L"A1", L"2"}}), L"3");
}

TEST(Formula, ComparesNumbers) {
    EXPECT_EQ(Result(L"=1=1"), L"TRUE");
    EXPECT_EQ(Result(L"=1<>1"), L"FALSE");
    EXPECT_EQ(Result(L"=1=2"), L"FALSE");
    EXPECT_EQ(Result(L"=1<>2"), L"TRUE");
    EXPECT_EQ(Result(L"=1<2"), L"TRUE");
    EXPECT_EQ(Result(L"=2<2"), L"FALSE");
    EXPECT_EQ(Result(L"=2<=2"), L"TRUE");
    EXPECT_EQ(Result(L"=2>2"), L"FALSE");
    EXPECT_EQ(Result(L"=2>=2"), L"TRUE");
    EXPECT_EQ(Result(L"=3<2"), L"FALSE");
    EXPECT_EQ(Result(L"=3<=2"), L"FALSE");
    EXPECT_EQ(Result(L"=1>=2"), L"FALSE");
}

TEST(Formula, TakesNumbersForEqualThatDifferInTheLastBits) {
    EXPECT_EQ(Result(L"=0.1+0.2=0.3"), L"TRUE");
    EXPECT_EQ(Result(L"=0.1+0.2>0.3"), L"FALSE");
    EXPECT_EQ(Result(L"=0.1+0.2<=0.3"), L"TRUE");
    EXPECT_EQ(Result(L"=0.3=0.30000000001"), L"FALSE");
}

TEST(Formula, ComparesTextsWithoutRegardToCapitals) {
    EXPECT_EQ(Result(L"=\"abc\"=\"ABC\""), L"TRUE");
    EXPECT_EQ(Result(L"=\"ABC\"=\"abc\""), L"TRUE");
    EXPECT_EQ(Result(L"=\"\u00E4\"=\"\u00C4\""), L"TRUE");
    EXPECT_EQ(Result(L"=\"abc\"<\"ABD\""), L"TRUE");
    EXPECT_EQ(Result(L"=\"ab\"<\"abc\""), L"TRUE");
    EXPECT_EQ(Result(L"=\"b\">\"abc\""), L"TRUE");
}

TEST(Formula, OrdersNumbersBeforeTextsBeforeTruthValues) {
    EXPECT_EQ(Result(L"=1000<\"a\""), L"TRUE");
    EXPECT_EQ(Result(L"=\"zzz\"<FALSE"), L"TRUE");
    EXPECT_EQ(Result(L"=1=TRUE"), L"FALSE");
    EXPECT_EQ(Result(L"=FALSE<TRUE"), L"TRUE");
    EXPECT_EQ(Result(L"=\"1\"=1"), L"FALSE");
}

TEST(Formula, ComparesEmptyCellsAsNothingOfTheOtherKind) {
    EXPECT_EQ(Result(L"=A1=0"), L"TRUE");
    EXPECT_EQ(Result(L"=A1=\"\""), L"TRUE");
    EXPECT_EQ(Result(L"=A1=FALSE"), L"TRUE");
    EXPECT_EQ(Result(L"=A1=A2"), L"TRUE");
    EXPECT_EQ(Result(L"=A1<1"), L"TRUE");
    EXPECT_EQ(Result(L"=-1<A1"), L"TRUE");
}

TEST(Formula, JoinsTexts) {
    EXPECT_EQ(Result(L"=\"a\"&\"b\"&A1&TRUE", {{L"A1", L"c"}}), L"abcTRUE");
    EXPECT_EQ(Result(L"=1/3&\"\""), L"0.333333333333333");
    EXPECT_EQ(Result(L"=\"<\"&A1&\">\""), L"<>");
    EXPECT_EQ(Result(L"=\"say \"\"hi\"\"\""), L"say \"hi\"");
}

TEST(Formula, RefusesToJoinMoreThanACellTakes) {
    const std::wstring half(20000, L'x');
    EXPECT_EQ(Result(L"=A1&A1", {{L"A1", half}}), L"#VALUE!");
}

TEST(Formula, CalculatesWithTextsThatReadAsNumbers) {
    EXPECT_EQ(Result(L"=\"3\"+4"), L"7");
    EXPECT_EQ(Result(L"=A1*2", {{L"A1", L"'12%"}}), L"0.24");
    EXPECT_EQ(Result(L"=\"x\"+4"), L"#VALUE!");
    EXPECT_EQ(Result(L"=TRUE+TRUE"), L"2");
    EXPECT_EQ(Result(L"=A1+5"), L"5");
}

TEST(Formula, NamesErrors) {
    EXPECT_EQ(Result(L"=1/0"), L"#DIV/0!");
    EXPECT_EQ(Result(L"=1/A1"), L"#DIV/0!");
    EXPECT_EQ(Result(L"=0^-1"), L"#DIV/0!");
    EXPECT_EQ(Result(L"=0^0"), L"#NUM!");
    EXPECT_EQ(Result(L"=(0-8)^0.5"), L"#NUM!");
    EXPECT_EQ(Result(L"=1e308*10"), L"#NUM!");
    EXPECT_EQ(Result(L"=IW1"), L"#REF!");
    EXPECT_EQ(Result(L"=A16385+1"), L"#REF!");
    EXPECT_EQ(Result(L"=SUM(A1:A16385)"), L"#REF!");
    EXPECT_EQ(Result(L"=total"), L"#NAME?");
    EXPECT_EQ(Result(L"=TOTAL(1,2)"), L"#NAME?");
    EXPECT_EQ(Result(L"=SUM(A:A)"), L"#NAME?");
    EXPECT_EQ(Result(L"=A1:B2"), L"#VALUE!");
    EXPECT_EQ(Result(L"=A1:B2+1"), L"#VALUE!");
    EXPECT_EQ(Result(L"=1+"), L"#VALUE!");
    EXPECT_EQ(Result(L"=IV16384"), L"#CIRC!");
}

TEST(Formula, PassesErrorsOn) {
    EXPECT_EQ(Result(L"=A1+1", {{L"A1", L"=1/0"}}), L"#DIV/0!");
    EXPECT_EQ(Result(L"=-A1", {{L"A1", L"=1/0"}}), L"#DIV/0!");
    EXPECT_EQ(Result(L"=A1&\"x\"", {{L"A1", L"=1/0"}}), L"#DIV/0!");
    EXPECT_EQ(Result(L"=A1=A1", {{L"A1", L"=1/0"}}), L"#DIV/0!");
    EXPECT_EQ(Result(L"=SUM(A1:A3)", {{L"A2", L"=1/0"}}), L"#DIV/0!");
    EXPECT_EQ(Result(L"=IF(A1,1,2)", {{L"A1", L"=1/0"}}), L"#DIV/0!");
    EXPECT_EQ(Result(L"=1/0+nothing"), L"#DIV/0!");  // the left one comes first
    EXPECT_EQ(Result(L"=nothing+1/0"), L"#NAME?");
}

TEST(Formula, NeverGivesANegativeZero) {
    EXPECT_FALSE(std::signbit(ValueAt(SheetOf({{L"A1", L"=-0"}}), L"A1").number));
    EXPECT_EQ(Result(L"=-0"), L"0");
    EXPECT_EQ(Result(L"=0*-5&\"\""), L"0");
}

// ---- Functions

const CellList kMixed = {{L"A1", L"1"},    {L"A2", L"2"},    {L"A3", L"text"},
                         {L"A4", L"TRUE"}, {L"A5", L"'100"}, {L"A7", L"6"}};

TEST(Formula, SumsOnlyTheNumbersAmongCells) {
    EXPECT_EQ(Result(L"=SUM(A1:A9)", kMixed), L"9");
    EXPECT_EQ(Result(L"=AVERAGE(A1:A9)", kMixed), L"3");
    EXPECT_EQ(Result(L"=MIN(A1:A9)", kMixed), L"1");
    EXPECT_EQ(Result(L"=MAX(A1:A9)", kMixed), L"6");
    EXPECT_EQ(Result(L"=COUNT(A1:A9)", kMixed), L"3");
    EXPECT_EQ(Result(L"=SUM(A3,A4,A5)", kMixed), L"0");
}

TEST(Formula, SumsWrittenArgumentsThatReadAsNumbers) {
    EXPECT_EQ(Result(L"=SUM(1,\"2\",TRUE)"), L"4");
    EXPECT_EQ(Result(L"=SUM(1,\"x\")"), L"#VALUE!");
    EXPECT_EQ(Result(L"=COUNT(1,\"2\",TRUE,\"x\",1/0)"), L"3");
    EXPECT_EQ(Result(L"=MIN(3,-1,2)"), L"-1");
    EXPECT_EQ(Result(L"=MAX(-3,-1,-2)"), L"-1");
    EXPECT_EQ(Result(L"=AVERAGE(1,2,6)"), L"3");
}

TEST(Formula, TakesCellsBlocksAndNumbersTogether) {
    EXPECT_EQ(Result(L"=SUM(A1:B2,C3;10)", {{L"A1", L"1"}, {L"B2", L"2"}, {L"C3", L"3"}}), L"16");
    EXPECT_EQ(Result(L"=sum(b2:a1)", {{L"A1", L"1"}, {L"B2", L"2"}}), L"3");
    EXPECT_EQ(Result(L"=SUM(A1:B2,A1:B2)", {{L"A1", L"1"}, {L"B2", L"2"}}), L"6");
}

TEST(Formula, AnswersSensiblyWithoutNumbers) {
    EXPECT_EQ(Result(L"=SUM(A1:A9)"), L"0");
    EXPECT_EQ(Result(L"=MIN(A1:A9)"), L"0");
    EXPECT_EQ(Result(L"=MAX(A1:A9)"), L"0");
    EXPECT_EQ(Result(L"=COUNT(A1:A9)"), L"0");
    EXPECT_EQ(Result(L"=AVERAGE(A1:A9)"), L"#DIV/0!");
}

TEST(Formula, CountsPastErrorsInCells) {
    EXPECT_EQ(Result(L"=COUNT(A1:A3)", {{L"A1", L"1"}, {L"A2", L"=1/0"}, {L"A3", L"2"}}), L"2");
}

TEST(Formula, ChoosesByACondition) {
    EXPECT_EQ(Result(L"=IF(1<2,\"yes\",\"no\")"), L"yes");
    EXPECT_EQ(Result(L"=if(1>2;\"yes\";\"no\")"), L"no");
    EXPECT_EQ(Result(L"=IF(FALSE,1)"), L"FALSE");
    EXPECT_EQ(Result(L"=IF(5,1,2)"), L"1");
    EXPECT_EQ(Result(L"=IF(A1,1,2)"), L"2");
    EXPECT_EQ(Result(L"=IF(\"x\",1,2)"), L"#VALUE!");
    EXPECT_EQ(Result(L"=IF(TRUE,,2)"), L"0");
    EXPECT_EQ(Result(L"=IF(TRUE,1,1/0)"), L"1");
    EXPECT_EQ(Result(L"=IF(FALSE,1/0,2)"), L"2");
    EXPECT_EQ(Result(L"=IF(1,IF(0,1,2),3)"), L"2");
}

TEST(Formula, ChoosesBlocks) {
    const CellList cells = {{L"A1", L"1"}, {L"A2", L"2"}, {L"B1", L"10"}, {L"B2", L"20"}};
    EXPECT_EQ(Result(L"=SUM(IF(TRUE,A1:A2,B1:B2))", cells), L"3");
    EXPECT_EQ(Result(L"=SUM(IF(FALSE,A1:A2,B1:B2))", cells), L"30");
}

TEST(Formula, AddsManySmallNumbersExactly) {
    std::wstring formula = L"=SUM(0.1";
    for (int i = 1; i < 10; ++i) formula += L",0.1";
    EXPECT_EQ(Result(formula + L")-1"), L"0");
    EXPECT_EQ(Result(L"=SUM(1e100,1,-1e100)"), L"1");
    EXPECT_EQ(Result(L"=SUM(1e308,1e308)"), L"#NUM!");
}

}  // namespace
}  // namespace workbook
