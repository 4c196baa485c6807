#include "cell_painter.h"

#include <algorithm>
#include <string>

#include "number_fit.h"
#include "workbook.h"

namespace workbook {

namespace {

constexpr UINT kOneLine = DT_NOPREFIX | DT_SINGLELINE | DT_VCENTER;
constexpr int kTextMargins = 6;  // what the grid leaves free in a cell, both sides together

// No cell shows more, not even at 50 % across a wide screen.
constexpr size_t kLongestDrawnText = 1024;

// How a cell's text is drawn; everything that SetCellValue wants to know.
struct TextStyle {
    HFONT font = nullptr;
    COLORREF colour = kTextColour;
    COLORREF background = kPaperColour;  // the image's letters stand on a filled background
    UINT format = kOneLine | DT_LEFT;
    LONG spanRight = 0;
    bool mustFit = false;
};

void DrawCellText(CellAddress cell, const std::wstring& text, const TextStyle& style) {
    SetCellValue(KORGRID_CELL(cell.column, cell.row), text.c_str(), style.font, style.colour,
                 style.background, style.format, 0, style.spanRight, style.mustFit, FALSE);
}

bool IsTitleCell(const Workbook& workbook, CellAddress cell) {
    return workbook.sheetView().titleRow && cell.row == 0 &&
           cell.column < workbook.sheet().extent().columns;
}

TextStyle StyleOf(const Workbook& workbook, CellAddress cell) {
    TextStyle style;
    style.font = workbook.styles.normal;
    if (IsTitleCell(workbook, cell)) {
        style.font = workbook.styles.bold;
        style.background = kTitleColour;
    }
    return style;
}

// A text as it can be drawn: short enough, without tabs. Line breaks stay: they make several lines.
std::wstring DrawableText(std::wstring_view text) {
    std::wstring result(text.substr(0, kLongestDrawnText));
    std::replace(result.begin(), result.end(), L'\t', L' ');
    return result;
}

// How many empty columns a text may run over to the right of its cell.
LONG EmptyNeighbours(const Sheet& sheet, CellAddress cell, int endColumn) {
    int column = cell.column + 1;
    while (column < endColumn && sheet.isEmpty({column, cell.row})) ++column;
    return column - cell.column - 1;
}

void DrawNumber(const Workbook& workbook, CellAddress cell, double number) {
    TextStyle style = StyleOf(workbook, cell);
    style.format = kOneLine | DT_RIGHT;
    style.mustFit = true;
    const int room = workbook.sheetView().widths.of(cell.column) - kTextMargins;
    DrawCellText(cell, FitNumber(number, room / workbook.styles.digitWidth), style);
}

// Truth values and errors.
void DrawCentred(const Workbook& workbook, CellAddress cell, const ValueView& value) {
    TextStyle style = StyleOf(workbook, cell);
    style.format = kOneLine | DT_CENTER;
    style.mustFit = true;
    if (value.kind == ValueKind::Error) style.colour = kErrorColour;
    DrawCellText(cell, DisplayText(value), style);
}

// Over a column of numbers a title stands on the right as they do.
UINT TitleFormat(const Sheet& sheet, CellAddress title) {
    const bool isOverNumbers = sheet.view({title.column, 1}).kind == ValueKind::Number;
    return kOneLine | (isOverNumbers ? DT_RIGHT : DT_LEFT);
}

void DrawWords(const Workbook& workbook, CellAddress cell, std::wstring_view words, int endColumn) {
    const Sheet& sheet = workbook.sheet();
    TextStyle style = StyleOf(workbook, cell);
    const std::wstring text = DrawableText(words);
    if (text.find(L'\n') != std::wstring::npos) {
        style.format = DT_NOPREFIX | DT_LEFT;
    } else if (IsTitleCell(workbook, cell)) {
        style.format = TitleFormat(sheet, cell);
    } else {
        style.spanRight = EmptyNeighbours(sheet, cell, endColumn);
    }
    DrawCellText(cell, text, style);
}

void DrawCell(const Workbook& workbook, CellAddress cell, int endColumn) {
    const ValueView value = workbook.sheet().view(cell);
    switch (value.kind) {
    case ValueKind::Empty: break;
    case ValueKind::Number: DrawNumber(workbook, cell, value.number); break;
    case ValueKind::Text: DrawWords(workbook, cell, value.text, endColumn); break;
    case ValueKind::Boolean:
    case ValueKind::Error: DrawCentred(workbook, cell, value); break;
    }
}

// A text that begins left of the view and runs into it: what is left of it from the first visible
// column on. The grid draws visible cells only, so the rest is drawn as that column's text.
void DrawTextFromLeft(const Workbook& workbook, int row, const GridVisibleRange& range) {
    const Sheet& sheet = workbook.sheet();
    const CellAddress first = {range.firstColumn, row};
    if (first.column == 0 || !sheet.isEmpty(first)) return;
    CellAddress source = {first.column - 1, row};
    while (source.column > 0 && sheet.isEmpty(source)) --source.column;
    const ValueView value = sheet.view(source);
    if (value.kind != ValueKind::Text || IsTitleCell(workbook, source)) return;

    const std::wstring text = DrawableText(value.text);
    if (text.find(L'\n') != std::wstring::npos) return;
    TextStyle style = StyleOf(workbook, source);
    const int hidden = workbook.sheetView().widths.sum(source.column, first.column);
    const size_t count = workbook.measure.charactersWithin(style.font, text, hidden);
    if (count >= text.size()) return;
    style.spanRight = EmptyNeighbours(sheet, first, range.endColumn);
    DrawCellText(first, text.substr(count), style);
}

// The tinted background covers the grid lines, so the title row brings its own.
void PaintTitleBackground(const Workbook& workbook, const GridVisibleRange& range) {
    const CellStyles& styles = workbook.styles;
    const int endColumn = std::min<int>(range.endColumn, workbook.sheet().extent().columns);
    for (int column = range.firstColumn; column < endColumn; ++column) {
        const CellIndex cell = KORGRID_CELL(column, 0);
        SetCellBackGroundColor(cell, styles.titleBrush);
        const DWORD line = workbook.view.gridLines ? TRUE : FALSE;
        SetCellBorder(cell, styles.titleLinePen, line && column > 0, line, line, FALSE);
        SetCellBorder(cell, styles.titleEdgePen, FALSE, FALSE, FALSE, TRUE);
    }
}

}  // namespace

void PaintCells(const Workbook& workbook, const GridVisibleRange& range) {
    if (workbook.sheetView().titleRow && range.firstRow == 0) PaintTitleBackground(workbook, range);
    const SheetExtent extent = workbook.sheet().extent();
    const int endRow = std::min<int>(range.endRow, extent.rows);
    const int endColumn = std::min<int>(range.endColumn, extent.columns);
    for (int row = range.firstRow; row < endRow; ++row) {
        DrawTextFromLeft(workbook, row, range);
        for (int column = range.firstColumn; column < endColumn; ++column) {
            DrawCell(workbook, {column, row}, range.endColumn);
        }
    }
}

}  // namespace workbook
