// The functions that formulas know, with a line of help for each.
#ifndef WORKBOOK_MODEL_FUNCTIONS_H
#define WORKBOOK_MODEL_FUNCTIONS_H

#include <optional>
#include <span>
#include <string_view>

namespace workbook {

enum class FunctionId : unsigned char { Sum, Average, Lowest, Highest, Count, If };

struct FunctionDescription {
    FunctionId id;
    std::wstring_view name;       // "SUM"
    std::wstring_view arguments;  // "SUM(value, ...)"
    std::wstring_view help;       // one sentence
    int fewestArguments;
    int mostArguments;
};

// All functions in alphabetical order: the list behind the "fx" button.
std::span<const FunctionDescription> Functions();

// By name, capital or small letters.
const FunctionDescription* FindFunction(std::wstring_view name);

const FunctionDescription& DescribeFunction(FunctionId id);

}  // namespace workbook

#endif
