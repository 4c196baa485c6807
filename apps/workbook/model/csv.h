// Comma-separated text (RFC 4180 and its relatives) into a sheet, and back.
//
// Read: UTF-8 with or without a byte-order mark; lines ending in CRLF, LF or CR; fields separated
// by comma, semicolon or tab, whichever the first lines use consistently outside quotes. Quoted
// fields may hold separators, line breaks and doubled quotes. An empty line is an empty row.
// Numbers have a decimal point; with decimal commas ("1,5", usual in semicolon files) they stay
// text.
#ifndef WORKBOOK_MODEL_CSV_H
#define WORKBOOK_MODEL_CSV_H

#include "sheet.h"

#include <cstdint>
#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace workbook {

constexpr size_t kLargestFile = size_t{64} << 20;  // bytes

enum class LineEnding { CrLf, Lf, Cr };

// How a file was written, so that it can be saved alike. The defaults are those of new files.
struct CsvFormat {
    wchar_t separator = L',';
    bool byteOrderMark = false;
    LineEnding lineEnding = LineEnding::CrLf;  // the first one of the file counts
    bool endsWithLineBreak = true;

    // The shape as read: how many fields each line had (0 for an empty line) and how far the
    // occupied cells reached. Empty fields at the ends of lines are in no cell; these numbers bring
    // them back.
    std::vector<std::uint16_t> fieldsInRow;
    SheetExtent extent;
};

enum class CsvError {
    FileTooLarge,
    NotUtf8,
    ZeroByte,        // a binary file
    TextAfterQuote,  // "abc"d
    UnterminatedQuote,
    TooManyColumns,
    TooManyRows,
    CellTooLong,
    NoMemory
};

struct CsvProblem {
    CsvError error;
    size_t line = 0;        // counted from 1 as text editors do; 0: the file as a whole
    size_t byteOffset = 0;  // from the beginning of the file, for NotUtf8 and ZeroByte
    std::wstring message;   // a sentence for the user; it names the line or the limit
};

// Fills a new sheet; an open one is not touched by reading.
struct CsvDocument {
    Sheet sheet;
    CsvFormat format;
};

struct CsvResult {
    std::optional<CsvDocument> document;  // nothing when there was a problem
    std::optional<CsvProblem> problem;
};

// Reads a file's bytes.
CsvResult ReadCsv(std::string_view bytes) noexcept;

// The bytes of a file with the sheet's cells as they were typed, formulas as formulas. Fields are
// quoted where they must be and nowhere else. A file that is read and written without a change
// comes out the same, unless it had needless quotes or mixed line endings. Throws std::bad_alloc.
std::string WriteCsv(const Sheet& sheet, const CsvFormat& format);

}  // namespace workbook

#endif
