// Random sheets of sums, changed at random, against a model that knows the answer by other means:
// rings from a table of who reaches whom, values by adding up on paper.
#include "sheet_support.h"

#include <gtest/gtest.h>

#include <array>
#include <optional>
#include <random>
#include <vector>

namespace workbook {
namespace {

constexpr int kColumns = 5;
constexpr int kRows = 5;
constexpr int kCells = kColumns * kRows;

// Cells stand apart, so that ranges cross pages of the store and reach over empty cells.
CellAddress AddressOf(int index) { return {index % kColumns * 3, index / kColumns * 50}; }

struct ModelCell {
    int constant = 0;
    std::vector<Block> reads;
    bool isEmpty = true;
};

class Model {
public:
    std::array<ModelCell, kCells> cells;

    // The expected number, or nothing for #CIRC!.
    std::array<std::optional<double>, kCells> values() const {
        std::array<std::array<bool, kCells>, kCells> reaches{};
        for (int from = 0; from < kCells; ++from)
            for (int to = 0; to < kCells; ++to) reaches[At(from)][At(to)] = readsDirectly(from, to);
        for (int over = 0; over < kCells; ++over)
            for (int from = 0; from < kCells; ++from)
                for (int to = 0; to < kCells; ++to)
                    if (reaches[At(from)][At(over)] && reaches[At(over)][At(to)])
                        reaches[At(from)][At(to)] = true;

        std::array<std::optional<double>, kCells> result;
        for (int cell = 0; cell < kCells; ++cell) {
            bool isBad = false;  // in a ring, or reading one
            for (int other = 0; other < kCells; ++other)
                isBad |= reaches[At(other)][At(other)] &&
                         (other == cell || reaches[At(cell)][At(other)]);
            if (!isBad) result[At(cell)] = valueOf(cell);
        }
        return result;
    }

private:
    static size_t At(int index) { return static_cast<size_t>(index); }

    // How many of the blocks that `from` reads have `to` in them.
    int timesRead(int from, int to) const {
        int times = 0;
        for (const Block& block : cells[At(from)].reads) times += Contains(block, AddressOf(to));
        return times;
    }

    // An empty cell in a block is not read, a constant cannot be in a ring.
    bool readsDirectly(int from, int to) const {
        return !cells[At(to)].isEmpty && timesRead(from, to) > 0;
    }

    double valueOf(int cell) const {
        double value = cells[At(cell)].constant;
        for (int other = 0; other < kCells; ++other)
            if (readsDirectly(cell, other)) value += timesRead(cell, other) * valueOf(other);
        return value;
    }
};

class Scene {
public:
    explicit Scene(unsigned seed) : random_(seed) {}

    int pick(int count) { return std::uniform_int_distribution<int>(0, count - 1)(random_); }

    // Changes one cell in the model and in the sheet.
    void change() {
        const int index = pick(kCells);
        ModelCell& cell = model.cells[static_cast<size_t>(index)];
        cell = {};
        std::wstring text;
        const int kind = pick(10);
        if (kind >= 2) {
            cell.isEmpty = false;
            cell.constant = pick(9) + 1;
            text = std::to_wstring(cell.constant);
        }
        if (kind >= 5) {
            text = L"=" + text;
            for (int reads = pick(2) + 1; reads > 0; --reads) {
                const CellAddress one = AddressOf(pick(kCells));
                const CellAddress other = pick(3) == 0 ? AddressOf(pick(kCells)) : one;
                cell.reads.push_back(BlockBetween(one, other));
                text += L"+SUM(" + FormatBlock(cell.reads.back()) + L")";
            }
        }
        sheet.setText(AddressOf(index), text);
    }

    std::wstring expected(int index, const std::optional<double>& value) const {
        if (model.cells[static_cast<size_t>(index)].isEmpty) return L"";
        if (!value) return L"#CIRC!";
        return DisplayText(Value::ofNumber(*value).view());
    }

    Model model;
    Sheet sheet;

private:
    std::mt19937 random_;
};

TEST(RecalculationRandom, AgreesWithTheModelAfterEveryChange) {
    int rings = 0;
    int numbers = 0;
    for (unsigned seed = 1; seed <= 40; ++seed) {
        Scene scene(seed);
        for (int step = 0; step < 60; ++step) {
            scene.change();
            if (scene.pick(3) == 0) continue;  // several changes between two looks
            const auto values = scene.model.values();
            const int first = scene.pick(kCells);
            for (int i = 0; i < kCells; ++i) {
                const int index = (first + i * 7) % kCells;
                const auto& value = values[static_cast<size_t>(index)];
                ASSERT_EQ(scene.sheet.display(AddressOf(index)), scene.expected(index, value))
                    << "seed " << seed << ", step " << step << ", cell " << index;
                (value ? numbers : rings) += 1;
                if (scene.pick(20) == 0) break;  // leaves some cells uncalculated
            }
        }
    }
    // The scenes must have had both, or they would have shown little.
    EXPECT_GT(rings, 1000);
    EXPECT_GT(numbers, 1000);
}

}  // namespace
}  // namespace workbook
