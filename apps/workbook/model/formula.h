// A formula made ready for calculation: a list of instructions for a stack machine, so that
// calculating needs no recursion however deep the parentheses were.
//
// Operators from the weakest to the strongest:  = <> < <= > >=   &   + -   * /   ^   % (after)
// + - (before). As in other spreadsheets a sign binds more strongly than a power (=-2^2 is 4), and
// powers go from left to right (=2^3^2 is 64).
#ifndef WORKBOOK_MODEL_FORMULA_H
#define WORKBOOK_MODEL_FORMULA_H

#include "address.h"
#include "functions.h"
#include "value.h"

#include <cstdint>
#include <string>
#include <string_view>
#include <vector>

namespace workbook {

enum class Operation : unsigned char {
    PushNumber,     // operand: index into numbers
    PushText,       // operand: index into texts
    PushBoolean,    // operand: 0 or 1
    PushReference,  // operand: index into references
    PushEmpty,      // an argument left out: IF(A1,,2)
    PushError,      // operand: the ErrorCode
    Add,
    Subtract,
    Multiply,
    Divide,
    Power,
    Negate,
    Percent,
    Join,
    Equal,
    NotEqual,
    Less,
    LessOrEqual,
    Greater,
    GreaterOrEqual,
    Call,        // operand: number of arguments; function says which
    CallUnknown  // operand: number of arguments; the result is #NAME?
};

struct Instruction {
    Operation operation;
    FunctionId function = FunctionId::Sum;
    std::uint32_t operand = 0;
};

// Why a formula cannot be read.
enum class FormulaProblem : unsigned char {
    None,
    Incomplete,          // an operand is missing
    UnexpectedSymbol,    // something stands where nothing like it can
    MissingParenthesis,  // a closing one
    MissingQuote,
    NumberTooLarge,
    WrongArgumentCount,
    NestedTooDeeply
};

// A sentence for the user; empty for None.
std::wstring_view ProblemMessage(FormulaProblem problem);

struct Program {
    std::vector<Instruction> instructions;
    std::vector<double> numbers;
    std::vector<std::wstring> texts;
    std::vector<Block> references;  // all cells that the formula reads, each block once per mention
    FormulaProblem problem = FormulaProblem::None;
};

// Parentheses and function calls inside each other; deeper formulas are refused.
constexpr int kDeepestNesting = 64;

// Compiles what follows the "=". A formula that cannot be read becomes one that answers #VALUE! and
// reads no cells, with its problem told.
Program CompileFormula(std::wstring_view formula);

}  // namespace workbook

#endif
