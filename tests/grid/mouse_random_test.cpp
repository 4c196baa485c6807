// Random presses, moves, releases and timer ticks against the model, at any position.
#include "grid/use_grid.h"

#include <random>

namespace kortest {
namespace {

class RandomMouse : public GridUse, public ::testing::WithParamInterface<unsigned> {
protected:
    int below(int end) { return static_cast<int>(random() % static_cast<unsigned>(end)); }

    int someX() {
        const int places[] = {
            below(clientWidth()),           below(clientWidth()), below(40),
            clientWidth() - 20 + below(40), -1 - below(30),       30000 + below(9000)};
        return places[below(6)];
    }
    int someY() {
        const int places[] = {below(clientHeight()), below(clientHeight()),
                              below(cellsTop()),     clientHeight() - 20 + below(40),
                              -1 - below(30),        below(32000)};
        return places[below(6)];
    }

    void step() {
        // A model of 32-bit positions needs what the 16-bit message words become.
        const int x = someX() & 0xFFFF;
        const int y = someY();
        const bool shift = below(3) == 0;
        switch (below(9)) {
        case 0:
        case 1:
            what = "press " + std::to_string(x) + " " + std::to_string(y);
            EXPECT_EQ(press(x, y, shift), 0);
            model.press(x, y, shift);
            break;
        case 2:
        case 3:
        case 4:
        case 5:
            what = "move " + std::to_string(x) + " " + std::to_string(y);
            EXPECT_EQ(move(x, y), 0);
            model.move(x, y);
            break;
        case 6:
            what = "release";
            EXPECT_EQ(release(shift), 0);
            model.release(shift);
            break;
        case 7:
            what = "timer";
            timer();
            model.timer();
            break;
        case 8: jump(); break;
        }
        if (shift) what += " with Shift";
    }

    void jump() {
        const int column = below(3) ? below(20) : 245 + below(14);
        const int row = below(3) ? below(300) : 16370 + below(17);
        what = "show " + CellName(column, row);
        SetFirstVisibleCell(KORGRID_CELL(column, row));
        model.setFirstVisibleCell(column, row);
    }

    std::mt19937 random;
    std::string what;
};

TEST_P(RandomMouse, FollowsTheModel) {
    random.seed(GetParam());
    open(60 + below(400), 40 + below(200));
    for (int i = 0; i < 3; ++i) {
        SetColumnWidth(i, 20 + 40 * i);
        model.setColumnWidth(i, 20 + 40 * i);
        SetRowHeight(i, 8 + 11 * i);
        model.setRowHeight(i, 8 + 11 * i);
    }
    SetFirstVisibleCell(0);
    model.setFirstVisibleCell(0, 0);
    SetFocus(grid);
    told();
    std::string history;
    for (int i = 0; i < 800 && !HasFailure(); ++i) {
        model.transcript.clear();
        step();
        history += what + "\n";
        EXPECT_EQ(told(), model.transcript);
        EXPECT_EQ(BlockName(Selection()), BlockName(model.selection));
        EXPECT_EQ(VisibleRange(), Range(model.columns.first, model.columns.end(), model.rows.first,
                                        model.rows.end()));
        if (i % 20 == 0 && model.isSelectionValid()) {
            EXPECT_EQ(highlight(), expectedHighlight());
        }
    }
    EXPECT_FALSE(HasFailure()) << history;
}

INSTANTIATE_TEST_SUITE_P(Seeds, RandomMouse, ::testing::Range(200u, 206u));

}  // namespace
}  // namespace kortest
