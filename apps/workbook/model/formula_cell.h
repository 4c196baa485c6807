// A formula in its cell: the program, its latest result, and the notes of the calculation.
#ifndef WORKBOOK_MODEL_FORMULA_CELL_H
#define WORKBOOK_MODEL_FORMULA_CELL_H

#include "address.h"
#include "formula.h"
#include "value.h"

#include <cstdint>
#include <vector>

namespace workbook {

struct FormulaCell;
struct DependencyNode;

// Ties a formula to one piece of a block that it reads; a link of that piece's list of readers.
struct DependencyLink {
    FormulaCell* reader = nullptr;
    DependencyNode* node = nullptr;
    DependencyLink* previous = nullptr;
    DependencyLink* next = nullptr;
};

// A position while walking over the cells that a formula reads.
struct ReadingPosition {
    size_t reference = 0;
    CellAddress cell;
    bool isInside = false;  // cell lies in the reference and is the next one to look at
};

// Lists that the calculation and the invalidation need are threaded through the formulas
// themselves: neither needs memory, and neither uses the machine's stack.
struct FormulaCell {
    CellAddress cell;
    Program program;
    Value result;

    std::vector<DependencyLink> links;  // never resized once tied

    FormulaCell* nextToInvalidate = nullptr;

    // Used during a calculation only.
    std::uint32_t order = 0;   // when the search came here, from 1; 0: it has not
    std::uint32_t lowest = 0;  // lowest order that can be reached from here
    bool readsItself = false;
    FormulaCell* caller = nullptr;        // the formula that the search came from
    FormulaCell* belowOnStack = nullptr;  // stack of formulas not yet assigned to a ring
    ReadingPosition position;
};

}  // namespace workbook

#endif
