// Random edits, undone and redone at random, beside a plain list of all states that there have
// been.
#include "document.h"

#include "sheet_support.h"
#include "temporary_folder.h"

#include <gtest/gtest.h>

#include <map>
#include <optional>
#include <random>
#include <utility>
#include <vector>

namespace workbook {
namespace {

using Texts = std::map<std::pair<int, int>, std::wstring>;  // by column and row

constexpr int kColumns = 4;
constexpr int kRows = 6;

Texts TextsOf(const Sheet& sheet) {
    Texts texts;
    for (const CellAddress cell : sheet.occupiedIn({0, 0, kColumnCount - 1, kRowCount - 1}))
        texts[{cell.column, cell.row}] = sheet.text(cell);
    return texts;
}

// The states one can go back and forth through, and which of them was saved.
struct Model {
    std::vector<Texts> states{{}};
    size_t now = 0;
    std::optional<size_t> saved = 0;

    void edit(Texts texts) {
        if (texts == states[now]) return;
        states.resize(now + 1);
        if (saved && *saved > now) saved.reset();
        states.push_back(std::move(texts));
        ++now;
    }
};

class Session {
public:
    Session(unsigned seed, const TemporaryFolder& folder) : folder_(folder), random_(seed) {}

    int pick(int count) { return std::uniform_int_distribution<int>(0, count - 1)(random_); }

    void step() {
        switch (pick(10)) {
        case 0: return clear();
        case 1:
        case 2: return paste();
        case 3:
        case 4: return undo();
        case 5: return redo();
        case 6: return save();
        default: return type();
        }
    }

    void undo() {
        EXPECT_EQ(document.undo().has_value(), model.now > 0);
        if (model.now > 0) --model.now;
    }

    void expectAgreement() const {
        EXPECT_EQ(TextsOf(document.sheet()), model.states[model.now]);
        EXPECT_EQ(document.isModified(), model.saved != model.now);
        EXPECT_EQ(document.canUndo(), model.now > 0);
        EXPECT_EQ(document.canRedo(), model.now + 1 < model.states.size());
    }

    // Every cell shows what it would show in a sheet that never had anything else in it.
    void expectFreshValues() const {
        Sheet fresh;
        for (const auto& [cell, text] : model.states[model.now])
            fresh.setText({cell.first, cell.second}, text);
        for (int column = 0; column < kColumns; ++column)
            for (int row = 0; row < kRows; ++row)
                EXPECT_EQ(document.sheet().display({column, row}), fresh.display({column, row}));
    }

    Document document;
    Model model;

private:
    CellAddress cell() { return {pick(kColumns), pick(kRows)}; }

    std::wstring text() {
        const std::wstring one = FormatAddress(cell());
        const std::wstring other = FormatAddress(cell());
        switch (pick(6)) {
        case 0: return {};
        case 1: return L"=SUM(" + one + L":" + other + L")";
        case 2: return L"=" + one + L"+" + other;
        case 3: return L"word";
        default: return std::to_wstring(pick(5));
        }
    }

    static void change(Texts& texts, CellAddress cell, const std::wstring& text) {
        if (text.empty())
            texts.erase({cell.column, cell.row});
        else
            texts[{cell.column, cell.row}] = text;
    }

    void type() {
        const CellAddress at = cell();
        const std::wstring typed = text();
        Texts texts = model.states[model.now];
        change(texts, at, typed);
        document.setCell(at, typed);
        model.edit(std::move(texts));
    }

    void paste() {
        Texts texts = model.states[model.now];
        std::vector<CellText> cells;
        for (int i = pick(8); i >= 0; --i) {
            cells.push_back({cell(), text()});
            change(texts, cells.back().cell, cells.back().text);
        }
        document.setCells(std::move(cells), L"pasting");
        model.edit(std::move(texts));
    }

    void clear() {
        const Block block = BlockBetween(cell(), cell());
        Texts texts = model.states[model.now];
        std::erase_if(texts, [&block](const auto& entry) {
            return Contains(block, {entry.first.first, entry.first.second});
        });
        document.clear(block);
        model.edit(std::move(texts));
    }

    void redo() {
        const bool canRedo = model.now + 1 < model.states.size();
        EXPECT_EQ(document.redo().has_value(), canRedo);
        if (canRedo) ++model.now;
    }

    void save() {
        if (pick(4) != 0) return;
        EXPECT_FALSE(document.save(folder_.at(L"a.csv")));
        model.saved = model.now;
    }

    const TemporaryFolder& folder_;
    std::mt19937 random_;
};

TEST(EditRandom, AgreesWithTheListOfStatesAndGoesAllTheWayBack) {
    const TemporaryFolder folder;
    for (unsigned seed = 1; seed <= 25; ++seed) {
        Session session(seed, folder);
        for (int i = 0; i < 150 && !testing::Test::HasFailure(); ++i) {
            session.step();
            session.expectAgreement();
            if (session.pick(3) == 0) session.expectFreshValues();
        }
        const size_t steps = session.model.now;
        EXPECT_GT(steps, 10u);
        for (size_t i = 0; i < steps; ++i) session.undo();
        session.expectAgreement();
        EXPECT_EQ(session.document.sheet().occupiedCells(), 0u);
        EXPECT_EQ(session.document.sheet().extent(), (SheetExtent{0, 0}));
        ASSERT_FALSE(testing::Test::HasFailure()) << "seed " << seed;
    }
}

}  // namespace
}  // namespace workbook
