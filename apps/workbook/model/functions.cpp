#include "functions.h"

#include <algorithm>
#include <array>

namespace workbook {

namespace {

constexpr int kAnyNumberOfArguments = 32767;

constexpr std::array<FunctionDescription, 6> kFunctions{{
    {FunctionId::Average, L"AVERAGE", L"AVERAGE(value, ...)",
     L"The sum of the numbers divided by how many there are.", 1, kAnyNumberOfArguments},
    {FunctionId::Count, L"COUNT", L"COUNT(value, ...)",
     L"How many numbers there are; texts and empty cells do not count.", 1, kAnyNumberOfArguments},
    {FunctionId::If, L"IF", L"IF(condition, then, else)",
     L"The second value when the condition is true, otherwise the third (or FALSE).", 2, 3},
    {FunctionId::Highest, L"MAX", L"MAX(value, ...)", L"The largest of the numbers; 0 without any.",
     1, kAnyNumberOfArguments},
    {FunctionId::Lowest, L"MIN", L"MIN(value, ...)", L"The smallest of the numbers; 0 without any.",
     1, kAnyNumberOfArguments},
    {FunctionId::Sum, L"SUM", L"SUM(value, ...)",
     L"All numbers added up, such as SUM(A1:A12) or SUM(A1, B1, 5).", 1, kAnyNumberOfArguments},
}};

constexpr wchar_t Capital(wchar_t c) {
    return c >= L'a' && c <= L'z' ? static_cast<wchar_t>(c - L'a' + L'A') : c;
}

}  // namespace

std::span<const FunctionDescription> Functions() { return kFunctions; }

const FunctionDescription* FindFunction(std::wstring_view name) {
    const auto found =
        std::ranges::find_if(kFunctions, [name](const FunctionDescription& function) {
            return std::ranges::equal(function.name, name, {}, {}, Capital);
        });
    return found == kFunctions.end() ? nullptr : &*found;
}

const FunctionDescription& DescribeFunction(FunctionId id) {
    return *std::ranges::find(kFunctions, id, &FunctionDescription::id);
}

}  // namespace workbook
