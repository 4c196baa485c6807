// What a grid must show, worked out from the calls that were made and from its client area alone.
//
// A test keeps one beside the real grid, changes both alike and compares. Sizes "in units" are
// pixels at 100 % zoom; positions are pixels in the grid's client area.
#pragma once

#include <korcontrols/grid.h>

#include <map>

namespace kortest {

struct ExpectedGrid {
    int clientWidth = 0;
    int clientHeight = 0;
    int equationBarHeight = 0;

    unsigned zoom = 4;                // quarters
    std::map<int, unsigned> columns;  // units of the columns that were resized
    std::map<int, unsigned> rows;
    int firstColumn = 0;
    int firstRow = 0;
    int columnCount = 0;  // visible ones, as set by the fit functions
    int rowCount = 0;
    int rowHeaderWidth = 30;
    bool headersHidden = false;
    bool linesHidden = false;
    GridSelection selection{};

    // The corner of the first visible cell.
    int cellsLeft() const { return headersHidden ? 0 : rowHeaderWidth; }
    int cellsTop() const { return equationBarHeight + columnHeaderHeight(); }
    int columnHeaderHeight() const { return headersHidden ? 0 : static_cast<int>(zoom * 4); }

    // Pixels at the present zoom; columns and rows past the sheet's end have the default size.
    int width(int column) const;
    int height(int row) const;

    // Left edge of a column and upper edge of a row from the first visible one on.
    int columnX(int column) const;
    int rowY(int row) const;

    // Units that a width or height in pixels is stored as.
    unsigned unitsForWidth(int pixels) const;
    unsigned unitsForHeight(int pixels) const;

    // Counts the columns that a strip of so many pixels shows, and keeps the count.
    void fitColumns(int pixels);
    void fitRows(int pixels);
    // Both counts as the layout after WM_SIZE leaves them.
    void fit();

    // Pixels from the sheet's begin to a column or row: sizes that were changed count unscaled.
    int columnOffset(int column) const;
    int rowOffset(int row) const;

    // The cell that a press at a point of the client area finds.
    CellIndex cellAt(int x, int y) const;

    // The selection's block, and whether the selection touches the visible cells.
    bool selectedBlock(RECT* block) const;

    GridVisibleRange visibleRange() const;
    RECT client() const { return {0, 0, clientWidth, clientHeight}; }
    RECT cells() const { return {cellsLeft(), cellsTop(), clientWidth, clientHeight}; }
};

}  // namespace kortest
