#include "number_fit.h"

#include <cwchar>

#include "model/number_text.h"

namespace workbook {

namespace {

constexpr int kLongestText = 32;

std::wstring WithDecimals(double number, int decimals) {
    wchar_t text[kLongestText] = {};
    if (swprintf(text, kLongestText, L"%.*f", decimals, number) < 0) return {};
    std::wstring result = text;
    if (decimals == 0) return result;
    result.erase(result.find_last_not_of(L'0') + 1);
    if (result.back() == L'.') result.pop_back();
    return result == L"-0" ? L"0" : result;
}

}  // namespace

std::wstring FitNumber(double number, int characters) {
    std::wstring text = DisplayNumber(number);
    if (static_cast<int>(text.size()) <= characters) return text;
    const size_t point = text.find(L'.');
    const bool hasExponent = text.find(L'E') != std::wstring::npos;
    if (point == std::wstring::npos || hasExponent) return text;

    const int decimals = characters - static_cast<int>(point) - 1;
    if (decimals >= 0) return WithDecimals(number, decimals);
    // One less: the point itself may be what does not fit.
    return decimals == -1 ? WithDecimals(number, 0) : text;
}

}  // namespace workbook
