// What the operators of formulas do with two values. Operands are values, never references; an
// error among them is the result (the left one's first).
#ifndef WORKBOOK_MODEL_OPERATORS_H
#define WORKBOOK_MODEL_OPERATORS_H

#include "formula.h"
#include "value.h"

namespace workbook {

// A value as an operand of arithmetic: empty is 0, TRUE is 1, a text that reads as a number is that
// number, and any other text is #VALUE!. The result is a number or an error.
Value AsNumber(const Value& value);

// A number, or #NUM! when it is too large or none.
Value FiniteOrError(double number);

// Add to Power, Join, and Equal to GreaterOrEqual.
Value ApplyBinary(Operation operation, const Value& left, const Value& right);

// Negate and Percent.
Value ApplyUnary(Operation operation, const Value& operand);

}  // namespace workbook

#endif
