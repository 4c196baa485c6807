#include "evaluator.h"

#include "accumulator.h"
#include "number_text.h"
#include "operators.h"

#include <optional>
#include <utility>

namespace workbook {

Value Evaluator::run(const Program& program) {
    stack_.clear();
    for (const Instruction& instruction : program.instructions) execute(program, instruction);
    Value result = single(stack_.back());
    return result.isEmpty() ? Value::ofNumber(0) : result;
}

void Evaluator::execute(const Program& program, const Instruction& instruction) {
    const std::uint32_t operand = instruction.operand;
    switch (instruction.operation) {
    case Operation::PushNumber: return push(Value::ofNumber(program.numbers[operand]));
    case Operation::PushText: return push(Value::ofText(program.texts[operand]));
    case Operation::PushBoolean: return push(Value::ofBoolean(operand != 0));
    case Operation::PushReference:
        stack_.push_back({{}, program.references[operand], true});
        return;
    case Operation::PushEmpty: return push({});
    case Operation::PushError: return push(Value::ofError(static_cast<ErrorCode>(operand)));
    case Operation::Negate:
    case Operation::Percent: return push(ApplyUnary(instruction.operation, single(pop())));
    case Operation::Call: return call(instruction.function, operand);
    case Operation::CallUnknown:
        stack_.resize(stack_.size() - operand);
        return push(Value::ofError(ErrorCode::Name));
    default: break;
    }
    const Value right = single(pop());
    const Value left = single(pop());
    push(ApplyBinary(instruction.operation, left, right));
}

Evaluator::Operand Evaluator::pop() {
    Operand operand = std::move(stack_.back());
    stack_.pop_back();
    return operand;
}

Value Evaluator::single(const Operand& operand) const {
    if (!operand.isBlock) return operand.value;
    const Block& block = operand.block;
    if (block.left != block.right || block.top != block.bottom)
        return Value::ofError(ErrorCode::Value);
    const Cell* cell = store_.find({block.left, block.top});
    return cell ? Value::of(ViewOf(*cell)) : Value{};
}

void Evaluator::call(FunctionId function, size_t count) {
    const Operand* arguments = stack_.data() + (stack_.size() - count);
    Operand result;
    if (function == FunctionId::If)
        result = choose(arguments, count);
    else
        result.value = aggregate(function, arguments, count);
    stack_.resize(stack_.size() - count);
    stack_.push_back(std::move(result));
}

// IF. Both branches have been calculated by now; errors are values, so that does no harm.
Evaluator::Operand Evaluator::choose(const Operand* arguments, size_t count) const {
    const Value condition = single(arguments[0]);
    if (condition.isError()) return {condition, {}, false};
    if (condition.isText()) return {Value::ofError(ErrorCode::Value), {}, false};
    if (condition.number != 0) return arguments[1];
    return count == 3 ? arguments[2] : Operand{Value::ofBoolean(false), {}, false};
}

// In cells only numbers count: texts and truth values there are passed over. An argument written
// into the formula must be a number, or be readable as one. COUNT passes over errors, too.
Value Evaluator::aggregate(FunctionId function, const Operand* arguments, size_t count) const {
    Accumulator numbers;
    std::optional<ErrorCode> error;
    const bool isCount = function == FunctionId::Count;

    for (size_t i = 0; i < count && !error; ++i) {
        if (!arguments[i].isBlock) {
            const Value number = AsNumber(arguments[i].value);
            if (number.isNumber())
                numbers.add(number.number);
            else if (!isCount)
                error = number.error;
            continue;
        }
        store_.walk(arguments[i].block, [&](CellAddress, const Cell& cell) {
            const ValueView value = ViewOf(cell);
            if (value.kind == ValueKind::Number)
                numbers.add(value.number);
            else if (value.kind == ValueKind::Error && !isCount)
                error = value.error;
            return !error;
        });
    }

    if (error) return Value::ofError(*error);
    switch (function) {
    case FunctionId::Count: return Value::ofNumber(static_cast<double>(numbers.count()));
    case FunctionId::Lowest: return Value::ofNumber(numbers.lowest());
    case FunctionId::Highest: return Value::ofNumber(numbers.highest());
    case FunctionId::Average:
        if (numbers.count() == 0) return Value::ofError(ErrorCode::DivisionByZero);
        return FiniteOrError(numbers.average());
    default: return FiniteOrError(numbers.sum());
    }
}

}  // namespace workbook
