#include "csv.h"

#include "sheet_support.h"

#include <gtest/gtest.h>

#include <string>

namespace workbook {
namespace {

std::string Write(CellList cells, const CsvFormat& format = {}) {
    return WriteCsv(SheetOf(cells), format);
}

// What becomes of a file that is opened, changed and saved.
template <typename Change>
std::string Rewrite(std::string_view bytes, Change change) {
    CsvResult result = ReadCsv(bytes);
    if (!result.document) return "cannot be read";
    change(result.document->sheet);
    return WriteCsv(result.document->sheet, result.document->format);
}

std::string Rewrite(std::string_view bytes) {
    return Rewrite(bytes, [](Sheet&) {});
}

TEST(CsvWriter, WritesNewFilesWithCommasAndCrLf) {
    EXPECT_EQ(Write({{L"A1", L"a"}, {L"B1", L"b"}, {L"A2", L"1"}}), "a,b\r\n1,\r\n");
    EXPECT_EQ(Write({}), "");
    EXPECT_EQ(Write({{L"B2", L"x"}}), ",\r\n,x\r\n");
}

TEST(CsvWriter, WritesWhatWasTyped) {
    EXPECT_EQ(Write({{L"A1", L"007"}, {L"B1", L"=A1 * 2"}, {L"C1", L"'x"}, {L"D1", L"12%"}}),
              "007,=A1 * 2,'x,12%\r\n");
    EXPECT_EQ(Write({{L"A1", L"=SUM(B1,C1)"}, {L"A2", L"=1/0"}}), "\"=SUM(B1,C1)\"\r\n=1/0\r\n");
}

TEST(CsvWriter, QuotesWhereNeededOnly) {
    EXPECT_EQ(Write({{L"A1", L"a,b"}}), "\"a,b\"\r\n");
    EXPECT_EQ(Write({{L"A1", L"say \"hi\""}}), "\"say \"\"hi\"\"\"\r\n");
    EXPECT_EQ(Write({{L"A1", L"a\nb"}}), "\"a\nb\"\r\n");
    EXPECT_EQ(Write({{L"A1", L"a\rb"}}), "\"a\rb\"\r\n");
    EXPECT_EQ(Write({{L"A1", L" a 'b' "}}), " a 'b' \r\n");
    EXPECT_EQ(Write({{L"A1", L"a;b"}, {L"B1", L"c"}, {L"C1", L"d"}}), "a;b,c,d\r\n");
}

TEST(CsvWriter, KeepsTheFormatOfTheFile) {
    CsvFormat format;
    format.separator = L';';
    format.byteOrderMark = true;
    format.lineEnding = LineEnding::Lf;
    EXPECT_EQ(Write({{L"A1", L"a,b"}, {L"B1", L"c;d"}, {L"A2", L"x"}}, format),
              "\xEF\xBB\xBF"
              "a,b;\"c;d\"\nx;\n");
    format = {};
    format.separator = L'\t';
    format.lineEnding = LineEnding::Cr;
    EXPECT_EQ(Write({{L"A1", L"a"}, {L"B1", L"b"}, {L"A2", L"x"}}, format), "a\tb\rx\t\r");
}

TEST(CsvWriter, QuotesOtherSeparatorsWhenTheyWouldMislead) {
    // Unquoted, a reader would take the semicolons for the separators of this single column.
    EXPECT_EQ(Write({{L"A1", L"a;b"}, {L"A2", L"c;d"}}), "\"a;b\"\r\n\"c;d\"\r\n");
    EXPECT_EQ(Write({{L"A1", L"a;b"}, {L"B1", L"c;d"}}), "\"a;b\",\"c;d\"\r\n");
}

TEST(CsvWriter, ReproducesFilesByteForByte) {
    for (const char* bytes : {"a,b\r\n1,2\r\n",
                              "a,b\n1,2\n",
                              "a,b\r1,2\r",
                              "a;b\n1,5;2\n",
                              "a\tb\n",
                              "a,b\n1,2",
                              "\xEF\xBB\xBF"
                              "a,b\n",
                              "a,b,,\n1,2,,\n",
                              "a\n\nb\n",
                              "a,b\n\n\n",
                              "\n\na,b\n",
                              "\n",
                              "",
                              "a,b,c\nd\ne,f\n",
                              "a,\n,\n",
                              ",,\n,,\n",
                              "\"a,b\",\"c\"\"d\"\n",
                              "caf\xC3\xA9,\"x\ny\"\n",
                              "'1,=A1\n",
                              "a,b\n1,2\n,\n",
                              "x\n\n\n\n",
                              "a"})
        EXPECT_EQ(Rewrite(bytes), bytes);
}

TEST(CsvWriter, TakesNeedlessQuotesOff) { EXPECT_EQ(Rewrite("\"a\",\"b\"\n"), "a,b\n"); }

TEST(CsvWriter, ProtectsAByteOrderMarkInTheFirstCell) {
    const std::string bytes = Write({{L"A1", L"\xFEFFx"}});
    EXPECT_EQ(bytes, "\"\xEF\xBB\xBFx\"\r\n");
    CsvFormat format;
    format.byteOrderMark = true;
    EXPECT_EQ(Write({{L"A1", L"\xFEFFx"}}, format), "\xEF\xBB\xBF\xEF\xBB\xBFx\r\n");
}

TEST(CsvWriter, KeepsARectangleWhenCellsAreAdded) {
    EXPECT_EQ(Rewrite("a,b\n1,2\n", [](Sheet& sheet) { sheet.setText(At(L"A3"), L"x"); }),
              "a,b\n1,2\nx,\n");
    EXPECT_EQ(Rewrite("a,b\n1,2\n", [](Sheet& sheet) { sheet.setText(At(L"C1"), L"x"); }),
              "a,b,x\n1,2,\n");
}

TEST(CsvWriter, KeepsRaggedLinesWhenCellsAreAdded) {
    EXPECT_EQ(Rewrite("title\na,b,c\n", [](Sheet& sheet) { sheet.setText(At(L"B3"), L"x"); }),
              "title\na,b,c\n,x\n");
}

TEST(CsvWriter, LeavesOutRowsAndColumnsEmptiedAtTheEnd) {
    EXPECT_EQ(Rewrite("a,b\n1,2\n3,4\n",
                      [](Sheet& sheet) {
                          sheet.setText(At(L"A3"), L"");
                          sheet.setText(At(L"B3"), L"");
                      }),
              "a,b\n1,2\n");
    EXPECT_EQ(Rewrite("a,b\n1,2\n",
                      [](Sheet& sheet) {
                          sheet.setText(At(L"B1"), L"");
                          sheet.setText(At(L"B2"), L"");
                      }),
              "a\n1\n");
    EXPECT_EQ(Rewrite("a,b\n1,2\n", [](Sheet& sheet) { sheet.setText(At(L"B2"), L""); }),
              "a,b\n1,\n");
}

TEST(CsvWriter, WritesNothingForAFileThatWasEmptied) {
    EXPECT_EQ(Rewrite("a\n", [](Sheet& sheet) { sheet.setText(At(L"A1"), L""); }), "");
}

}  // namespace
}  // namespace workbook
