#include "formula.h"

#include "formula_tokens.h"

#include <optional>
#include <utility>

namespace workbook {

namespace {

struct BinaryOperator {
    Operation operation;
    int strength;
};

constexpr int kWeakest = 1;

std::optional<BinaryOperator> BinaryOperatorOf(TokenKind kind) {
    switch (kind) {
    case TokenKind::Equal: return {{Operation::Equal, 1}};
    case TokenKind::NotEqual: return {{Operation::NotEqual, 1}};
    case TokenKind::Less: return {{Operation::Less, 1}};
    case TokenKind::LessOrEqual: return {{Operation::LessOrEqual, 1}};
    case TokenKind::Greater: return {{Operation::Greater, 1}};
    case TokenKind::GreaterOrEqual: return {{Operation::GreaterOrEqual, 1}};
    case TokenKind::Join: return {{Operation::Join, 2}};
    case TokenKind::Plus: return {{Operation::Add, 3}};
    case TokenKind::Minus: return {{Operation::Subtract, 3}};
    case TokenKind::Times: return {{Operation::Multiply, 4}};
    case TokenKind::Divide: return {{Operation::Divide, 4}};
    case TokenKind::Power: return {{Operation::Power, 5}};
    default: return std::nullopt;
    }
}

bool IsWord(std::wstring_view name, std::wstring_view capitals) {
    if (name.size() != capitals.size()) return false;
    for (size_t i = 0; i < name.size(); ++i) {
        const bool same = name[i] == capitals[i] || name[i] == capitals[i] - L'A' + L'a';
        if (!same) return false;
    }
    return true;
}

// Reads a formula from left to right and emits each operator after its operands. Every parse...
// function returns false once a problem is noted; nothing is read after that.
class FormulaParser {
public:
    explicit FormulaParser(std::wstring_view formula) : scanner_(formula) { advance(); }

    Program parse() {
        if (parseExpression(kWeakest) && token_.kind != TokenKind::End)
            fail(FormulaProblem::UnexpectedSymbol);
        if (program_.problem == FormulaProblem::None) return std::move(program_);

        Program refused;
        refused.problem = program_.problem;
        refused.instructions.push_back(
            {Operation::PushError, FunctionId::Sum, static_cast<std::uint32_t>(ErrorCode::Value)});
        return refused;
    }

private:
    void advance() { token_ = scanner_.next(); }

    bool fail(FormulaProblem problem) {
        program_.problem = problem;
        return false;
    }

    void emit(Operation operation, size_t operand = 0, FunctionId function = FunctionId::Sum) {
        program_.instructions.push_back({operation, function, static_cast<std::uint32_t>(operand)});
    }

    void emitError(ErrorCode error) { emit(Operation::PushError, static_cast<size_t>(error)); }

    // Operands joined by operators of at least this strength. Recursion is bounded by the number of
    // strengths; parentheses are counted by parseNested.
    bool parseExpression(int strength) {
        if (!parseSigned()) return false;
        for (;;) {
            const auto binary = BinaryOperatorOf(token_.kind);
            if (!binary || binary->strength < strength) return true;
            advance();
            if (!parseExpression(binary->strength + 1)) return false;
            emit(binary->operation);
        }
    }

    bool parseSigned() {
        size_t minuses = 0;
        for (; token_.kind == TokenKind::Minus || token_.kind == TokenKind::Plus; advance())
            minuses += token_.kind == TokenKind::Minus;
        if (!parseOperand()) return false;
        // "--A1" makes a number of a text that reads as one, so two signs are not none.
        if (minuses > 0) emit(Operation::Negate);
        if (minuses > 0 && minuses % 2 == 0) emit(Operation::Negate);
        for (; token_.kind == TokenKind::Percent; advance()) emit(Operation::Percent);
        return true;
    }

    bool parseOperand() {
        switch (token_.kind) {
        case TokenKind::Number: return parseNumber();
        case TokenKind::Text: return parseText();
        case TokenKind::Name: return parseName();
        case TokenKind::Open: return parseParentheses();
        case TokenKind::End: return fail(FormulaProblem::Incomplete);
        default: return fail(FormulaProblem::UnexpectedSymbol);
        }
    }

    bool parseNumber() {
        if (token_.isNumberTooLarge) return fail(FormulaProblem::NumberTooLarge);
        emit(Operation::PushNumber, program_.numbers.size());
        program_.numbers.push_back(token_.number);
        advance();
        return true;
    }

    bool parseText() {
        if (token_.isTextUnterminated) return fail(FormulaProblem::MissingQuote);
        emit(Operation::PushText, program_.texts.size());
        program_.texts.push_back(std::move(token_.text));
        advance();
        return true;
    }

    bool parseParentheses() {
        if (++depth_ > kDeepestNesting) return fail(FormulaProblem::NestedTooDeeply);
        advance();
        if (!parseExpression(kWeakest)) return false;
        --depth_;
        return parseClose();
    }

    bool parseClose() {
        if (token_.kind == TokenKind::End) return fail(FormulaProblem::MissingParenthesis);
        if (token_.kind != TokenKind::Close) return fail(FormulaProblem::UnexpectedSymbol);
        advance();
        return true;
    }

    bool parseName() {
        const std::wstring_view name = token_.name;
        advance();
        if (token_.kind == TokenKind::Open) return parseCall(name);
        if (token_.kind == TokenKind::Colon) return parseRange(name);
        if (IsWord(name, L"TRUE") || IsWord(name, L"FALSE"))
            emit(Operation::PushBoolean, IsWord(name, L"TRUE"));
        else
            emitReference(ScanReference(name), ScanReference(name));
        return true;
    }

    bool parseRange(std::wstring_view firstName) {
        advance();
        if (token_.kind == TokenKind::End) return fail(FormulaProblem::Incomplete);
        if (token_.kind != TokenKind::Name) return fail(FormulaProblem::UnexpectedSymbol);
        emitReference(ScanReference(firstName), ScanReference(token_.name));
        advance();
        return true;
    }

    void emitReference(const ScannedReference& first, const ScannedReference& second) {
        if (first.syntax == ReferenceSyntax::NotAReference ||
            second.syntax == ReferenceSyntax::NotAReference)
            return emitError(ErrorCode::Name);
        if (first.syntax == ReferenceSyntax::OutsideSheet ||
            second.syntax == ReferenceSyntax::OutsideSheet)
            return emitError(ErrorCode::Reference);
        emit(Operation::PushReference, program_.references.size());
        program_.references.push_back(BlockBetween(first.cell, second.cell));
    }

    bool parseCall(std::wstring_view name) {
        if (++depth_ > kDeepestNesting) return fail(FormulaProblem::NestedTooDeeply);
        advance();
        int count = 0;
        if (!parseArguments(count)) return false;
        --depth_;
        if (!parseClose()) return false;

        const FunctionDescription* function = FindFunction(name);
        if (!function) {
            emit(Operation::CallUnknown, static_cast<size_t>(count));
            return true;
        }
        if (count < function->fewestArguments || count > function->mostArguments)
            return fail(FormulaProblem::WrongArgumentCount);
        emit(Operation::Call, static_cast<size_t>(count), function->id);
        return true;
    }

    // Up to, not including, the closing parenthesis.
    bool parseArguments(int& count) {
        if (token_.kind == TokenKind::Close) return true;
        for (;; advance()) {
            ++count;
            if (token_.kind == TokenKind::Separator || token_.kind == TokenKind::Close)
                emit(Operation::PushEmpty);
            else if (!parseExpression(kWeakest))
                return false;
            if (token_.kind != TokenKind::Separator) return true;
        }
    }

    TokenScanner scanner_;
    Token token_;
    Program program_;
    int depth_ = 0;
};

}  // namespace

std::wstring_view ProblemMessage(FormulaProblem problem) {
    switch (problem) {
    case FormulaProblem::None: return L"";
    case FormulaProblem::Incomplete: return L"The formula ends too early: an operand is missing.";
    case FormulaProblem::UnexpectedSymbol:
        return L"The formula has a character where none like it can stand.";
    case FormulaProblem::MissingParenthesis: return L"A closing parenthesis is missing.";
    case FormulaProblem::MissingQuote: return L"A text in the formula has no closing quote.";
    case FormulaProblem::NumberTooLarge: return L"A number in the formula is out of range.";
    case FormulaProblem::WrongArgumentCount:
        return L"A function has too few or too many arguments.";
    case FormulaProblem::NestedTooDeeply:
        return L"The formula has more than 64 levels of parentheses.";
    }
    return L"";
}

Program CompileFormula(std::wstring_view formula) { return FormulaParser(formula).parse(); }

}  // namespace workbook
