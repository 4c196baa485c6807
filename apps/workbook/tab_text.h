// Blocks of cells as text with tabs between cells and a line per row, as clipboards carry them.
#pragma once

#include <string>
#include <string_view>
#include <vector>

namespace workbook {

using TextRow = std::vector<std::wstring>;

// Cells with tabs, line breaks or quotes are quoted. Each line ends with CR LF.
std::wstring WriteTabText(const std::vector<TextRow>& rows);

// Reads what WriteTabText and other programs write. A quote only counts at a cell's beginning; one
// that is never closed stands for itself.
std::vector<TextRow> ReadTabText(std::wstring_view text);

}  // namespace workbook
