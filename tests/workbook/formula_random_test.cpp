// Random expressions, calculated here as trees and by the sheet from their text. The text has only
// the parentheses that the operators' strengths demand (and now and then one more), so it is the
// reading of the text that is tested as well as the calculation.
#include "sheet_support.h"

#include <gtest/gtest.h>

#include <cmath>
#include <memory>
#include <optional>
#include <random>
#include <vector>

namespace workbook {
namespace {

using Number = std::optional<double>;  // nothing: an error of some kind

struct Node {
    char operation = '#';  // # number, @ cell, + - * / ^, n negative, % percent, s a m i: functions
    double number = 0;
    CellAddress cell;
    std::vector<std::unique_ptr<Node>> parts;
};

int StrengthOf(char operation) {
    switch (operation) {
    case '+':
    case '-': return 1;
    case '*':
    case '/': return 2;
    case '^': return 3;
    case '%': return 4;
    case 'n': return 5;
    default: return 6;
    }
}

class Expressions {
public:
    explicit Expressions(unsigned seed) : random_(seed) {
        for (int row = 0; row < 8; ++row) cells_.push_back(pick(13) - 4);
    }

    int pick(int count) { return std::uniform_int_distribution<int>(0, count - 1)(random_); }
    const std::vector<int>& cells() const { return cells_; }

    std::unique_ptr<Node> grow(int depth) {
        auto node = std::make_unique<Node>();
        const int kind = depth == 0 ? pick(2) : pick(12);
        if (kind == 0) {
            node->number = pick(20) / 4.0;
        } else if (kind == 1) {
            node->operation = '@';
            node->cell = {1, pick(static_cast<int>(cells_.size()))};
        } else {
            node->operation = "+-*/^n%samin"[kind];
            if (kind == 2) node->operation = '+';
            for (int i = partsOf(node->operation); i > 0; --i)
                node->parts.push_back(grow(depth - 1));
        }
        return node;
    }

    std::wstring write(const Node& node) {
        std::wstring text = writeBare(node);
        if (pick(12) == 0) text = L"(" + text + L")";
        if (pick(12) == 0) text = L" " + text + L" ";
        return text;
    }

    Number calculate(const Node& node) const {
        if (node.operation == '#') return node.number;
        if (node.operation == '@') return cells_[static_cast<size_t>(node.cell.row)];
        std::vector<double> values;
        bool isBad = false;
        for (const auto& part : node.parts) {
            const Number value = calculate(*part);
            isBad |= !value;
            values.push_back(value.value_or(0));
        }
        if (node.operation == 'i') {  // =IF(a<=b, c, d)
            const Number left = calculate(*node.parts[0]);
            const Number right = calculate(*node.parts[1]);
            if (!left || !right) return std::nullopt;
            return calculate(*node.parts[isAtMost(*left, *right) ? 2 : 3]);
        }
        if (isBad) return std::nullopt;
        const double result = combine(node.operation, values);
        return std::isfinite(result) ? Number(result) : std::nullopt;
    }

private:
    int partsOf(char operation) {
        switch (operation) {
        case 'n':
        case '%': return 1;
        case 's':
        case 'a':
        case 'm': return pick(3) + 1;
        case 'i': return 4;
        default: return 2;
        }
    }

    static bool isAtMost(double left, double right) {
        const double scale = std::fmax(std::fabs(left), std::fabs(right));
        return left <= right || left - right <= scale * std::pow(2.0, -48);
    }

    static double combine(char operation, const std::vector<double>& values) {
        double sum = 0;
        double highest = values[0];
        for (const double value : values) {
            sum += value;
            highest = std::fmax(highest, value);
        }
        switch (operation) {
        case '+': return values[0] + values[1];
        case '-': return values[0] - values[1];
        case '*': return values[0] * values[1];
        case '/': return values[1] == 0 ? NAN : values[0] / values[1];
        case '^': return values[0] == 0 && values[1] <= 0 ? NAN : std::pow(values[0], values[1]);
        case 'n': return -values[0];
        case '%': return values[0] / 100;
        case 'a': return sum / static_cast<double>(values.size());
        case 'm': return highest;
        default: return sum;
        }
    }

    // A part in parentheses when it binds less strongly than what surrounds it.
    std::wstring writePart(const Node& part, int strength) {
        const std::wstring text = write(part);
        const bool needs = StrengthOf(part.operation) < strength;
        return needs ? L"(" + text + L")" : text;
    }

    std::wstring writeBare(const Node& node) {
        const int strength = StrengthOf(node.operation);
        switch (node.operation) {
        case '#': return JoinNumberText(node.number);
        case '@': return FormatAddress(node.cell);
        case 'n': return L"-" + writePart(*node.parts[0], strength);
        case '%': return writePart(*node.parts[0], strength) + L"%";
        case 's': return L"SUM(" + writeList(node, L',') + L")";
        case 'a': return L"average(" + writeList(node, L';') + L")";
        case 'm': return L"Max(" + writeList(node, L',') + L")";
        case 'i':
            return L"IF(" + write(*node.parts[0]) + L"<=" + write(*node.parts[1]) + L"," +
                   write(*node.parts[2]) + L"," + write(*node.parts[3]) + L")";
        default: break;
        }
        // Operators of the same strength go from left to right.
        return writePart(*node.parts[0], strength) + static_cast<wchar_t>(node.operation) +
               writePart(*node.parts[1], strength + 1);
    }

    std::wstring writeList(const Node& node, wchar_t separator) {
        std::wstring text;
        for (const auto& part : node.parts) {
            if (!text.empty()) text += separator;
            text += write(*part);
        }
        return text;
    }

    static std::wstring JoinNumberText(double quarters) {
        std::wstring text = std::to_wstring(quarters);
        while (text.back() == L'0') text.pop_back();
        return text;  // "2." is a number, too
    }

    std::mt19937 random_;
    std::vector<int> cells_;
};

TEST(FormulaRandom, TextAndTreeComeToTheSame) {
    int numbers = 0;
    int errors = 0;
    for (unsigned seed = 1; seed <= 3000; ++seed) {
        Expressions expressions(seed);
        Sheet sheet;
        for (size_t row = 0; row < expressions.cells().size(); ++row)
            sheet.setText({1, static_cast<int>(row)}, std::to_wstring(expressions.cells()[row]));
        const auto tree = expressions.grow(expressions.pick(5));
        const std::wstring formula = L"=" + expressions.write(*tree);
        const Number expected = expressions.calculate(*tree);
        sheet.setText({0, 0}, formula);
        const Value value = sheet.value({0, 0});

        ASSERT_EQ(sheet.formulaProblem({0, 0}), L"") << formula;
        ASSERT_EQ(value.isNumber(), expected.has_value()) << "seed " << seed << ": " << formula;
        if (expected) {
            ASSERT_NEAR(value.number, *expected, std::fabs(*expected) * 1e-9 + 1e-9)
                << "seed " << seed << ": " << formula;
        }
        (expected ? numbers : errors) += 1;
    }
    EXPECT_GT(numbers, 1500);
    EXPECT_GT(errors, 100);
}

TEST(FormulaRandom, AnySymbolsGiveAValueOrAnError) {
    const std::wstring symbols = L"()+-*/^%&=<>,;:\"A1B$.5E SUMIF#'!x\u00E9";
    std::mt19937 random(7);
    const auto pick = [&random](size_t count) {
        return std::uniform_int_distribution<size_t>(0, count - 1)(random);
    };
    int readable = 0;
    for (int i = 0; i < 20000; ++i) {
        std::wstring formula = L"=";
        for (size_t length = pick(14) + 1; length > 0; --length)
            formula += symbols[pick(symbols.size())];
        const Sheet sheet = SheetOf({{L"C3", formula}});
        const Value value = ValueAt(sheet, L"C3");
        ASSERT_FALSE(value.isEmpty()) << formula;
        const bool isReadable = sheet.formulaProblem(At(L"C3")).empty();
        readable += isReadable;
        ASSERT_TRUE(isReadable || Show(sheet, L"C3") == L"#VALUE!") << formula;
    }
    EXPECT_GT(readable, 200);
}

}  // namespace
}  // namespace workbook
