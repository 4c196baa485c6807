// Answers which formulas read a given cell.
//
// Columns and rows are each halved again and again, as in a segment tree; a block that a formula
// reads is cut into the fewest such pieces, and each piece lists its readers. A cell lies in at
// most 9 * 15 pieces, so finding its readers takes that many look-ups, mostly far fewer, however
// large the blocks are.
#ifndef WORKBOOK_MODEL_DEPENDENCY_INDEX_H
#define WORKBOOK_MODEL_DEPENDENCY_INDEX_H

#include "address.h"
#include "cell_store.h"

#include <array>
#include <cstdint>
#include <unordered_map>

namespace workbook {

struct DependencyNode {
    std::uint32_t key = 0;
    std::uint32_t walkedIn = 0;  // the period in which all readers were made pending
    DependencyLink* first = nullptr;
};

class DependencyIndex {
public:
    // Gets all memory that tie() needs. Throws std::bad_alloc, with nothing tied.
    void prepare(FormulaCell& formula);

    // Lists the prepared formula as a reader of its references, or takes it off all lists. When one
    // formula replaces another, tie the new one first: it may share pieces with the old one, and a
    // piece without readers is thrown away.
    void tie(FormulaCell& formula) noexcept;
    void untie(FormulaCell& formula) noexcept;

    // Makes all formulas pending that read the cell, directly or through others.
    void invalidateReadersOf(CellAddress cell, CellStore& store) noexcept;

    // To be called when formulas are calculated: readers may no longer be pending.
    void startNewPeriod() noexcept { ++period_; }

private:
    static constexpr int kColumnLevels = 9;
    static constexpr int kRowLevels = 15;

    DependencyNode* find(std::uint32_t key) noexcept;
    size_t& tiesAt(std::uint32_t key) noexcept;
    void invalidateListed(DependencyNode& node, CellStore& store, FormulaCell*& waiting) noexcept;

    std::unordered_map<std::uint32_t, DependencyNode> nodes_;
    // How many ties there are at each pair of levels; most pairs have none, and need no look-up.
    std::array<std::array<size_t, kRowLevels>, kColumnLevels> ties_{};
    std::uint32_t period_ = 1;
};

}  // namespace workbook

#endif
