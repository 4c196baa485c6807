// What the grid's hosts of the benchmarks paint: a short number in each cell.
#pragma once

#include <korcontrols/grid.h>

inline void FormatCell(int column, int row, wchar_t* text) {
    wsprintfW(text, L"%d.%02d", (row * 37 + column * 11) % 1000, row % 100);
}

inline void PaintCells(const GridVisibleRange& range, HFONT font) {
    for (WORD row = range.firstRow; row < range.endRow; ++row) {
        for (WORD column = range.firstColumn; column < range.endColumn; ++column) {
            wchar_t text[16];
            FormatCell(column, row, text);
            SetCellValue(KORGRID_CELL(column, row), text, font, RGB(0, 0, 0), RGB(255, 255, 255), 0,
                         0, 0, 0, 0);
        }
    }
}
