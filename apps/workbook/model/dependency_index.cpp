#include "dependency_index.h"

#include <bit>
#include <vector>

namespace workbook {

namespace {

// Pieces are numbered as in a heap: 1 is everything, 2n and 2n + 1 are the halves of n, and a
// single column (or row) c is kColumnCount + c (kRowCount + c).
constexpr int kRowBits = 15;
static_assert(2 * kRowCount == 1 << kRowBits);

constexpr std::uint32_t KeyOf(std::uint32_t columnPiece, std::uint32_t rowPiece) {
    return columnPiece << kRowBits | rowPiece;
}

// The fewest pieces that cover first .. last out of `count`, a power of two.
std::vector<std::uint32_t> Pieces(int first, int last, int count) {
    std::vector<std::uint32_t> pieces;
    auto low = static_cast<std::uint32_t>(first + count);
    auto end = static_cast<std::uint32_t>(last + count + 1);
    for (; low < end; low /= 2, end /= 2) {
        if (low % 2 == 1) pieces.push_back(low++);
        if (end % 2 == 1) pieces.push_back(--end);
    }
    return pieces;
}

// 0 for everything, one more for each halving.
constexpr size_t LevelOf(std::uint32_t piece) {
    return static_cast<size_t>(std::bit_width(piece) - 1);
}

}  // namespace

DependencyNode* DependencyIndex::find(std::uint32_t key) noexcept {
    const auto found = nodes_.find(key);
    return found == nodes_.end() ? nullptr : &found->second;
}

void DependencyIndex::prepare(FormulaCell& formula) {
    for (const Block& block : formula.program.references) {
        const auto rowPieces = Pieces(block.top, block.bottom, kRowCount);
        for (const std::uint32_t column : Pieces(block.left, block.right, kColumnCount)) {
            for (const std::uint32_t row : rowPieces) {
                DependencyLink link;
                link.reader = &formula;
                link.node = &nodes_[KeyOf(column, row)];
                link.node->key = KeyOf(column, row);
                formula.links.push_back(link);
            }
        }
    }
}

size_t& DependencyIndex::tiesAt(std::uint32_t key) noexcept {
    return ties_[LevelOf(key >> kRowBits)][LevelOf(key & ((1u << kRowBits) - 1))];
}

void DependencyIndex::tie(FormulaCell& formula) noexcept {
    for (DependencyLink& link : formula.links) {
        link.previous = nullptr;
        link.next = link.node->first;
        if (link.next) link.next->previous = &link;
        link.node->first = &link;
        ++tiesAt(link.node->key);
    }
}

void DependencyIndex::untie(FormulaCell& formula) noexcept {
    for (DependencyLink& link : formula.links) {
        if (link.previous)
            link.previous->next = link.next;
        else
            link.node->first = link.next;
        if (link.next) link.next->previous = link.previous;
        const std::uint32_t key = link.node->key;
        --tiesAt(key);
        if (!link.node->first) nodes_.erase(key);
    }
}

void DependencyIndex::invalidateReadersOf(CellAddress changed, CellStore& store) noexcept {
    FormulaCell* waiting = nullptr;
    CellAddress cell = changed;
    for (;;) {
        const auto columnLeaf = static_cast<std::uint32_t>(cell.column + kColumnCount);
        const auto rowLeaf = static_cast<std::uint32_t>(cell.row + kRowCount);
        for (size_t columnLevel = 0; columnLevel < kColumnLevels; ++columnLevel) {
            for (size_t rowLevel = 0; rowLevel < kRowLevels; ++rowLevel) {
                if (ties_[columnLevel][rowLevel] == 0) continue;
                DependencyNode* node = find(KeyOf(columnLeaf >> (kColumnLevels - 1 - columnLevel),
                                                  rowLeaf >> (kRowLevels - 1 - rowLevel)));
                if (node) invalidateListed(*node, store, waiting);
            }
        }
        if (!waiting) return;
        cell = waiting->cell;
        waiting = waiting->nextToInvalidate;
    }
}

// A formula that is pending already is passed over: its readers are pending too, because no formula
// is calculated before all that it reads.
void DependencyIndex::invalidateListed(DependencyNode& node, CellStore& store,
                                       FormulaCell*& waiting) noexcept {
    if (node.walkedIn == period_) return;
    node.walkedIn = period_;
    for (DependencyLink* link = node.first; link; link = link->next) {
        FormulaCell& reader = *link->reader;
        if (store.isPending(reader.cell)) continue;
        store.setPending(reader.cell, true);
        reader.nextToInvalidate = waiting;
        waiting = &reader;
    }
}

}  // namespace workbook
