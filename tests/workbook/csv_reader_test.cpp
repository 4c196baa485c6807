#include "csv.h"

#include "sheet_support.h"

#include <gtest/gtest.h>

#include <string>
#include <vector>

namespace workbook {
namespace {

// The texts of the cells, line by line: "a|b|c/d|e".
std::wstring Texts(const Sheet& sheet) {
    std::wstring texts;
    const SheetExtent extent = sheet.extent();
    for (int row = 0; row < extent.rows; ++row) {
        if (row > 0) texts += L"/";
        for (int column = 0; column < extent.columns; ++column) {
            if (column > 0) texts += L"|";
            texts += sheet.text({column, row});
        }
    }
    return texts;
}

std::wstring ReadTexts(std::string_view bytes) {
    const CsvResult result = ReadCsv(bytes);
    if (!result.document) return L"problem: " + result.problem->message;
    return Texts(result.document->sheet);
}

CsvFormat FormatOf(std::string_view bytes) {
    CsvResult result = ReadCsv(bytes);
    return result.document ? result.document->format : CsvFormat{L'!', false, {}, false, {}, {}};
}

CsvProblem ProblemOf(std::string_view bytes) {
    CsvResult result = ReadCsv(bytes);
    EXPECT_FALSE(result.document);
    return result.problem ? *result.problem : CsvProblem{CsvError::NoMemory, 0, 0, L"no problem"};
}

TEST(CsvReader, ReadsFieldsAndLines) {
    EXPECT_EQ(ReadTexts("a,b,c\r\nd,e,f\r\n"), L"a|b|c/d|e|f");
    EXPECT_EQ(ReadTexts("a"), L"a");
    EXPECT_EQ(ReadTexts(""), L"");
    EXPECT_EQ(ReadTexts("a,,c\n,e\n"), L"a||c/|e|");
    EXPECT_EQ(ReadTexts(" a , b "), L" a | b ");
}

TEST(CsvReader, TakesAllLineEndings) {
    for (const char* bytes : {"a,b\nc,d\n", "a,b\r\nc,d\r\n", "a,b\rc,d\r", "a,b\nc,d",
                              "a,b\r\nc,d", "a,b\rc,d", "a,b\r\nc,d\n"})
        EXPECT_EQ(ReadTexts(bytes), L"a|b/c|d");
    EXPECT_EQ(FormatOf("a,b\nc").lineEnding, LineEnding::Lf);
    EXPECT_EQ(FormatOf("a,b\r\nc").lineEnding, LineEnding::CrLf);
    EXPECT_EQ(FormatOf("a,b\rc").lineEnding, LineEnding::Cr);
    EXPECT_EQ(FormatOf("\"x\ny\",b\r\nc\n").lineEnding, LineEnding::CrLf);
    EXPECT_EQ(FormatOf("a").lineEnding, LineEnding::CrLf);
    EXPECT_TRUE(FormatOf("a\n").endsWithLineBreak);
    EXPECT_FALSE(FormatOf("a").endsWithLineBreak);
    EXPECT_FALSE(FormatOf("a\nb").endsWithLineBreak);
    EXPECT_TRUE(FormatOf("").endsWithLineBreak);
}

TEST(CsvReader, KeepsEmptyLinesAsEmptyRows) {
    EXPECT_EQ(ReadTexts("\n\na\n\nb\n"), L"//a//b");
    EXPECT_EQ(FormatOf("\n\na,b\n\n").fieldsInRow, (std::vector<std::uint16_t>{0, 0, 2, 0}));
}

TEST(CsvReader, TakesQuotedFields) {
    EXPECT_EQ(ReadTexts("\"a\",\"b,c\"\n"), L"a|b,c");
    EXPECT_EQ(ReadTexts("\"say \"\"hi\"\"\",x\n"), L"say \"hi\"|x");
    EXPECT_EQ(ReadTexts("\"\",x\n"), L"|x");
    EXPECT_EQ(ReadTexts("\"\"\"\"\n"), L"\"");
    EXPECT_EQ(ReadTexts("\"a\r\nb\nc\rd\",e\n"), L"a\r\nb\nc\rd|e");
    EXPECT_EQ(ReadTexts("x,\"end\""), L"x|end");
}

TEST(CsvReader, KeepsQuotesInsideUnquotedFields) {
    EXPECT_EQ(ReadTexts("3.5\" disk,a\"\"b\n"), L"3.5\" disk|a\"\"b");
    EXPECT_EQ(ReadTexts(" \"a\",b\n"), L" \"a\"|b");
}

TEST(CsvReader, TakesAByteOrderMarkOff) {
    EXPECT_EQ(ReadTexts("\xEF\xBB\xBF"
                        "a,b\n"),
              L"a|b");
    EXPECT_TRUE(FormatOf("\xEF\xBB\xBF"
                         "a,b\n")
                    .byteOrderMark);
    EXPECT_FALSE(FormatOf("a,b\n").byteOrderMark);
    EXPECT_EQ(ReadTexts("\xEF\xBB\xBF\"a\"\n"), L"a");
}

TEST(CsvReader, ReadsUtf8) {
    EXPECT_EQ(ReadTexts("caf\xC3\xA9,\xE2\x82\xAC\n"), L"caf\u00E9|\u20AC");
    EXPECT_EQ(ReadTexts("\xF0\x9F\x98\x80\n"), (std::wstring{wchar_t{0xD83D}, wchar_t{0xDE00}}));
}

TEST(CsvReader, ReadsSemicolonsAndTabs) {
    EXPECT_EQ(ReadTexts("a;b\n1,5;2,5\n"), L"a|b/1,5|2,5");
    EXPECT_EQ(FormatOf("a;b\n").separator, L';');
    EXPECT_EQ(ReadTexts("a\tb c\n"), L"a|b c");
    EXPECT_EQ(FormatOf("a\tb\n").separator, L'\t');
}

TEST(CsvReader, LeavesDecimalCommasAsText) {
    const CsvResult result = ReadCsv("a;b\n1,5;2.5\n");
    ASSERT_TRUE(result.document);
    EXPECT_EQ(ValueAt(result.document->sheet, L"A2").kind, ValueKind::Text);
    EXPECT_EQ(ValueAt(result.document->sheet, L"B2").kind, ValueKind::Number);
}

TEST(CsvReader, MakesFormulasOfTextsWithAnEqualsSign) {
    const CsvResult result = ReadCsv("1,2,=A1+B1\n");
    ASSERT_TRUE(result.document);
    EXPECT_EQ(Show(result.document->sheet, L"C1"), L"3");
}

TEST(CsvReader, RemembersTheShape) {
    const CsvFormat format = FormatOf("a,b,,\nc,d\n,,,\n");
    EXPECT_EQ(format.fieldsInRow, (std::vector<std::uint16_t>{4, 2, 4}));
    EXPECT_EQ(format.extent, (SheetExtent{2, 2}));
}

// ---- Problems

TEST(CsvReader, RefusesTextAfterAClosingQuote) {
    const CsvProblem problem = ProblemOf("a,b\n\"x\ny\",\"c\"d\n");
    EXPECT_EQ(problem.error, CsvError::TextAfterQuote);
    EXPECT_EQ(problem.line, 3u);
    EXPECT_EQ(problem.message, L"Line 3 has text after a closing quote.");
}

TEST(CsvReader, RefusesAnUnterminatedQuote) {
    const CsvProblem problem = ProblemOf("a,b\r\nc,\"d\r\ne,f\r\n");
    EXPECT_EQ(problem.error, CsvError::UnterminatedQuote);
    EXPECT_EQ(problem.line, 2u);  // where the quote is, not where the file ends
    EXPECT_EQ(problem.message, L"Line 2 opens a quote that is never closed.");
    EXPECT_EQ(ProblemOf("\"").error, CsvError::UnterminatedQuote);
    EXPECT_EQ(ProblemOf("\"a\"\"").error, CsvError::UnterminatedQuote);
}

TEST(CsvReader, RefusesBytesThatAreNotUtf8) {
    const CsvProblem problem = ProblemOf("a,b\nc,caf\xE9\n");
    EXPECT_EQ(problem.error, CsvError::NotUtf8);
    EXPECT_EQ(problem.byteOffset, 9u);
    EXPECT_EQ(problem.line, 2u);
    EXPECT_EQ(problem.message, L"The text is not UTF-8 (line 2, byte 9 from the beginning).");
    EXPECT_EQ(ProblemOf("\xEF\xBB\xBF"
                        "a\xFF")
                  .byteOffset,
              4u);  // the mark counts
}

TEST(CsvReader, NamesUtf16ForWhatItIs) {
    const CsvProblem problem = ProblemOf(std::string_view("\xFF\xFE"
                                                          "a\0",
                                                          4));
    EXPECT_EQ(problem.error, CsvError::NotUtf8);
    EXPECT_NE(problem.message.find(L"UTF-16"), std::wstring::npos);
}

TEST(CsvReader, RefusesZeroBytes) {
    const CsvProblem problem = ProblemOf(std::string_view("a\nb\0c", 5));
    EXPECT_EQ(problem.error, CsvError::ZeroByte);
    EXPECT_EQ(problem.byteOffset, 3u);
    EXPECT_EQ(problem.line, 2u);
}

TEST(CsvReader, TakesAsManyColumnsAsTheSheetHas) {
    const std::string line(255, ',');
    EXPECT_TRUE(ReadCsv("a\n" + line + "z\n").document);
    const CsvProblem problem = ProblemOf("a\n" + line + "y,z\n");
    EXPECT_EQ(problem.error, CsvError::TooManyColumns);
    EXPECT_EQ(problem.line, 2u);
    EXPECT_EQ(problem.message, L"Line 2 has more than 256 columns.");
}

TEST(CsvReader, TakesAsManyRowsAsTheSheetHas) {
    std::string bytes;
    for (int row = 0; row < kRowCount; ++row) bytes += "x\n";
    const CsvResult full = ReadCsv(bytes);
    ASSERT_TRUE(full.document);
    EXPECT_EQ(full.document->sheet.extent(), (SheetExtent{1, kRowCount}));
    const CsvProblem problem = ProblemOf(bytes + "y");
    EXPECT_EQ(problem.error, CsvError::TooManyRows);
    EXPECT_EQ(problem.line, 16385u);
    EXPECT_EQ(problem.message, L"Line 16385 is one too many: a sheet has 16,384 rows.");
}

TEST(CsvReader, TakesCellsUpToTheLongestText) {
    const std::string longest(kLongestCellText, 'x');
    EXPECT_TRUE(ReadCsv(longest).document);
    const CsvProblem problem = ProblemOf("a\nb,\"\n" + longest + "\"\n");
    EXPECT_EQ(problem.error, CsvError::CellTooLong);
    EXPECT_EQ(problem.line, 2u);
    EXPECT_EQ(problem.message, L"Line 2 has a cell of more than 32,767 characters.");
}

TEST(CsvReader, RefusesFilesThatAreTooLarge) {
    std::string bytes(kLargestFile + 1, '\n');
    const CsvProblem problem = ProblemOf(bytes);
    EXPECT_EQ(problem.error, CsvError::FileTooLarge);
    EXPECT_EQ(problem.message, L"The file is larger than 64 MB.");
    bytes.pop_back();
    EXPECT_EQ(ProblemOf(bytes).error, CsvError::TooManyRows);
}

TEST(CsvReader, FillsAWholeSheet) {
    std::string line = "1";
    for (int column = 1; column < kColumnCount; ++column) line += ",1";
    line += "\n";
    std::string bytes;
    for (int row = 0; row < kRowCount; ++row) bytes += line;
    const CsvResult result = ReadCsv(bytes);
    ASSERT_TRUE(result.document) << result.problem->message;
    EXPECT_EQ(result.document->sheet.occupiedCells(), 256u * 16384u);
    EXPECT_EQ(Show(result.document->sheet, L"IV16384"), L"1");
}

}  // namespace
}  // namespace workbook
