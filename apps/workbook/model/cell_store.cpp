#include "cell_store.h"

#include <utility>

namespace workbook {

namespace {

constexpr std::uint64_t BitOf(CellAddress cell) {
    return std::uint64_t{1} << (cell.row % kPageRows);
}

constexpr size_t SlotOf(CellAddress cell) { return static_cast<size_t>(cell.row % kPageRows); }

}  // namespace

const Page* CellStore::pageOf(CellAddress cell) const noexcept {
    if (!IsInSheet(cell)) return nullptr;
    const Column& pages = columns_[static_cast<size_t>(cell.column)];
    const size_t index = static_cast<size_t>(cell.row / kPageRows);
    return index < pages.size() ? pages[index].get() : nullptr;
}

Page* CellStore::pageOf(CellAddress cell) noexcept {
    return const_cast<Page*>(std::as_const(*this).pageOf(cell));
}

const Cell* CellStore::find(CellAddress cell) const {
    const Page* page = pageOf(cell);
    return page && (page->occupied & BitOf(cell)) ? &page->cells[SlotOf(cell)] : nullptr;
}

Cell* CellStore::find(CellAddress cell) {
    return const_cast<Cell*>(std::as_const(*this).find(cell));
}

void CellStore::makeRoom(CellAddress cell) {
    Column& pages = columns_[static_cast<size_t>(cell.column)];
    const size_t index = static_cast<size_t>(cell.row / kPageRows);
    if (index < pages.size() && pages[index]) return;
    auto page = std::make_unique<Page>();
    if (index >= pages.size()) pages.resize(index + 1);
    pages[index] = std::move(page);
}

Cell CellStore::put(CellAddress cell, Cell content) noexcept {
    Page& page = *pageOf(cell);
    occupied_ += (page.occupied & BitOf(cell)) == 0;
    page.occupied |= BitOf(cell);
    page.pending &= ~BitOf(cell);
    return std::exchange(page.cells[SlotOf(cell)], std::move(content));
}

Cell CellStore::take(CellAddress cell) noexcept {
    Page* page = pageOf(cell);
    if (!page || !(page->occupied & BitOf(cell))) return {};
    --occupied_;
    page->occupied &= ~BitOf(cell);
    page->pending &= ~BitOf(cell);
    Cell old = std::exchange(page->cells[SlotOf(cell)], Cell{});
    if (page->occupied == 0) {
        Column& pages = columns_[static_cast<size_t>(cell.column)];
        pages[static_cast<size_t>(cell.row / kPageRows)].reset();
        while (!pages.empty() && !pages.back()) pages.pop_back();
    }
    return old;
}

bool CellStore::isPending(CellAddress cell) const noexcept {
    const Page* page = pageOf(cell);
    return page && (page->pending & BitOf(cell)) != 0;
}

void CellStore::setPending(CellAddress cell, bool pending) noexcept {
    Page* page = pageOf(cell);
    if (pending)
        page->pending |= BitOf(cell);
    else
        page->pending &= ~BitOf(cell);
}

bool CellStore::findPending(const Block& block, CellAddress from,
                            CellAddress& found) const noexcept {
    int firstRow = from.row;
    for (int column = from.column; column <= block.right; ++column, firstRow = block.top) {
        const Column& pages = columns_[static_cast<size_t>(column)];
        const int endPage = std::min(block.bottom / kPageRows + 1, static_cast<int>(pages.size()));
        for (int index = firstRow / kPageRows; index < endPage; ++index) {
            const Page* page = pages[static_cast<size_t>(index)].get();
            if (!page) continue;
            const std::uint64_t bits = page->pending & rowMask(index, firstRow, block.bottom);
            if (bits == 0) continue;
            found = {column, index * kPageRows + std::countr_zero(bits)};
            return true;
        }
    }
    return false;
}

int CellStore::columns() const noexcept {
    for (int column = kColumnCount; column > 0; --column)
        for (const auto& page : columns_[static_cast<size_t>(column - 1)])
            if (page && page->occupied != 0) return column;
    return 0;
}

int CellStore::rows() const noexcept {
    int rows = 0;
    for (const Column& pages : columns_) {
        for (size_t index = pages.size(); index-- > 0;) {
            if (!pages[index] || pages[index]->occupied == 0) continue;
            const int lastBit = kPageRows - 1 - std::countl_zero(pages[index]->occupied);
            rows = std::max(rows, static_cast<int>(index) * kPageRows + lastBit + 1);
            break;
        }
    }
    return rows;
}

ValueView ViewOf(const Cell& cell) {
    if (cell.formula) return cell.formula->result.view();
    ValueView view;
    view.kind = cell.kind;
    view.number = cell.number;
    if (cell.kind == ValueKind::Text) {
        view.text = cell.typed;
        if (view.text.front() == L'\'') view.text.remove_prefix(1);
    }
    return view;
}

}  // namespace workbook
