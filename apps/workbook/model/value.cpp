#include "value.h"

#include "number_text.h"

#include <utility>

namespace workbook {

Value Value::ofNumber(double number) {
    Value value;
    value.kind = ValueKind::Number;
    value.number = number;
    return value;
}

Value Value::ofText(std::wstring text) {
    Value value;
    value.kind = ValueKind::Text;
    value.text = std::move(text);
    return value;
}

Value Value::ofBoolean(bool boolean) {
    Value value;
    value.kind = ValueKind::Boolean;
    value.number = boolean ? 1 : 0;
    return value;
}

Value Value::ofError(ErrorCode error) {
    Value value;
    value.kind = ValueKind::Error;
    value.error = error;
    return value;
}

Value Value::of(const ValueView& view) {
    Value value;
    value.kind = view.kind;
    value.error = view.error;
    value.number = view.number;
    value.text = view.text;
    return value;
}

std::wstring_view ErrorName(ErrorCode error) {
    switch (error) {
    case ErrorCode::Circular: return L"#CIRC!";
    case ErrorCode::DivisionByZero: return L"#DIV/0!";
    case ErrorCode::Reference: return L"#REF!";
    case ErrorCode::Name: return L"#NAME?";
    case ErrorCode::Number: return L"#NUM!";
    case ErrorCode::Value: break;
    }
    return L"#VALUE!";
}

std::wstring DisplayText(const ValueView& value) {
    switch (value.kind) {
    case ValueKind::Number: return DisplayNumber(value.number);
    case ValueKind::Boolean: return value.number != 0 ? L"TRUE" : L"FALSE";
    case ValueKind::Text: return std::wstring(value.text);
    case ValueKind::Error: return std::wstring(ErrorName(value.error));
    case ValueKind::Empty: break;
    }
    return {};
}

}  // namespace workbook
