#include "operators.h"

#include "number_text.h"
#include "sheet.h"

#include <algorithm>
#include <cmath>
#include <string>

namespace workbook {

namespace {

Value Power(double base, double exponent) {
    if (base == 0 && exponent == 0) return Value::ofError(ErrorCode::Number);
    if (base == 0 && exponent < 0) return Value::ofError(ErrorCode::DivisionByZero);
    return FiniteOrError(std::pow(base, exponent));
}

Value Arithmetic(Operation operation, double left, double right) {
    switch (operation) {
    case Operation::Add: return FiniteOrError(left + right);
    case Operation::Subtract: return FiniteOrError(left - right);
    case Operation::Multiply: return FiniteOrError(left * right);
    case Operation::Divide:
        if (right == 0) return Value::ofError(ErrorCode::DivisionByZero);
        return FiniteOrError(left / right);
    default: return Power(left, right);
    }
}

std::wstring AsText(const Value& value) {
    return value.isNumber() ? JoinNumber(value.number) : DisplayText(value.view());
}

Value Join(const Value& left, const Value& right) {
    std::wstring text = AsText(left);
    text += AsText(right);
    if (text.size() > kLongestCellText) return Value::ofError(ErrorCode::Value);
    return Value::ofText(std::move(text));
}

// Small letters for capitals: Latin (with the accented letters of western and central Europe),
// Greek and Cyrillic. The machine's language plays no part, so files compare alike everywhere.
constexpr wchar_t Fold(wchar_t c) {
    const auto shifted = [c](int by) { return static_cast<wchar_t>(c + by); };
    if (c < 0x80) return c >= L'A' && c <= L'Z' ? shifted(32) : c;
    if (c >= 0xC0 && c <= 0xDE && c != 0xD7) return shifted(32);
    if ((c >= 0x100 && c <= 0x137 && c != 0x130) || (c >= 0x14A && c <= 0x177))
        return shifted(c % 2 == 0);
    if ((c >= 0x139 && c <= 0x148) || (c >= 0x179 && c <= 0x17E)) return shifted(c % 2 == 1);
    if (c >= 0x391 && c <= 0x3A9 && c != 0x3A2) return shifted(32);
    if (c >= 0x410 && c <= 0x42F) return shifted(32);
    if (c >= 0x400 && c <= 0x40F) return shifted(80);
    return c;
}
static_assert(Fold(L'Z') == L'z' && Fold(L'[') == L'[' && Fold(0xC4) == 0xE4);
static_assert(Fold(0x160) == 0x161 && Fold(0x17D) == 0x17E && Fold(0x42F) == 0x44F);

int CompareTexts(std::wstring_view left, std::wstring_view right) {
    const size_t common = std::min(left.size(), right.size());
    for (size_t i = 0; i < common; ++i) {
        const wchar_t one = Fold(left[i]);
        const wchar_t other = Fold(right[i]);
        if (one != other) return one < other ? -1 : 1;
    }
    return left.size() == right.size() ? 0 : left.size() < right.size() ? -1 : 1;
}

// Differences in the last few bits count as none, so that =0.1+0.2=0.3 is true.
int CompareNumbers(double left, double right) {
    const double tolerance = std::ldexp(std::max(std::fabs(left), std::fabs(right)), -48);
    if (std::fabs(left - right) <= tolerance) return 0;
    return left < right ? -1 : 1;
}

// An empty operand stands for the other one's 0, "" or FALSE.
Value FilledIn(const Value& value, ValueKind otherKind) {
    if (!value.isEmpty()) return value;
    switch (otherKind) {
    case ValueKind::Text: return Value::ofText({});
    case ValueKind::Boolean: return Value::ofBoolean(false);
    default: return Value::ofNumber(0);
    }
}

// Numbers come before texts, texts before truth values.
int Rank(ValueKind kind) { return kind == ValueKind::Number ? 0 : kind == ValueKind::Text ? 1 : 2; }

int Compare(const Value& givenLeft, const Value& givenRight) {
    const Value left = FilledIn(givenLeft, givenRight.kind);
    const Value right = FilledIn(givenRight, givenLeft.kind);
    if (left.kind != right.kind) return Rank(left.kind) < Rank(right.kind) ? -1 : 1;
    if (left.isText()) return CompareTexts(left.text, right.text);
    return CompareNumbers(left.number, right.number);
}

bool IsTrue(Operation comparison, int order) {
    switch (comparison) {
    case Operation::Equal: return order == 0;
    case Operation::NotEqual: return order != 0;
    case Operation::Less: return order < 0;
    case Operation::LessOrEqual: return order <= 0;
    case Operation::Greater: return order > 0;
    default: return order >= 0;
    }
}

bool IsArithmetic(Operation operation) {
    switch (operation) {
    case Operation::Add:
    case Operation::Subtract:
    case Operation::Multiply:
    case Operation::Divide:
    case Operation::Power: return true;
    default: return false;
    }
}

}  // namespace

Value FiniteOrError(double number) {
    if (!std::isfinite(number)) return Value::ofError(ErrorCode::Number);
    return Value::ofNumber(number == 0 ? 0 : number);  // never a negative zero
}

Value AsNumber(const Value& value) {
    switch (value.kind) {
    case ValueKind::Number:
    case ValueKind::Error: return value;
    case ValueKind::Boolean: return Value::ofNumber(value.number);
    case ValueKind::Empty: return Value::ofNumber(0);
    case ValueKind::Text: break;
    }
    const auto number = ReadNumber(value.text);
    return number ? Value::ofNumber(*number) : Value::ofError(ErrorCode::Value);
}

Value ApplyBinary(Operation operation, const Value& left, const Value& right) {
    if (left.isError()) return left;
    if (right.isError()) return right;
    if (operation == Operation::Join) return Join(left, right);
    if (!IsArithmetic(operation)) return Value::ofBoolean(IsTrue(operation, Compare(left, right)));

    const Value leftNumber = AsNumber(left);
    if (leftNumber.isError()) return leftNumber;
    const Value rightNumber = AsNumber(right);
    if (rightNumber.isError()) return rightNumber;
    return Arithmetic(operation, leftNumber.number, rightNumber.number);
}

Value ApplyUnary(Operation operation, const Value& operand) {
    const Value number = AsNumber(operand);
    if (number.isError()) return number;
    return FiniteOrError(operation == Operation::Negate ? -number.number : number.number / 100);
}

}  // namespace workbook
