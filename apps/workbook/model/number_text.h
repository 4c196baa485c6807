// Numbers as text, and back. The decimal sign is always the point, whatever the machine's settings.
#ifndef WORKBOOK_MODEL_NUMBER_TEXT_H
#define WORKBOOK_MODEL_NUMBER_TEXT_H

#include <optional>
#include <string>
#include <string_view>

namespace workbook {

// Reads a text that is a number as a whole: spaces around it, a sign, digits with a decimal point,
// an exponent and a percent sign are understood ("-1.5e3", ".5", "7.", "12%" = 0.12). No separators
// of thousands and no decimal comma: "1,5" stays text. Beyond the range of a double: no number.
std::optional<double> ReadNumber(std::wstring_view text);

// As a cell shows it: at most 11 characters without the sign, and an exponent from 1E+11 upwards
// and below 0.0001, then with 6 digits ("0.333333333", "12345678901", "1.23457E+11", "1E-05"). An
// exponent of three digits has a 12th character ("1.23457E-100").
std::wstring DisplayNumber(double number);

// As the joining operator writes it: up to 15 significant digits ("0.333333333333333").
std::wstring JoinNumber(double number);

}  // namespace workbook

#endif
