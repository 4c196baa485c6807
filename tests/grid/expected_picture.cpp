#include "grid/expected_picture.h"

#include <algorithm>

namespace kortest {
namespace {

constexpr UINT kDefaultFormat = DT_NOPREFIX | DT_VCENTER | DT_CENTER;

void Line(HDC dc, int x0, int y0, int x1, int y1) {
    const POINT points[] = {{x0, y0}, {x1, y1}};
    Polyline(dc, points, 2);
}

void VerticalLines(HDC dc, const ExpectedGrid& grid, const RECT& area, int end) {
    int column = grid.firstColumn;
    int x = grid.cellsLeft();
    for (; x + grid.width(column) < area.left; ++column) x += grid.width(column);
    for (int drawn = 0; x < area.right && drawn < grid.columnCount + 1; ++drawn, ++column) {
        Line(dc, x, area.top, x, end);
        x += grid.width(column);
    }
}

void HorizontalLines(HDC dc, const ExpectedGrid& grid, const RECT& area, int end) {
    int row = grid.firstRow;
    int y = grid.cellsTop();
    for (; y + grid.height(row) < area.top; ++row) {
        if (row - grid.firstRow >= grid.rowCount) return;
        y += grid.height(row);
    }
    for (int drawn = 0; y < area.bottom && drawn < grid.rowCount + 1; ++drawn, ++row) {
        Line(dc, area.left, y, end, y);
        y += grid.height(row);
    }
}

int TextWidth(HDC dc, const std::wstring& text) {
    RECT measured{};
    DrawTextW(dc, text.c_str(), -1, &measured, DT_CALCRECT);
    return static_cast<int>(measured.right - measured.left);
}

// The font that the grid makes of the host's at the present zoom; the caller deletes it.
HFONT ZoomedFont(HFONT font, unsigned zoom) {
    LOGFONTW description{};
    GetObjectW(font, sizeof description, &description);
    auto height = static_cast<LONG>(zoom * 0.25 * static_cast<double>(description.lfHeight));
    if (height > 0) height = -height;
    description.lfHeight = height;
    description.lfWidth = 0;
    return CreateFontIndirectW(&description);
}

RECT TextArea(const ExpectedGrid& grid, const CellText& value) {
    const int column = KORGRID_CELLCOLUMN(value.cell);
    const int row = KORGRID_CELLROW(value.cell);
    const int first = value.spanLeft > 0 ? std::max<int>(grid.firstColumn,
                                                         column - static_cast<int>(value.spanLeft))
                                         : column;
    int right = grid.clientWidth + grid.width(column);
    if (value.spanRight >= 0) right = grid.columnX(column + static_cast<int>(value.spanRight) + 1);
    return {grid.columnX(first) + 3, grid.rowY(row) + 1, right - 3, grid.rowY(row + 1)};
}

bool IsVisible(const ExpectedGrid& grid, CellIndex cell) {
    const GridVisibleRange range = grid.visibleRange();
    const WORD column = KORGRID_CELLCOLUMN(cell);
    const WORD row = KORGRID_CELLROW(cell);
    return column >= range.firstColumn && column < range.endColumn && row >= range.firstRow &&
           row < range.endRow;
}

void DrawFittedText(HDC dc, const ExpectedGrid& grid, const CellText& value) {
    RECT area = TextArea(grid, value);
    const int areaWidth = static_cast<int>(area.right - area.left);
    const int column = KORGRID_CELLCOLUMN(value.cell);
    std::wstring text = value.text;
    UINT format = value.format ? value.format : kDefaultFormat;
    if (value.fitCheck) {
        if (areaWidth < TextWidth(dc, text)) {
            const int fitting = std::clamp(areaWidth / TextWidth(dc, L"#"), 0, 255);
            text.assign(static_cast<size_t>(fitting), L'#');
            format = kDefaultFormat;
        }
    } else if (!value.keepSpan && (format & DT_CENTER) && TextWidth(dc, text) < areaWidth) {
        area.left = grid.columnX(column) + 3;
        area.right = grid.columnX(column + 1) - 3;
    }
    DrawTextW(dc, text.c_str(), -1, &area, format);
}

}  // namespace

void DrawExpectedLines(HDC dc, const ExpectedGrid& grid, const RECT& area) {
    PatBlt(dc, area.left, area.top, area.right - area.left, area.bottom - area.top, WHITENESS);
    if (grid.linesHidden) return;
    const int endColumn = grid.firstColumn + grid.columnCount;
    const int endRow = grid.firstRow + grid.rowCount;
    const int horizontalEnd =
        endColumn == KORGRID_COLUMNS ? grid.columnX(endColumn) : static_cast<int>(area.right);
    const int verticalEnd =
        endRow == KORGRID_ROWS ? grid.rowY(endRow) : static_cast<int>(area.bottom);
    const HPEN pen = CreatePen(PS_SOLID, 1, kGridLineColour);
    const HGDIOBJ previous = SelectObject(dc, pen);
    VerticalLines(dc, grid, area, verticalEnd);
    HorizontalLines(dc, grid, area, horizontalEnd);
    SelectObject(dc, previous);
    DeleteObject(pen);
}

void InvertExpectedSelection(HDC dc, const ExpectedGrid& grid) {
    RECT block;
    if (grid.selectedBlock(&block))
        PatBlt(dc, block.left, block.top, block.right - block.left, block.bottom - block.top,
               DSTINVERT);
}

void DrawExpectedRedraw(HDC dc, const ExpectedGrid& grid, const RECT& area,
                        const std::function<void()>& paintCells) {
    InvertExpectedSelection(dc, grid);
    DrawExpectedLines(dc, grid, area);
    if (paintCells) paintCells();
    InvertExpectedSelection(dc, grid);
}

void DrawExpectedBackground(HDC dc, const ExpectedGrid& grid, CellIndex cell, HBRUSH brush) {
    if (!IsVisible(grid, cell)) return;
    const int column = KORGRID_CELLCOLUMN(cell);
    const int row = KORGRID_CELLROW(cell);
    const RECT box = {grid.columnX(column), grid.rowY(row), grid.columnX(column + 1) + 1,
                      grid.rowY(row + 1) + 1};
    FillRect(dc, &box, brush);
}

void DrawExpectedBorder(HDC dc, const ExpectedGrid& grid, CellIndex cell, HPEN pen, DWORD left,
                        DWORD right, DWORD top, DWORD bottom) {
    if (!IsVisible(grid, cell)) return;
    const int x0 = grid.columnX(KORGRID_CELLCOLUMN(cell));
    const int x1 = grid.columnX(KORGRID_CELLCOLUMN(cell) + 1);
    const int y0 = grid.rowY(KORGRID_CELLROW(cell));
    const int y1 = grid.rowY(KORGRID_CELLROW(cell) + 1);
    const HGDIOBJ previous = SelectObject(dc, pen);
    if (left & 0xFFFF) Line(dc, x0, y0, x0, y1);
    if (right & 0xFFFF) Line(dc, x1, y0, x1, y1);
    if (top & 0xFFFF) Line(dc, x0, y0, x1, y0);
    if (bottom & 0xFFFF) Line(dc, x0, y1, x1, y1);
    SelectObject(dc, previous);
}

void DrawExpectedText(HDC dc, const ExpectedGrid& grid, const CellText& value) {
    if (!IsVisible(grid, value.cell)) return;
    SetTextColor(dc, value.textColour);
    SetBkColor(dc, value.backColour);
    HFONT zoomed = nullptr;
    HGDIOBJ previous = nullptr;
    if (value.font) {
        if (grid.zoom != 4) zoomed = ZoomedFont(value.font, grid.zoom);
        previous = SelectObject(dc, zoomed ? zoomed : value.font);
    }
    DrawFittedText(dc, grid, value);
    if (previous) SelectObject(dc, previous);
    if (zoomed) DeleteObject(zoomed);
}

void SetCellText(const CellText& value) {
    SetCellValue(value.cell, value.text.c_str(), value.font, value.textColour, value.backColour,
                 value.format, value.spanLeft, value.spanRight, value.fitCheck, value.keepSpan);
}

}  // namespace kortest
