// Cells and blocks of the sheet, and how they are written: "B4", "A1:C3".
#ifndef WORKBOOK_MODEL_ADDRESS_H
#define WORKBOOK_MODEL_ADDRESS_H

#include <optional>
#include <string>
#include <string_view>

namespace workbook {

// The grid's limits.
constexpr int kColumnCount = 256;
constexpr int kRowCount = 16384;

// A cell, counted from 0: A1 is {0, 0}.
struct CellAddress {
    int column = 0;
    int row = 0;

    friend bool operator==(const CellAddress&, const CellAddress&) = default;
};

// A rectangle of cells, both ends inclusive; left <= right and top <= bottom.
struct Block {
    int left = 0;
    int top = 0;
    int right = 0;
    int bottom = 0;

    friend bool operator==(const Block&, const Block&) = default;
};

constexpr bool IsInSheet(CellAddress cell) {
    return cell.column >= 0 && cell.column < kColumnCount && cell.row >= 0 && cell.row < kRowCount;
}

constexpr bool Contains(const Block& block, CellAddress cell) {
    return cell.column >= block.left && cell.column <= block.right && cell.row >= block.top &&
           cell.row <= block.bottom;
}

constexpr Block BlockOf(CellAddress cell) { return {cell.column, cell.row, cell.column, cell.row}; }

// The block between two corners, given in any order.
constexpr Block BlockBetween(CellAddress one, CellAddress other) {
    return {one.column < other.column ? one.column : other.column,
            one.row < other.row ? one.row : other.row,
            one.column < other.column ? other.column : one.column,
            one.row < other.row ? other.row : one.row};
}

// The part of `block` that lies in the sheet, or nothing.
std::optional<Block> ClipToSheet(const Block& block);

// "A" to "IV"; empty for a column outside the sheet.
std::wstring ColumnName(int column);

// "B4"; empty for a cell outside the sheet.
std::wstring FormatAddress(CellAddress cell);

// "A1:C3", or "B4" for a single cell.
std::wstring FormatBlock(const Block& block);

// Reads "B4", "b4" or "$B$4", with nothing before or after it. Nothing when the text is no address
// or names a cell outside the sheet.
std::optional<CellAddress> ParseAddress(std::wstring_view text);

// Reads "A1:C3" (corners in any order) or a single cell.
std::optional<Block> ParseBlock(std::wstring_view text);

enum class ReferenceSyntax {
    NotAReference,  // "ABC", "1A", "A0x"
    OutsideSheet,   // looks like a reference, but there is no such cell: "IW1", "A16385", "A0"
    Cell
};

struct ScannedReference {
    ReferenceSyntax syntax = ReferenceSyntax::NotAReference;
    CellAddress cell;  // for ReferenceSyntax::Cell
};

// Tells what the whole of `text` is; formulas answer #REF! for the second kind.
ScannedReference ScanReference(std::wstring_view text);

}  // namespace workbook

#endif
