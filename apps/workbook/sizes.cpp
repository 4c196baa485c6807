#include "sizes.h"

#include <algorithm>
#include <string>

#include "number_fit.h"
#include "workbook.h"

namespace workbook {

namespace {

constexpr int kJudgedRows = 200;
constexpr int kWidestColumn = 240;  // units
constexpr int kTextMargins = 8;     // left and right together, and a little air
constexpr int kLineHeight = 15;     // units; a row has one more above
constexpr int kMostLines = 8;

// What the cell needs to show. Results that would fill a column with decimals are content with what
// a column of default width shows of them.
std::wstring NeededText(const Workbook& workbook, CellAddress cell) {
    const Sheet& sheet = workbook.sheet();
    const ValueView value = sheet.view(cell);
    if (value.kind == ValueKind::Number && sheet.isFormula(cell)) {
        return FitNumber(value.number,
                         (kDefaultColumnWidth - kTextMargins) / workbook.styles.digitWidth);
    }
    // A text of several lines is as wide as its first line; the longest is rarely another one.
    const std::wstring text = DisplayText(value);
    return text.substr(0, std::min(text.find(L'\n'), size_t{kWidestColumn}));
}

int WidthOf(const Workbook& workbook, CellAddress cell) {
    const bool isTitle = workbook.sheetView().titleRow && cell.row == 0;
    const HFONT font = isTitle ? workbook.styles.bold : workbook.styles.normal;
    return workbook.measure.width(font, NeededText(workbook, cell)) + kTextMargins;
}

// What the grid stores is pixels at the current zoom turned back into units; rounding up here makes
// that come out right.
LONG PixelsOf(const Workbook& workbook, int units) {
    const int zoom = static_cast<int>(workbook.view.zoom);
    return (units * zoom + 3) / 4;
}

// The grid counts from its first visible cell, which may lie behind the one meant.
GridVisibleRange VisibleRange() {
    GridVisibleRange range = {};
    GetVisibleRange(&range);
    return range;
}

void ApplyWidth(const Workbook& workbook, int column, int units) {
    SetColumnWidth(column - VisibleRange().firstColumn, PixelsOf(workbook, units));
}

void ApplyHeight(const Workbook& workbook, int row, int units) {
    SetRowHeight(row - VisibleRange().firstRow, PixelsOf(workbook, units));
}

void SetWidth(Workbook& workbook, int column, int units) {
    ApplyWidth(workbook, column, units);
    workbook.sheetView().widths.set(column, units);
}

void SetHeight(Workbook& workbook, int row, int units) {
    ApplyHeight(workbook, row, units);
    workbook.sheetView().heights[row] = units;
}

void FitColumn(Workbook& workbook, int column) {
    int units = kDefaultColumnWidth;
    for (const CellAddress cell :
         workbook.sheet().occupiedIn({column, 0, column, kJudgedRows - 1})) {
        units = std::max(units, std::min(WidthOf(workbook, cell), kWidestColumn));
    }
    if (units != workbook.sheetView().widths.of(column)) SetWidth(workbook, column, units);
}

int LinesIn(const Sheet& sheet, int row) {
    int lines = 1;
    for (const CellAddress cell : sheet.occupiedIn({0, row, kColumnCount - 1, row})) {
        const ValueView value = sheet.view(cell);
        if (value.kind != ValueKind::Text) continue;
        const auto breaks = std::count(value.text.begin(), value.text.end(), L'\n');
        lines = std::max(lines, static_cast<int>(std::min<std::ptrdiff_t>(breaks + 1, kMostLines)));
    }
    return lines;
}

}  // namespace

void FitSizes(Workbook& workbook) {
    const Sheet& sheet = workbook.sheet();
    const SheetExtent extent = sheet.extent();
    for (int column = 0; column < extent.columns; ++column) FitColumn(workbook, column);
    for (int row = 0; row < std::min(extent.rows, kJudgedRows); ++row) {
        const int lines = LinesIn(sheet, row);
        if (lines == 1) continue;
        SetHeight(workbook, row, lines * kLineHeight + 1);
    }
}

void ApplySizes(const Workbook& workbook) {
    const SheetView& view = workbook.sheetView();
    for (int column = 0; column < kColumnCount; ++column) {
        const int units = view.widths.of(column);
        if (units != kDefaultColumnWidth) ApplyWidth(workbook, column, units);
    }
    for (const auto& [row, units] : view.heights) ApplyHeight(workbook, row, units);
}

}  // namespace workbook
