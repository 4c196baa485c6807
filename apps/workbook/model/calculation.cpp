#include "calculation.h"

#include <algorithm>
#include <new>

namespace workbook {

namespace {

// Moves the position behind `cell`, which lies in `block`.
void MoveBehind(ReadingPosition& position, const Block& block, CellAddress cell) {
    position.isInside = true;
    position.cell = {cell.column, cell.row + 1};
    if (position.cell.row <= block.bottom) return;
    position.cell = {cell.column + 1, block.top};
    if (position.cell.column <= block.right) return;
    ++position.reference;
    position.isInside = false;
}

}  // namespace

void Calculation::run(FormulaCell& target) noexcept {
    entered_ = 0;
    enter(target, nullptr);
    FormulaCell* current = &target;
    while (current) {
        if (FormulaCell* read = nextPendingRead(*current)) {
            if (read == current) current->readsItself = true;
            if (read->order == 0) {
                enter(*read, current);
                current = read;
            } else {
                current->lowest = std::min(current->lowest, read->order);
            }
            continue;
        }
        FormulaCell* caller = current->caller;
        if (caller) caller->lowest = std::min(caller->lowest, current->lowest);
        if (current->lowest == current->order) finishRing(*current);
        current = caller;
    }
}

void Calculation::enter(FormulaCell& formula, FormulaCell* caller) noexcept {
    formula.order = formula.lowest = ++entered_;
    formula.readsItself = false;
    formula.caller = caller;
    formula.belowOnStack = stack_;
    formula.position = {};
    stack_ = &formula;
}

FormulaCell* Calculation::nextPendingRead(FormulaCell& formula) noexcept {
    ReadingPosition& position = formula.position;
    const auto& references = formula.program.references;
    for (; position.reference < references.size(); ++position.reference) {
        const Block& block = references[position.reference];
        const CellAddress from =
            position.isInside ? position.cell : CellAddress{block.left, block.top};
        CellAddress found;
        if (store_.findPending(block, from, found)) {
            MoveBehind(position, block, found);
            return store_.find(found)->formula.get();
        }
        position.isInside = false;
    }
    return nullptr;
}

// `first` and all above it on the stack read each other in a ring, or `first` is alone.
void Calculation::finishRing(FormulaCell& first) noexcept {
    const bool isRing = stack_ != &first || first.readsItself;
    for (bool isLast = false; !isLast;) {
        FormulaCell& formula = *stack_;
        isLast = &formula == &first;
        stack_ = formula.belowOnStack;
        formula.result = isRing ? Value::ofError(ErrorCode::Circular) : evaluate(formula);
        formula.order = 0;
        store_.setPending(formula.cell, false);
    }
}

Value Calculation::evaluate(const FormulaCell& formula) noexcept {
    try {
        return evaluator_.run(formula.program);
    } catch (const std::bad_alloc&) {
        return Value::ofError(ErrorCode::Value);
    }
}

}  // namespace workbook
