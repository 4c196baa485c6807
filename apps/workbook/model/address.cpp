#include "address.h"

#include <algorithm>

namespace workbook {

namespace {

// More letters than any column has, and a row number that can grow no further.
constexpr size_t kMostColumnLetters = 3;
constexpr int kRowCeiling = 10'000'000;

constexpr bool IsDigit(wchar_t c) { return c >= L'0' && c <= L'9'; }

constexpr int LetterNumber(wchar_t c) {  // A = 1; 0: no letter
    if (c >= L'A' && c <= L'Z') return c - L'A' + 1;
    if (c >= L'a' && c <= L'z') return c - L'a' + 1;
    return 0;
}

}  // namespace

std::optional<Block> ClipToSheet(const Block& block) {
    const Block clipped{std::max(block.left, 0), std::max(block.top, 0),
                        std::min(block.right, kColumnCount - 1),
                        std::min(block.bottom, kRowCount - 1)};
    if (clipped.left > clipped.right || clipped.top > clipped.bottom) return std::nullopt;
    return clipped;
}

std::wstring ColumnName(int column) {
    if (column < 0 || column >= kColumnCount) return {};
    std::wstring name;
    if (column >= 26) name += static_cast<wchar_t>(L'A' + column / 26 - 1);
    name += static_cast<wchar_t>(L'A' + column % 26);
    return name;
}

std::wstring FormatAddress(CellAddress cell) {
    if (!IsInSheet(cell)) return {};
    return ColumnName(cell.column) + std::to_wstring(cell.row + 1);
}

std::wstring FormatBlock(const Block& block) {
    const std::wstring first = FormatAddress({block.left, block.top});
    if (block.left == block.right && block.top == block.bottom) return first;
    return first + L":" + FormatAddress({block.right, block.bottom});
}

ScannedReference ScanReference(std::wstring_view text) {
    size_t at = 0;
    const auto skipDollar = [&] { at += at < text.size() && text[at] == L'$'; };

    skipDollar();
    size_t letters = 0;
    int column = 0;
    for (; at < text.size() && LetterNumber(text[at]) != 0; ++at) {
        if (++letters > kMostColumnLetters) return {};
        column = column * 26 + LetterNumber(text[at]);
    }
    if (letters == 0) return {};

    skipDollar();
    size_t digits = 0;
    int row = 0;
    for (; at < text.size() && IsDigit(text[at]); ++at, ++digits)
        row = std::min(row * 10 + (text[at] - L'0'), kRowCeiling);
    if (digits == 0 || at != text.size()) return {};

    const CellAddress cell{column - 1, row - 1};
    if (!IsInSheet(cell)) return {ReferenceSyntax::OutsideSheet, {}};
    return {ReferenceSyntax::Cell, cell};
}

std::optional<CellAddress> ParseAddress(std::wstring_view text) {
    const ScannedReference scanned = ScanReference(text);
    if (scanned.syntax != ReferenceSyntax::Cell) return std::nullopt;
    return scanned.cell;
}

std::optional<Block> ParseBlock(std::wstring_view text) {
    const size_t colon = text.find(L':');
    const auto first = ParseAddress(text.substr(0, colon));
    if (!first) return std::nullopt;
    if (colon == std::wstring_view::npos) return BlockOf(*first);
    const auto second = ParseAddress(text.substr(colon + 1));
    if (!second) return std::nullopt;
    return BlockBetween(*first, *second);
}

}  // namespace workbook
