#include "number_text.h"

#include <algorithm>
#include <charconv>
#include <cmath>
#include <cstdlib>
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

// A positive number as digits: the first one stands before the point, times ten to the power.
struct Decimal {
    std::string digits;
    int power = 0;
};

// The 15 digits that a double is good for.
Decimal ToDecimal(double positive) {
    char buffer[64];
    const auto end =
        std::to_chars(buffer, buffer + sizeof buffer, positive, std::chars_format::scientific, 14);
    const std::string_view text(buffer, static_cast<size_t>(end.ptr - buffer));
    const size_t letter = text.find('e');
    Decimal decimal;
    decimal.digits = text[0];
    decimal.digits += text.substr(2, letter - 2);
    const size_t sign = letter + 1;
    std::from_chars(text.data() + sign + 1, text.data() + text.size(), decimal.power);
    if (text[sign] == '-') decimal.power = -decimal.power;
    return decimal;
}

// Keeps `count` digits (1 or more). A half goes up, as people expect, and not to the even digit.
Decimal Round(Decimal decimal, size_t count) {
    if (count >= decimal.digits.size()) return decimal;
    const bool goesUp = decimal.digits[count] >= '5';
    decimal.digits.resize(count);
    if (!goesUp) return decimal;
    size_t at = count;
    while (at > 0 && decimal.digits[at - 1] == '9') decimal.digits[--at] = '0';
    if (at > 0) {
        ++decimal.digits[at - 1];
    } else {
        decimal.digits.insert(0, 1, '1');
        decimal.digits.pop_back();
        ++decimal.power;
    }
    return decimal;
}

std::string WithoutTrailingZeros(std::string digits) {
    digits.erase(digits.find_last_not_of('0') + 1);
    return digits;
}

std::string WriteFixed(const Decimal& decimal) {
    std::string digits = WithoutTrailingZeros(decimal.digits);
    if (decimal.power < 0)
        return "0." + std::string(static_cast<size_t>(-decimal.power - 1), '0') + digits;
    const size_t beforePoint = static_cast<size_t>(decimal.power) + 1;
    if (digits.size() <= beforePoint) return digits + std::string(beforePoint - digits.size(), '0');
    return digits.insert(beforePoint, 1, '.');
}

std::string WriteScientific(const Decimal& decimal) {
    std::string text = WithoutTrailingZeros(decimal.digits);
    if (text.size() > 1) text.insert(1, 1, '.');
    const std::string exponent = std::to_string(std::abs(decimal.power));
    text += decimal.power < 0 ? "E-" : "E+";
    if (exponent.size() < 2) text += '0';
    return text + exponent;
}

constexpr int kLowestPower = -4;   // smaller numbers have an exponent
constexpr int kHighestPower = 10;  // so do larger ones

bool IsForFixed(const Decimal& decimal) {
    return decimal.power >= kLowestPower && decimal.power <= kHighestPower;
}

// In at most 11 characters.
std::string DisplayPositive(double positive) {
    const Decimal exact = ToDecimal(positive);
    const Decimal shortened = Round(exact, 6);
    if (!IsForFixed(exact))
        return IsForFixed(shortened) ? WriteFixed(shortened) : WriteScientific(shortened);
    // 11 digits without a point, 10 with one, 9 behind "0.".
    const int digits = exact.power < 0 ? 10 + exact.power : exact.power == 10 ? 11 : 10;
    const Decimal rounded = Round(exact, static_cast<size_t>(digits));
    return IsForFixed(rounded) ? WriteFixed(rounded) : WriteScientific(shortened);
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
    const auto end =
        std::to_chars(buffer, buffer + sizeof buffer, number, std::chars_format::general, 15);
    std::wstring text = Widen({buffer, end.ptr});
    std::ranges::replace(text, L'e', L'E');
    return text;
}

}  // namespace workbook
