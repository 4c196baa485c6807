// Thousands of random keys with and without Shift, with anchors from the mouse, against the model.
#include "grid/use_grid.h"

#include <optional>
#include <random>

namespace kortest {
namespace {

class RandomKeys : public GridUse, public ::testing::WithParamInterface<unsigned> {
protected:
    int below(int end) { return static_cast<int>(random() % static_cast<unsigned>(end)); }

    void pressSomeKey() {
        static constexpr int kKeys[] = {VK_LEFT, VK_UP,     VK_RIGHT,  VK_DOWN,  VK_LEFT,
                                        VK_UP,   VK_RIGHT,  VK_DOWN,   VK_PRIOR, VK_NEXT,
                                        VK_TAB,  VK_RETURN, VK_DELETE, VK_ESCAPE};
        // Most often one of the arrows, so that walks are long.
        const int key = kKeys[below(below(3) ? 8 : 14)];
        if (key == VK_PRIOR && model.isPageUpOpen()) return;
        const bool shift = below(2) != 0;
        what = "key " + std::to_string(key) + (shift ? " with Shift" : "");
        std::optional<KeyHeld> held;
        if (shift) held.emplace(VK_SHIFT);
        EXPECT_EQ(PressKey(grid, static_cast<WPARAM>(key)), model.key(key, shift));
    }

    void pressSomeCell() {
        const int x = below(clientWidth());
        const int y = cellsTop() + below(clientHeight() - cellsTop());
        const bool shiftDown = below(3) == 0;
        const bool shiftUp = below(3) != 0;
        what = "press " + std::to_string(x) + " " + std::to_string(y) +
               (shiftDown ? " Shift down" : "") + (shiftUp ? " Shift up" : "");
        press(x, y, shiftDown);
        model.press(x, y, shiftDown);
        release(shiftUp);
        model.release(shiftUp);
    }

    // The host jumps: to the sheet's corners as often as anywhere.
    void jump() {
        const int column = below(2) ? below(256) : below(2) ? below(3) : 253 + below(3);
        const int row = below(2) ? below(16384) : below(2) ? below(3) : 16381 + below(3);
        what = "jump " + CellName(column, row);
        Select(column, column, row, row);
        model.setSelection(Block(column, column, row, row));
        const int firstColumn = std::max(0, column - below(8));
        const int firstRow = std::max(0, row - below(14));
        SetFirstVisibleCell(KORGRID_CELL(firstColumn, firstRow));
        model.setFirstVisibleCell(firstColumn, firstRow);
    }

    void selectSomeBlock() {
        const int left = below(250);
        const int top = below(16000);
        const GridSelection block = Block(left, left + below(6), top, top + below(300));
        what = "select " + BlockName(block);
        Select(block.left, block.right, block.top, block.bottom);
        model.setSelection(block);
    }

    std::mt19937 random;
    std::string what;
};

TEST_P(RandomKeys, FollowTheModel) {
    random.seed(GetParam());
    open(100 + below(400), 60 + below(200));
    SetFocus(grid);
    told();
    std::string history;
    for (int i = 0; i < 1500 && !HasFailure(); ++i) {
        model.transcript.clear();
        what.clear();
        const int choice = below(40);
        if (choice < 33) {
            pressSomeKey();
        } else if (choice < 37) {
            pressSomeCell();
        } else if (choice < 39) {
            jump();
        } else {
            selectSomeBlock();
        }
        history += what + "\n";
        EXPECT_EQ(told(), model.transcript);
        EXPECT_EQ(BlockName(Selection()), BlockName(model.selection));
        EXPECT_EQ(VisibleRange(), Range(model.columns.first, model.columns.end(), model.rows.first,
                                        model.rows.end()));
        if (i % 50 == 0) {
            EXPECT_TRUE(isAsModel());
            if (model.isSelectionValid()) {
                EXPECT_EQ(highlight(), expectedHighlight());
            }
        }
    }
    EXPECT_FALSE(HasFailure()) << history;
}

INSTANTIATE_TEST_SUITE_P(Seeds, RandomKeys, ::testing::Range(100u, 108u));

}  // namespace
}  // namespace kortest
