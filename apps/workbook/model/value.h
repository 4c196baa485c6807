// What a cell can hold after calculation: nothing, a number, a text, a truth value or an error.
#ifndef WORKBOOK_MODEL_VALUE_H
#define WORKBOOK_MODEL_VALUE_H

#include <string>
#include <string_view>

namespace workbook {

enum class ValueKind : unsigned char { Empty, Number, Text, Boolean, Error };

enum class ErrorCode : unsigned char {
    Circular,        // #CIRC!   the cell depends on itself
    DivisionByZero,  // #DIV/0!
    Reference,       // #REF!    a reference outside the sheet
    Name,            // #NAME?   an unknown function or name
    Value,           // #VALUE!  an operand of the wrong kind, or a formula that cannot be read
    Number           // #NUM!    a result that is no number: too large, or a root of a negative one
};

// A value without owning its text: `text` lives as long as the cell it came from is not changed.
struct ValueView {
    ValueKind kind = ValueKind::Empty;
    ErrorCode error = ErrorCode::Value;  // for ValueKind::Error
    double number = 0;                   // for Number; 1 or 0 for Boolean
    std::wstring_view text;              // for Text
};

struct Value {
    ValueKind kind = ValueKind::Empty;
    ErrorCode error = ErrorCode::Value;
    double number = 0;
    std::wstring text;

    static Value ofNumber(double number);
    static Value ofText(std::wstring text);
    static Value ofBoolean(bool boolean);
    static Value ofError(ErrorCode error);
    static Value of(const ValueView& view);

    ValueView view() const { return {kind, error, number, text}; }
    bool boolean() const { return number != 0; }
    bool isNumber() const { return kind == ValueKind::Number; }
    bool isText() const { return kind == ValueKind::Text; }
    bool isError() const { return kind == ValueKind::Error; }
    bool isEmpty() const { return kind == ValueKind::Empty; }
};

// "#DIV/0!" and its like.
std::wstring_view ErrorName(ErrorCode error);

// What a cell with this value shows: numbers as DisplayNumber writes them, TRUE or FALSE,
// the error's name, a text as it is, and nothing for an empty one.
std::wstring DisplayText(const ValueView& value);

}  // namespace workbook

#endif
