// Where the sheet keeps its cells: pages of 64 rows of one column, made when first needed.
//
// A page has one bit for each cell that is occupied and for each that waits to be calculated, so
// walks over a block look at 64 cells at once and touch only those that count.
#ifndef WORKBOOK_MODEL_CELL_STORE_H
#define WORKBOOK_MODEL_CELL_STORE_H

#include "address.h"
#include "formula_cell.h"
#include "value.h"

#include <algorithm>
#include <array>
#include <bit>
#include <cstdint>
#include <memory>
#include <string>
#include <vector>

namespace workbook {

constexpr int kPageRows = 64;

struct Cell {
    std::wstring typed;
    ValueKind kind = ValueKind::Empty;  // of what was typed; unused when there is a formula
    double number = 0;                  // for Number and Boolean
    std::unique_ptr<FormulaCell> formula;
};

struct Page {
    std::uint64_t occupied = 0;
    std::uint64_t pending = 0;  // formulas whose result is not known
    std::array<Cell, kPageRows> cells;
};

class CellStore {
public:
    // Null for an empty cell and for one outside the sheet.
    const Cell* find(CellAddress cell) const;
    Cell* find(CellAddress cell);

    // Makes the page that the cell is in. Throws std::bad_alloc.
    void makeRoom(CellAddress cell);

    // Puts content into a cell there is room for, or takes it away; the old content is returned.
    // Neither fails.
    Cell put(CellAddress cell, Cell content) noexcept;
    Cell take(CellAddress cell) noexcept;

    bool isPending(CellAddress cell) const noexcept;
    void setPending(CellAddress cell, bool pending) noexcept;

    // The first pending cell of the block at or after `from`, which lies in the block, in the order
    // of columns; nothing found: false.
    bool findPending(const Block& block, CellAddress from, CellAddress& found) const noexcept;

    int columns() const noexcept;
    int rows() const noexcept;
    size_t occupiedCells() const noexcept { return occupied_; }

    // Calls visit(CellAddress, const Cell&) for the occupied cells of a block that lies in the
    // sheet, column by column, each from top to bottom, until it returns false.
    template <typename Visit>
    void walk(const Block& block, Visit visit) const;

private:
    using Column = std::vector<std::unique_ptr<Page>>;  // no empty pages at the end

    const Page* pageOf(CellAddress cell) const noexcept;
    Page* pageOf(CellAddress cell) noexcept;

    // The bits of the rows firstRow .. lastRow (of the sheet) in page `page`.
    static std::uint64_t rowMask(int page, int firstRow, int lastRow) noexcept;

    std::array<Column, kColumnCount> columns_;
    size_t occupied_ = 0;
};

// What a cell holds as calculated. A pending formula has the value it had before.
ValueView ViewOf(const Cell& cell);

inline std::uint64_t CellStore::rowMask(int page, int firstRow, int lastRow) noexcept {
    const int first = std::max(firstRow - page * kPageRows, 0);
    const int last = std::min(lastRow - page * kPageRows, kPageRows - 1);
    return (~std::uint64_t{0} << first) & (~std::uint64_t{0} >> (kPageRows - 1 - last));
}

template <typename Visit>
void CellStore::walk(const Block& block, Visit visit) const {
    for (int column = block.left; column <= block.right; ++column) {
        const Column& pages = columns_[static_cast<size_t>(column)];
        const int endPage = std::min(block.bottom / kPageRows + 1, static_cast<int>(pages.size()));
        for (int index = block.top / kPageRows; index < endPage; ++index) {
            const Page* page = pages[static_cast<size_t>(index)].get();
            if (!page) continue;
            std::uint64_t bits = page->occupied & rowMask(index, block.top, block.bottom);
            for (; bits != 0; bits &= bits - 1) {
                const int row = std::countr_zero(bits);
                const CellAddress cell{column, index * kPageRows + row};
                if (!visit(cell, page->cells[static_cast<size_t>(row)])) return;
            }
        }
    }
}

}  // namespace workbook

#endif
