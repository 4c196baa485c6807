// Runs a formula's program. The cells it reads must have been calculated.
#ifndef WORKBOOK_MODEL_EVALUATOR_H
#define WORKBOOK_MODEL_EVALUATOR_H

#include "cell_store.h"
#include "formula.h"
#include "value.h"

#include <vector>

namespace workbook {

class Evaluator {
public:
    explicit Evaluator(const CellStore& store) : store_(store) {}

    // Throws std::bad_alloc.
    Value run(const Program& program);

private:
    // A value, or a block of cells that a function may read as such.
    struct Operand {
        Value value;
        Block block;
        bool isBlock = false;
    };

    void execute(const Program& program, const Instruction& instruction);
    void push(Value value) { stack_.push_back({std::move(value), {}, false}); }
    Operand pop();

    // The value of an operand where one value is wanted; a block of several cells is #VALUE!.
    Value single(const Operand& operand) const;

    void call(FunctionId function, size_t count);
    Operand choose(const Operand* arguments, size_t count) const;
    Value aggregate(FunctionId function, const Operand* arguments, size_t count) const;

    const CellStore& store_;
    std::vector<Operand> stack_;
};

}  // namespace workbook

#endif
