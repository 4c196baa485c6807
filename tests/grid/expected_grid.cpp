#include "grid/expected_grid.h"

#include <algorithm>

namespace kortest {
namespace {

constexpr int kMostCounted = 255;

int Scaled(const std::map<int, unsigned>& sizes, int index, unsigned defaultUnits, unsigned zoom) {
    const auto found = sizes.find(index);
    const unsigned pixels =
        found == sizes.end() ? defaultUnits / 4 * zoom : (found->second * zoom) >> 2;
    return static_cast<WORD>(pixels);
}

unsigned Units(int pixels, unsigned zoom, int area) {
    const double exact = static_cast<WORD>(pixels) * 4.0 / zoom;
    const auto units = static_cast<WORD>(static_cast<long long>(exact));
    return static_cast<int>(units) > area ? static_cast<WORD>(area - 10) : units;
}

int Offset(const std::map<int, unsigned>& sizes, int index, int defaultUnits, unsigned zoom) {
    int offset = static_cast<int>(zoom) * index * (defaultUnits / 4);
    for (const auto& [resized, units] : sizes) {
        if (resized >= index) break;
        offset += static_cast<int>(units) - defaultUnits;
    }
    return offset;
}

// The search for a point along one axis; `size` gives the pixels of a column or row.
template <typename Size>
int IndexAt(int position, int begin, int first, int count, Size size) {
    if (position <= begin + size(first)) return first;
    for (int i = 0; i < count; ++i) {
        begin += size(first + i);
        if (position <= begin + size(first + i + 1)) return first + i + 1;
    }
    return 0;
}

bool Touches(int low, int high, int first, int count) {
    const auto within = [&](int index) { return index >= first && index <= first + count; };
    return within(low) || within(high) || (low <= first && high >= first + count);
}

}  // namespace

int ExpectedGrid::width(int column) const { return Scaled(columns, column, 60, zoom); }

int ExpectedGrid::height(int row) const { return Scaled(rows, row, 16, zoom); }

int ExpectedGrid::columnX(int column) const {
    int x = cellsLeft();
    for (int i = firstColumn; i < column; ++i) x += width(i);
    return x;
}

int ExpectedGrid::rowY(int row) const {
    int y = cellsTop();
    for (int i = firstRow; i < row; ++i) y += height(i);
    return y;
}

unsigned ExpectedGrid::unitsForWidth(int pixels) const {
    return Units(pixels, zoom, clientWidth - cellsLeft());
}

unsigned ExpectedGrid::unitsForHeight(int pixels) const {
    return Units(pixels, zoom, clientHeight - cellsTop());
}

void ExpectedGrid::fitColumns(int pixels) {
    columnCount = 0;
    for (int sum = 0;
         sum < pixels && firstColumn + columnCount < KORGRID_COLUMNS && columnCount < kMostCounted;
         ++columnCount)
        sum += width(firstColumn + columnCount);
}

void ExpectedGrid::fitRows(int pixels) {
    rowCount = 0;
    for (int sum = 0; sum < pixels && firstRow + rowCount < KORGRID_ROWS && rowCount < kMostCounted;
         ++rowCount)
        sum += height(firstRow + rowCount);
}

void ExpectedGrid::fit() {
    fitColumns(clientWidth - cellsLeft());
    fitRows(clientHeight - cellsTop());
}

int ExpectedGrid::columnOffset(int column) const { return Offset(columns, column, 60, zoom); }

int ExpectedGrid::rowOffset(int row) const { return Offset(rows, row, 16, zoom); }

CellIndex ExpectedGrid::cellAt(int x, int y) const {
    if (x < 0 || y < 0) return 0;
    const int column = IndexAt(std::min(x, clientWidth), cellsLeft(), firstColumn, columnCount,
                               [this](int index) { return width(index); });
    const int row = IndexAt(std::min(y, clientHeight), cellsTop(), firstRow, rowCount,
                            [this](int index) { return height(index); });
    return KORGRID_CELL(column, row);
}

bool ExpectedGrid::selectedBlock(RECT* block) const {
    if (!Touches(selection.left, selection.right, firstColumn, columnCount) ||
        !Touches(selection.top, selection.bottom, firstRow, rowCount))
        return false;
    const int left = std::max<int>(selection.left, firstColumn);
    const int top = std::max<int>(selection.top, firstRow);
    const int right = std::min<int>(selection.right, firstColumn + columnCount);
    const int bottom = std::min<int>(selection.bottom, firstRow + rowCount);
    *block = {columnX(left), rowY(top), columnX(right + 1), rowY(bottom + 1)};
    return true;
}

GridVisibleRange ExpectedGrid::visibleRange() const {
    return {static_cast<WORD>(firstColumn), static_cast<WORD>(firstColumn + columnCount),
            static_cast<WORD>(firstRow), static_cast<WORD>(firstRow + rowCount)};
}

}  // namespace kortest
