#include "number_text.h"

#include <charconv>
#include <cmath>
#include <string>

namespace workbook {

namespace {

constexpr bool IsDigit(wchar_t c) { return c >= L'0' && c <= L'9'; }

std::wstring_view WithoutSpaces(std::wstring_view text) {
    while (!text.empty() && text.front() == L' ') text.remove_prefix(1);
    while (!text.empty() && text.back() == L' ') text.remove_suffix(1);
    return text;
}

size_t SkipDigits(std::wstring_view text, size_t at) {
    while (at < text.size() && IsDigit(text[at])) ++at;
    return at;
}

size_t SkipSign(std::wstring_view text, size_t at) {
    return at + (at < text.size() && (text[at] == L'+' || text[at] == L'-'));
}

// Whether the text is "12", "12.", ".5" or "12.5", with or without an exponent.
bool IsUnsignedNumber(std::wstring_view text) {
    size_t at = SkipDigits(text, 0);
    size_t digits = at;
    if (at < text.size() && text[at] == L'.') {
        const size_t end = SkipDigits(text, at + 1);
        digits += end - (at + 1);
        at = end;
    }
    if (digits == 0) return false;
    if (at == text.size()) return true;
    if (text[at] != L'e' && text[at] != L'E') return false;
    const size_t exponent = SkipSign(text, at + 1);
    at = SkipDigits(text, exponent);
    return at > exponent && at == text.size();
}

// For texts that IsUnsignedNumber accepts; they are ASCII.
std::optional<double> ConvertUnsigned(std::wstring_view text) {
    std::string narrow;
    narrow.reserve(text.size());
    for (wchar_t c : text) narrow += static_cast<char>(c);
    double number = 0;
    const auto result = std::from_chars(narrow.data(), narrow.data() + narrow.size(), number);
    if (result.ec != std::errc() || !std::isfinite(number)) return std::nullopt;
    return number;
}

std::string WithoutTrailingZeros(std::string digits) {
    if (digits.find('.') == std::string::npos) return digits;
    digits.erase(digits.find_last_not_of('0') + 1);
    if (digits.back() == '.') digits.pop_back();
    return digits;
}

std::string Fixed(double number, int decimals) {
    char buffer[64];  // callers stay below 1E+12
    const auto end = std::to_chars(buffer, buffer + sizeof buffer, number, std::chars_format::fixed,
                                   decimals);
    return {buffer, end.ptr};
}

struct Scientific {
    std::string mantissa;
    std::string exponent;  // "+11", "-05"

    int power() const { return std::stoi(exponent); }
};

Scientific ToScientific(double number, int decimals) {
    char buffer[64];
    const auto end = std::to_chars(buffer, buffer + sizeof buffer, number,
                                   std::chars_format::scientific, decimals);
    const std::string text(buffer, end.ptr);
    const size_t letter = text.find('e');
    return {text.substr(0, letter), text.substr(letter + 1)};
}

// `positive` > 0, in at most 11 characters.
std::string DisplayPositive(double positive) {
    constexpr int kLongestInteger = 11;
    constexpr int kLowestPower = -4;

    const Scientific rounded = ToScientific(positive, 5);
    const int power = ToScientific(positive, 16).power();
    if (power < kLongestInteger && (power >= kLowestPower || rounded.power() >= kLowestPower)) {
        const int decimals = power < 0 ? 9 : power < 9 ? 9 - power : 0;
        const std::string fixed = WithoutTrailingZeros(Fixed(positive, decimals));
        // Rounding may have carried into a twelfth digit.
        if (fixed.find('.') != std::string::npos || fixed.size() <= kLongestInteger) return fixed;
    }
    return WithoutTrailingZeros(rounded.mantissa) + "E" + rounded.exponent;
}

// Never in a cell, but the sum of a selection may be too large.
constexpr std::wstring_view kNoNumber = L"#NUM!";

std::wstring Widen(const std::string& ascii) { return {ascii.begin(), ascii.end()}; }

}  // namespace

std::optional<double> ReadNumber(std::wstring_view text) {
    text = WithoutSpaces(text);
    const size_t afterSign = SkipSign(text, 0);
    const bool negative = afterSign == 1 && text[0] == L'-';
    text.remove_prefix(afterSign);
    const bool percent = !text.empty() && text.back() == L'%';
    if (percent) text.remove_suffix(1);

    if (!IsUnsignedNumber(text)) return std::nullopt;
    std::optional<double> number = ConvertUnsigned(text);
    if (!number) return std::nullopt;
    if (percent) *number /= 100;
    if (negative && *number != 0) *number = -*number;
    return number;
}

std::wstring DisplayNumber(double number) {
    if (!std::isfinite(number)) return std::wstring(kNoNumber);
    if (number == 0) return L"0";
    return (number < 0 ? L"-" : L"") + Widen(DisplayPositive(std::fabs(number)));
}

std::wstring JoinNumber(double number) {
    if (!std::isfinite(number)) return std::wstring(kNoNumber);
    if (number == 0) return L"0";
    char buffer[64];
    const auto end = std::to_chars(buffer, buffer + sizeof buffer, number,
                                   std::chars_format::general, 15);
    std::wstring text = Widen({buffer, end.ptr});
    const size_t letter = text.find(L'e');
    if (letter != std::wstring::npos) text[letter] = L'E';
    return text;
}

}  // namespace workbook
