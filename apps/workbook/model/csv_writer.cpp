// Writes CSV: the texts of the cells as they were typed, in the manner of the file they came from.
#include "csv.h"
#include "csv_separator.h"
#include "utf8.h"

#include <algorithm>

namespace workbook {

namespace {

std::string_view LineBreakOf(LineEnding ending) {
    switch (ending) {
    case LineEnding::Lf: return "\n";
    case LineEnding::Cr: return "\r";
    case LineEnding::CrLf: break;
    }
    return "\r\n";
}

// How many lines to write, and how many fields in each.
//
// A file whose lines all had the same number of fields stays such a rectangle, grown to what is
// occupied now; in any other file each line keeps its own number. Where the last rows or columns
// were emptied since the file was read, they are left out.
class Outline {
public:
    Outline(const Sheet& sheet, const CsvFormat& format)
        : sheet_(sheet), format_(format), now_(sheet.extent()) {
        const auto& fields = format.fieldsInRow;
        isRectangle_ = fields.empty() || std::ranges::count(fields, fields[0]) ==
                                             static_cast<std::ptrdiff_t>(fields.size());
    }

    int rows() const {
        if (now_.rows < format_.extent.rows) return now_.rows;
        return std::max(now_.rows, static_cast<int>(format_.fieldsInRow.size()));
    }

    int fieldsIn(int row) const {
        if (isRectangle_) return std::max(fieldsAsRead(0), now_.columns);
        int occupied = now_.columns;
        while (occupied > 0 && sheet_.isEmpty({occupied - 1, row})) --occupied;
        return std::max(fieldsAsRead(row), occupied);
    }

private:
    int fieldsAsRead(int row) const {
        if (row >= static_cast<int>(format_.fieldsInRow.size())) return 0;
        const int fields = format_.fieldsInRow[static_cast<size_t>(row)];
        return now_.columns < format_.extent.columns ? std::min(fields, now_.columns) : fields;
    }

    const Sheet& sheet_;
    const CsvFormat& format_;
    const SheetExtent now_;
    bool isRectangle_ = true;
};

// Writes the lines. A field is quoted when it has one of the characters of `quoted`.
std::string WriteLines(const Sheet& sheet, const CsvFormat& format, std::wstring_view quoted) {
    const Outline outline(sheet, format);
    const std::string_view lineBreak = LineBreakOf(format.lineEnding);
    const int rows = outline.rows();
    std::string bytes;
    const auto appendField = [&](const std::wstring& text) {
        // At the beginning of a file a byte-order mark would be taken for the file's own.
        const bool looksLikeMark =
            bytes.empty() && !format.byteOrderMark && text.starts_with(L'\xFEFF');
        if (text.find_first_of(quoted) == std::wstring::npos && !looksLikeMark)
            return AppendUtf8(bytes, text);
        std::wstring doubled;
        for (const wchar_t c : text) doubled.append(c == L'"' ? 2 : 1, c);
        bytes += '"';
        AppendUtf8(bytes, doubled);
        bytes += '"';
    };

    for (int row = 0; row < rows; ++row) {
        const int fields = outline.fieldsIn(row);
        for (int column = 0; column < fields; ++column) {
            if (column > 0) bytes += static_cast<char>(format.separator);
            appendField(sheet.text({column, row}));
        }
        if (row + 1 < rows || format.endsWithLineBreak) bytes += lineBreak;
    }
    return bytes;
}

}  // namespace

std::string WriteCsv(const Sheet& sheet, const CsvFormat& format) {
    const std::wstring mustBeQuoted = std::wstring(L"\"\r\n") + format.separator;
    std::string bytes = WriteLines(sheet, format, mustBeQuoted);

    // Texts with other separators in them may outnumber the real ones, so that reading the file
    // would cut it up differently. Then those texts need quotes, too.
    const auto found = DetectSeparator(bytes);
    if (found && *found != static_cast<char>(format.separator))
        bytes = WriteLines(sheet, format, L"\"\r\n,;\t");

    if (format.byteOrderMark) bytes.insert(0, kUtf8Mark);
    return bytes;
}

}  // namespace workbook
