// Blocks of random cells, made of the characters that matter, written and read back.
#include "tab_text.h"

#include <gtest/gtest.h>

#include <random>

namespace workbook {
namespace {

class Maker {
public:
    explicit Maker(unsigned seed) : random_(seed) {}

    std::vector<TextRow> rows() {
        std::vector<TextRow> rows(static_cast<size_t>(pick(1, 5)));
        for (TextRow& row : rows) {
            row.resize(static_cast<size_t>(pick(1, 5)));
            for (std::wstring& cell : row) cell = text();
        }
        return rows;
    }

    std::wstring text() {
        static constexpr std::wstring_view kLetters = L"\t\r\n\"\"ab ,\x00e9\xd83d\xde00";
        std::wstring text;
        for (int i = pick(0, 6); i > 0; --i) {
            text += kLetters[static_cast<size_t>(pick(0, static_cast<int>(kLetters.size()) - 1))];
        }
        return text;
    }

private:
    int pick(int first, int last) {
        return std::uniform_int_distribution<int>(first, last)(random_);
    }

    std::mt19937 random_;
};

TEST(TabTextRandom, WhatIsWrittenIsReadBack) {
    for (unsigned seed = 1; seed <= 3000; ++seed) {
        const std::vector<TextRow> rows = Maker(seed).rows();
        ASSERT_EQ(ReadTabText(WriteTabText(rows)), rows) << "seed " << seed;
    }
}

// Whatever another program left on the clipboard: no text is refused, and none changes any more
// once it was read and written.
TEST(TabTextRandom, AnyTextIsReadAndKeepsItsMeaning) {
    for (unsigned seed = 1; seed <= 3000; ++seed) {
        const std::wstring text = Maker(seed).text();
        const std::vector<TextRow> rows = ReadTabText(text);
        EXPECT_EQ(rows.empty(), text.empty()) << "seed " << seed;
        ASSERT_EQ(ReadTabText(WriteTabText(rows)), rows) << "seed " << seed;
    }
}

}  // namespace
}  // namespace workbook
