#include "tab_text.h"

#include <optional>
#include <utility>

namespace workbook {

namespace {

bool NeedsQuotes(const std::wstring& cell) {
    return cell.find_first_of(L"\t\r\n\"") != std::wstring::npos;
}

void AppendCell(std::wstring& text, const std::wstring& cell) {
    if (!NeedsQuotes(cell)) {
        text += cell;
        return;
    }
    text += L'"';
    for (const wchar_t character : cell) {
        if (character == L'"') text += L'"';
        text += character;
    }
    text += L'"';
}

// Reads from the front of a text.
class Reader {
public:
    explicit Reader(std::wstring_view text) : rest_(text) {}

    bool isAtEnd() const { return rest_.empty(); }

    std::wstring readCell() {
        if (std::optional<std::wstring> quoted = readQuoted()) return std::move(*quoted);
        const std::wstring_view cell = rest_.substr(0, rest_.find_first_of(L"\t\r\n"));
        rest_.remove_prefix(cell.size());
        return std::wstring(cell);
    }

    // Whether another cell of the same row follows; otherwise the row's end is passed.
    bool passSeparator() {
        if (rest_.empty()) return false;
        const bool sameRow = rest_.front() == L'\t';
        rest_.remove_prefix(rest_.starts_with(L"\r\n") ? 2 : 1);
        return sameRow;
    }

private:
    // Nothing, and nothing read, when there is no well-formed quoted cell.
    std::optional<std::wstring> readQuoted() {
        if (!rest_.starts_with(L'"')) return std::nullopt;
        std::wstring cell;
        size_t at = 1;
        for (; at < rest_.size(); ++at) {
            if (rest_[at] == L'"') {
                if (at + 1 == rest_.size() || rest_[at + 1] != L'"') break;
                ++at;
            }
            cell += rest_[at];
        }
        const size_t after = at + 1;
        const bool isClosed = at < rest_.size();
        const bool endsCell =
            after >= rest_.size() || std::wstring_view(L"\t\r\n").find(rest_[after]) != rest_.npos;
        if (!isClosed || !endsCell) return std::nullopt;
        rest_.remove_prefix(after);
        return cell;
    }

    std::wstring_view rest_;
};

}  // namespace

std::wstring WriteTabText(const std::vector<TextRow>& rows) {
    std::wstring text;
    for (const TextRow& row : rows) {
        for (size_t column = 0; column < row.size(); ++column) {
            if (column > 0) text += L'\t';
            AppendCell(text, row[column]);
        }
        text += L"\r\n";
    }
    return text;
}

std::vector<TextRow> ReadTabText(std::wstring_view text) {
    std::vector<TextRow> rows;
    Reader reader(text);
    while (!reader.isAtEnd()) {
        TextRow row;
        do {
            row.push_back(reader.readCell());
        } while (reader.passSeparator());
        rows.push_back(std::move(row));
    }
    return rows;
}

}  // namespace workbook
