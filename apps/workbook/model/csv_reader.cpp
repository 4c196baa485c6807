// Reads CSV: from bytes to a new sheet, or to a message that says where it went wrong.
#include "csv.h"
#include "csv_separator.h"
#include "last_words.h"
#include "utf8.h"

#include <new>
#include <utility>

namespace workbook {

namespace {

constexpr bool IsLineBreak(char c) { return c == '\r' || c == '\n'; }

// How many characters the line break at `at` has.
size_t LineBreakLength(std::string_view bytes, size_t at) {
    return bytes.substr(at, 2) == "\r\n" ? 2 : 1;
}

size_t CountLineBreaks(std::string_view bytes) {
    size_t count = 0;
    for (size_t at = 0; at < bytes.size();) {
        const bool isBreak = IsLineBreak(bytes[at]);
        count += isBreak;
        at += isBreak ? LineBreakLength(bytes, at) : 1;
    }
    return count;
}

LineEnding LineEndingAt(std::string_view bytes, size_t at) {
    if (bytes[at] == '\n') return LineEnding::Lf;
    return LineBreakLength(bytes, at) == 2 ? LineEnding::CrLf : LineEnding::Cr;
}

std::wstring LineText(size_t line) { return L"Line " + std::to_wstring(line); }

CsvProblem FileProblemOf(CsvError error, std::wstring message) {
    return {error, 0, 0, std::move(message)};
}

CsvProblem LineProblem(CsvError error, size_t line, const std::wstring& rest) {
    return {error, line, 0, LineText(line) + rest};
}

CsvProblem ByteProblem(CsvError error, std::string_view bytes, size_t offset,
                       const std::wstring& what) {
    const size_t line = CountLineBreaks(bytes.substr(0, offset)) + 1;
    return {error, line, offset,
            what + L" (line " + std::to_wstring(line) + L", byte " + std::to_wstring(offset) +
                L" from the beginning)."};
}

// What rules the file out as a whole. `bytes` is all of it, with the byte-order mark.
std::optional<CsvProblem> FindFileProblem(std::string_view bytes) {
    if (bytes.size() > kLargestFile)
        return FileProblemOf(CsvError::FileTooLarge, L"The file is larger than 64 MB.");
    if (bytes.starts_with("\xFF\xFE") || bytes.starts_with("\xFE\xFF"))
        return ByteProblem(CsvError::NotUtf8, bytes, 0,
                           L"The file is UTF-16 text; save it as UTF-8 first");
    const auto invalid = FindInvalidUtf8(bytes);
    if (invalid) return ByteProblem(CsvError::NotUtf8, bytes, *invalid, L"The text is not UTF-8");
    const size_t zero = bytes.find('\0');
    if (zero != std::string_view::npos)
        return ByteProblem(CsvError::ZeroByte, bytes, zero,
                           L"The file is not a text: it has a zero byte");
    return std::nullopt;
}

// Goes through valid UTF-8 once, from record to record. Positions are in bytes, lines counted
// from 1.
class RecordReader {
public:
    RecordReader(std::string_view bytes, CsvDocument& document)
        : bytes_(bytes), document_(document),
          separator_(static_cast<char>(document.format.separator)) {}

    // False when problem() says why not.
    bool readAll() {
        int row = 0;
        for (; at_ < bytes_.size(); ++row) {
            if (row == kRowCount)
                return fail(CsvError::TooManyRows, line_,
                            L" is one too many: a sheet has 16,384 rows.");
            if (!readRecord(row)) return false;
        }
        document_.format.extent = document_.sheet.extent();
        return true;
    }

    CsvProblem& problem() { return *problem_; }

private:
    bool fail(CsvError error, size_t line, const std::wstring& rest) {
        problem_ = LineProblem(error, line, rest);
        return false;
    }

    bool isAtFieldEnd() const {
        return at_ == bytes_.size() || bytes_[at_] == separator_ || IsLineBreak(bytes_[at_]);
    }

    // One line, or several when quoted fields have line breaks; its line break included.
    bool readRecord(int row) {
        int fields = 0;
        if (!IsLineBreak(bytes_[at_])) {
            for (bool isLast = false; !isLast; ++fields) {
                if (fields == kColumnCount)
                    return fail(CsvError::TooManyColumns, line_, L" has more than 256 columns.");
                if (!readField({fields, row})) return false;
                isLast = at_ == bytes_.size() || bytes_[at_] != separator_;
                at_ += !isLast;
            }
        }
        document_.format.fieldsInRow.push_back(static_cast<std::uint16_t>(fields));
        endLine(row);
        return true;
    }

    void endLine(int row) {
        CsvFormat& format = document_.format;
        format.endsWithLineBreak = at_ < bytes_.size();
        if (!format.endsWithLineBreak) return;
        if (row == 0) format.lineEnding = LineEndingAt(bytes_, at_);
        at_ += LineBreakLength(bytes_, at_);
        ++line_;
    }

    bool readField(CellAddress cell) {
        const size_t firstLine = line_;
        raw_.clear();
        if (at_ < bytes_.size() && bytes_[at_] == '"') {
            if (!readQuoted()) return false;
        } else {
            const size_t first = at_;
            while (!isAtFieldEnd()) ++at_;
            raw_ = bytes_.substr(first, at_ - first);
        }

        std::wstring text;
        AppendUtf16(text, raw_);
        if (text.size() > kLongestCellText)
            return fail(CsvError::CellTooLong, firstLine,
                        L" has a cell of more than 32,767 characters.");
        if (!text.empty()) document_.sheet.setText(cell, std::move(text));
        return true;
    }

    bool readQuoted() {
        const size_t firstLine = line_;
        for (;;) {
            const size_t first = at_ + 1;
            at_ = bytes_.find('"', first);
            if (at_ == std::string_view::npos)
                return fail(CsvError::UnterminatedQuote, firstLine,
                            L" opens a quote that is never closed.");
            const std::string_view part = bytes_.substr(first, at_ - first);
            raw_ += part;
            line_ += CountLineBreaks(part);
            ++at_;
            if (at_ == bytes_.size() || bytes_[at_] != '"') break;
            raw_ += '"';
        }
        if (isAtFieldEnd()) return true;
        return fail(CsvError::TextAfterQuote, line_, L" has text after a closing quote.");
    }

    std::string_view bytes_;
    CsvDocument& document_;
    const char separator_;
    size_t at_ = 0;
    size_t line_ = 1;
    std::string raw_;  // the field being read, without its quotes
    std::optional<CsvProblem> problem_;
};

CsvResult ReadUnguarded(std::string_view bytes) {
    CsvResult result;
    result.problem = FindFileProblem(bytes);
    if (result.problem) return result;

    CsvDocument document;
    document.format.byteOrderMark = bytes.starts_with(kUtf8Mark);
    if (document.format.byteOrderMark) bytes.remove_prefix(kUtf8Mark.size());
    document.format.separator = static_cast<wchar_t>(DetectSeparator(bytes).value_or(','));

    RecordReader reader(bytes, document);
    if (reader.readAll())
        result.document = std::move(document);
    else
        result.problem = std::move(reader.problem());
    return result;
}

}  // namespace

CsvResult ReadCsv(std::string_view bytes) noexcept {
    try {
        return ReadUnguarded(bytes);
    } catch (const std::bad_alloc&) {
        CsvResult result;
        result.problem.emplace();
        result.problem->error = CsvError::NoMemory;
        result.problem->message = TextOrNothing(L"There is not enough memory for the file.");
        return result;
    }
}

}  // namespace workbook
