// Random sheets written and read back, and damaged files read, always with the same random numbers.
#include "csv.h"

#include "sheet_support.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <random>
#include <string>

namespace workbook {
namespace {

class Chance {
public:
    explicit Chance(unsigned seed) : random_(seed) {}

    int pick(int count) { return std::uniform_int_distribution<int>(0, count - 1)(random_); }

    // Full of what could go wrong.
    std::wstring text() {
        static const std::wstring kPieces[] = {L",",
                                               L";",
                                               L"\t",
                                               L"\"",
                                               L"\"\"",
                                               L"\r",
                                               L"\n",
                                               L"\r\n",
                                               L" ",
                                               L"'",
                                               L"=",
                                               L"1",
                                               L"1.5",
                                               L"a",
                                               L"\u00E9",
                                               L"\u20AC",
                                               {wchar_t{0xD83D}, wchar_t{0xDE00}},
                                               L"\xFEFF",
                                               L"A1+",
                                               L"true"};
        std::wstring result;
        for (int i = pick(5); i >= 0; --i) result += kPieces[pick(std::size(kPieces))];
        return result;
    }

    CsvFormat format() {
        CsvFormat format;
        format.separator = L",;\t"[pick(3)];
        format.byteOrderMark = pick(2) == 0;
        format.lineEnding = static_cast<LineEnding>(pick(3));
        format.endsWithLineBreak = pick(2) == 0;
        return format;
    }

    Sheet sheet() {
        Sheet sheet;
        const int columns = pick(6) + 1;
        const int rows = pick(10) + 1;
        for (int i = pick(columns * rows); i >= 0; --i)
            sheet.setText({pick(columns), pick(rows)}, text());
        return sheet;
    }

private:
    int pick(size_t count) { return pick(static_cast<int>(count)); }

    std::mt19937 random_;
};

void ExpectSameCells(const Sheet& one, const Sheet& other, const std::string& bytes) {
    ASSERT_EQ(one.extent(), other.extent()) << bytes;
    for (int row = 0; row < one.extent().rows; ++row)
        for (int column = 0; column < one.extent().columns; ++column)
            ASSERT_EQ(one.text({column, row}), other.text({column, row}))
                << FormatAddress({column, row}) << " in\n"
                << bytes;
}

size_t LineCount(const std::string& bytes) {
    return 1 + static_cast<size_t>(
                   std::ranges::count_if(bytes, [](char c) { return c == '\r' || c == '\n'; }));
}

TEST(CsvRandom, SheetsComeBackCellByCell) {
    for (unsigned seed = 1; seed <= 3000; ++seed) {
        Chance chance(seed);
        const Sheet sheet = chance.sheet();
        const CsvFormat format = chance.format();
        const std::string bytes = WriteCsv(sheet, format);
        const CsvResult result = ReadCsv(bytes);
        ASSERT_TRUE(result.document) << "seed " << seed << ": " << result.problem->message << bytes;
        ExpectSameCells(sheet, result.document->sheet, bytes);
        if (HasFatalFailure()) return;

        EXPECT_EQ(result.document->format.byteOrderMark, format.byteOrderMark);
        if (sheet.extent().columns > 1) {
            EXPECT_EQ(result.document->format.separator, format.separator) << bytes;
        }
        if (sheet.extent().rows > 1) {
            EXPECT_EQ(result.document->format.lineEnding, format.lineEnding) << bytes;
        }
        // Written again as it was read, the file is the same.
        EXPECT_EQ(WriteCsv(result.document->sheet, result.document->format), bytes);
    }
}

TEST(CsvRandom, DamagedFilesAreReadOrRefusedWithALine) {
    int read = 0;
    int refused = 0;
    for (unsigned seed = 1; seed <= 3000; ++seed) {
        Chance chance(seed + 100000);
        std::string bytes = WriteCsv(chance.sheet(), chance.format());
        for (int damages = chance.pick(3) + 1; damages > 0 && !bytes.empty(); --damages) {
            const auto at = static_cast<size_t>(chance.pick(static_cast<int>(bytes.size())));
            switch (chance.pick(3)) {
            case 0: bytes.erase(at, 1); break;
            case 1: bytes.insert(at, 1, "\",;\n\rx"[chance.pick(6)]); break;
            default: bytes[at] = static_cast<char>(chance.pick(256)); break;
            }
        }
        const CsvResult result = ReadCsv(bytes);
        ASSERT_NE(result.document.has_value(), result.problem.has_value());
        if (result.problem) {
            ++refused;
            EXPECT_GE(result.problem->line, 1u);
            EXPECT_LE(result.problem->line, LineCount(bytes));
            EXPECT_TRUE(result.problem->message.ends_with(L".")) << result.problem->message;
            continue;
        }
        ++read;
        const CsvResult again = ReadCsv(WriteCsv(result.document->sheet, result.document->format));
        ASSERT_TRUE(again.document) << "seed " << seed;
        ExpectSameCells(result.document->sheet, again.document->sheet, bytes);
        if (HasFatalFailure()) return;
    }
    EXPECT_GT(read, 500);
    EXPECT_GT(refused, 500);
}

}  // namespace
}  // namespace workbook
