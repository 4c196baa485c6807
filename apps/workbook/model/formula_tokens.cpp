#include "formula_tokens.h"

#include "number_text.h"

namespace workbook {

namespace {

constexpr bool IsDigit(wchar_t c) { return c >= L'0' && c <= L'9'; }

// Spaces as people paste them: blank, tab, line breaks and the no-break space.
constexpr bool IsSpace(wchar_t c) {
    return c == L' ' || c == L'\t' || c == L'\r' || c == L'\n' || c == L'\u00A0';
}

constexpr bool IsNameCharacter(wchar_t c) {
    return (c >= L'A' && c <= L'Z') || (c >= L'a' && c <= L'z') || IsDigit(c) || c == L'_' ||
           c == L'$' || c == L'.' || c > L'\u00A0';
}

Token Plain(TokenKind kind) {
    Token token;
    token.kind = kind;
    return token;
}

}  // namespace

Token TokenScanner::next() {
    while (!rest_.empty() && IsSpace(rest_.front())) rest_.remove_prefix(1);
    if (rest_.empty()) return {};
    const wchar_t first = rest_.front();
    if (IsDigit(first) || first == L'.') return scanNumber();
    if (first == L'"') return scanText();
    if (IsNameCharacter(first)) return scanName();
    return scanSymbol();
}

Token TokenScanner::scanNumber() {
    size_t end = 0;
    const auto skipDigits = [&] {
        while (end < rest_.size() && IsDigit(rest_[end])) ++end;
    };
    skipDigits();
    if (end < rest_.size() && rest_[end] == L'.') ++end;
    skipDigits();
    if (end < rest_.size() && (rest_[end] == L'e' || rest_[end] == L'E')) {
        size_t exponent = end + 1;
        if (exponent < rest_.size() && (rest_[exponent] == L'+' || rest_[exponent] == L'-'))
            ++exponent;
        if (exponent < rest_.size() && IsDigit(rest_[exponent])) {
            end = exponent;
            skipDigits();
        }
    }

    const std::wstring_view digits = rest_.substr(0, end);
    rest_.remove_prefix(end);
    if (digits == L".") return Plain(TokenKind::Unreadable);
    Token token = Plain(TokenKind::Number);
    const auto number = ReadNumber(digits);
    token.number = number.value_or(0);
    token.isNumberTooLarge = !number;
    return token;
}

Token TokenScanner::scanText() {
    Token token = Plain(TokenKind::Text);
    size_t at = 1;
    for (; at < rest_.size(); ++at) {
        if (rest_[at] == L'"') {
            const bool isDoubled = at + 1 < rest_.size() && rest_[at + 1] == L'"';
            if (!isDoubled) break;
            ++at;
        }
        token.text += rest_[at];
    }
    token.isTextUnterminated = at >= rest_.size();
    rest_.remove_prefix(token.isTextUnterminated ? rest_.size() : at + 1);
    return token;
}

Token TokenScanner::scanName() {
    size_t end = 0;
    while (end < rest_.size() && IsNameCharacter(rest_[end])) ++end;
    Token token = Plain(TokenKind::Name);
    token.name = rest_.substr(0, end);
    rest_.remove_prefix(end);
    return token;
}

Token TokenScanner::scanSymbol() {
    const wchar_t first = rest_.front();
    const wchar_t second = rest_.size() > 1 ? rest_[1] : L'\0';
    const auto take = [this](size_t length, TokenKind kind) {
        rest_.remove_prefix(length);
        return Plain(kind);
    };
    switch (first) {
    case L'+': return take(1, TokenKind::Plus);
    case L'-': return take(1, TokenKind::Minus);
    case L'*': return take(1, TokenKind::Times);
    case L'/': return take(1, TokenKind::Divide);
    case L'^': return take(1, TokenKind::Power);
    case L'%': return take(1, TokenKind::Percent);
    case L'&': return take(1, TokenKind::Join);
    case L'(': return take(1, TokenKind::Open);
    case L')': return take(1, TokenKind::Close);
    case L',': return take(1, TokenKind::Separator);
    case L';': return take(1, TokenKind::Separator);
    case L':': return take(1, TokenKind::Colon);
    case L'=': return take(1, TokenKind::Equal);
    case L'<':
        if (second == L'=') return take(2, TokenKind::LessOrEqual);
        if (second == L'>') return take(2, TokenKind::NotEqual);
        return take(1, TokenKind::Less);
    case L'>':
        if (second == L'=') return take(2, TokenKind::GreaterOrEqual);
        return take(1, TokenKind::Greater);
    default: return take(1, TokenKind::Unreadable);
    }
}

}  // namespace workbook
