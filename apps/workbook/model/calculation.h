// Calculates a formula together with all that it waits for.
#ifndef WORKBOOK_MODEL_CALCULATION_H
#define WORKBOOK_MODEL_CALCULATION_H

#include "cell_store.h"
#include "evaluator.h"

namespace workbook {

// One search through the pending formulas that `target` reads, directly or through others, by
// Tarjan's way of finding rings. Formulas that read each other in a ring, or themselves, become
// #CIRC!, whichever of them was asked for first; all others are calculated after what they read.
// References count whether or not IF chooses them.
//
// The search keeps its lists in the formulas and uses neither the machine's stack nor memory of its
// own, so long chains are as good as short ones.
class Calculation {
public:
    explicit Calculation(CellStore& store) : store_(store), evaluator_(store) {}

    void run(FormulaCell& target) noexcept;

private:
    void enter(FormulaCell& formula, FormulaCell* caller) noexcept;
    FormulaCell* nextPendingRead(FormulaCell& formula) noexcept;
    void finishRing(FormulaCell& first) noexcept;
    Value evaluate(const FormulaCell& formula) noexcept;

    CellStore& store_;
    Evaluator evaluator_;
    FormulaCell* stack_ = nullptr;  // entered, and not yet known to be in a ring or not
    std::uint32_t entered_ = 0;
};

}  // namespace workbook

#endif
