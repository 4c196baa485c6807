// Cuts a formula's text into tokens.
#ifndef WORKBOOK_MODEL_FORMULA_TOKENS_H
#define WORKBOOK_MODEL_FORMULA_TOKENS_H

#include <string>
#include <string_view>

namespace workbook {

enum class TokenKind : unsigned char {
    End,
    Number,
    Text,
    Name,  // a reference, a function, TRUE, FALSE, or something unknown
    Plus,
    Minus,
    Times,
    Divide,
    Power,
    Percent,
    Join,
    Equal,
    NotEqual,
    Less,
    LessOrEqual,
    Greater,
    GreaterOrEqual,
    Open,
    Close,
    Separator,  // comma or semicolon
    Colon,
    Unreadable  // a character that no formula has
};

struct Token {
    TokenKind kind = TokenKind::End;
    double number = 0;       // for Number
    std::wstring text;       // for Text: what is between the quotes, doubled quotes single
    std::wstring_view name;  // for Name: as written, a part of the scanned text
    bool isTextUnterminated = false;
    bool isNumberTooLarge = false;
};

class TokenScanner {
public:
    // `formula`: what follows the "=". It must outlive the scanner.
    explicit TokenScanner(std::wstring_view formula) : rest_(formula) {}

    Token next();

private:
    Token scanNumber();
    Token scanText();
    Token scanName();
    Token scanSymbol();

    std::wstring_view rest_;
};

}  // namespace workbook

#endif
