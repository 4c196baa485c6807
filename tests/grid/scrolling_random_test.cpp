// Long random sequences of everything that moves the view, against the model.
#include "grid/use_grid.h"

#include <random>

namespace kortest {
namespace {

class RandomScrolling : public GridUse, public ::testing::WithParamInterface<unsigned> {
protected:
    int below(int end) { return static_cast<int>(random() % static_cast<unsigned>(end)); }

    void step() {
        switch (below(16)) {
        case 0:
        case 1:
        case 2: scrollBoth(true); break;
        case 3:
        case 4:
        case 5: scrollBoth(false); break;
        case 6:
        case 7: showSomeCell(); break;
        case 8: setSomeRange(); break;
        case 9: toggleSomeBar(); break;
        case 10: toggleSomeView(); break;
        case 11: setSomeSize(); break;
        case 12: selectSomeBlock(); break;
        case 13: clickSomeHeader(); break;
        case 14: resizeSomehow(); break;
        case 15: holdPointer(); break;
        }
    }

    void scrollBoth(bool alongColumns) {
        const int code = below(6);
        const int thumb = below(4) ? below(60) : below(alongColumns ? 260 : 16400);
        what = "scroll " + std::string(alongColumns ? "columns " : "rows ") + std::to_string(code) +
               " " + std::to_string(thumb);
        if (alongColumns) {
            EXPECT_EQ(scrollColumns(code, thumb), model.scrollColumns(code, thumb));
        } else {
            EXPECT_EQ(scrollRows(code, thumb), model.scrollRows(code, thumb));
        }
    }

    void showSomeCell() {
        const int column = below(8) ? below(256) : below(65536);
        const int rows[] = {below(100), 980 + below(20), 9980 + below(20), below(16384),
                            below(65536)};
        const int row = rows[below(5)];
        what = "show " + CellName(column, row);
        SetFirstVisibleCell(KORGRID_CELL(column, row));
        model.setFirstVisibleCell(column, row);
    }

    void setSomeRange() {
        const int range = below(3) ? below(300) - 20 : below(20000);
        what = "range " + std::to_string(range);
        if (below(2)) {
            SetHorizontalDataRange(range);
            model.setHorizontalDataRange(range);
        } else {
            SetVerticalDataRange(range);
            model.setVerticalDataRange(range);
        }
    }

    void toggleSomeBar() {
        if (below(2)) {
            what = "toggle horizontal bar";
            EXPECT_EQ(ToggleHorizontalScrollBar(), 1u);
            model.toggleHorizontalScrollBar();
        } else {
            what = "toggle vertical bar";
            EXPECT_EQ(ToggleVerticalScrollBar(), 1u);
            model.toggleVerticalScrollBar();
        }
    }

    void toggleSomeView() {
        const int choice = below(8);
        if (choice < 2) {
            what = "toggle headers";
            ToggleViewStateOfHeaders();
            model.toggleHeaders();
        } else if (choice < 5) {
            what = "toggle lines";
            ToggleGridLines();
            model.toggleGridLines();
        } else {
            const int level = choice == 5 ? 1 + below(9) : 4;
            what = "zoom " + std::to_string(level);
            SetGridZoomLevel(static_cast<DWORD>(level));
            model.setZoom(level);
        }
    }

    void setSomeSize() {
        if (model.columns.count < 1 || model.rows.count < 1) return;
        const int pixels = below(10) ? 4 + below(120) : below(900);
        const bool isColumn = below(2) != 0;
        const int index = below(isColumn ? model.columns.count : model.rows.count);
        what = "size " + std::to_string(index) + " " + std::to_string(pixels);
        if (isColumn) {
            EXPECT_EQ(SetColumnWidth(index, pixels), 1u);
            model.setColumnWidth(index, pixels);
        } else {
            EXPECT_EQ(SetRowHeight(index, pixels), 1u);
            model.setRowHeight(index, pixels);
        }
        send(GRIDM_REDRAW);
        model.toggleGridLines();  // the same layout and redraw
    }

    void selectSomeBlock() {
        const int left = below(256);
        const int top = below(16384);
        const GridSelection block = Block(left, left + below(6), top, top + below(30));
        what = "select " + BlockName(block);
        EXPECT_EQ(Select(block.left, block.right, block.top, block.bottom) != 0,
                  model.setSelection(block));
    }

    void clickSomeHeader() {
        if (model.columns.end() > 256 || model.columns.count < 1) return;
        if (model.rows.end() > 16384 || model.rows.count < 1) return;
        const bool isColumn = below(2) != 0;
        const int count = isColumn ? model.columns.count : model.rows.count;
        const int pressed = below(count);
        const int current = below(count);
        what = "click " + std::to_string(pressed) + " " + std::to_string(current);
        EXPECT_EQ(clickHeader(isColumn ? columnHeader : rowHeader, pressed, current), 0);
        model.clickHeader(isColumn, pressed, current);
    }

    void resizeSomehow() {
        const int width = 100 + below(700);
        const int height = 80 + below(500);
        what = "resize " + std::to_string(width) + " " + std::to_string(height);
        resize(width, height);
        model.resize(width, height);
    }

    // The auto-scroll timer with the pointer anywhere, also outside.
    void holdPointer() {
        const int x = below(900);
        const int y = below(700) - 50;
        what = "hold " + std::to_string(x) + " " + std::to_string(y);
        move(x, y);
        model.move(x, y);
        timer();
        model.timer();
    }

    std::mt19937 random;
    std::string what;
};

TEST_P(RandomScrolling, FollowsTheModel) {
    random.seed(GetParam());
    open(330 + below(100), 168 + below(60), below(2) ? Bars::FromBegin : Bars::WhenRanged);
    if (below(2)) {
        SetHorizontalDataRange(50);
        model.setHorizontalDataRange(50);
        SetVerticalDataRange(1200);
        model.setVerticalDataRange(1200);
    }
    told();
    std::string history;
    for (int i = 0; i < 300 && !HasFailure(); ++i) {
        model.transcript.clear();
        step();
        history += what + "\n";
        EXPECT_EQ(told(), model.transcript);
        EXPECT_TRUE(isAsModel());
        if (i % 3 == 0 && model.isSelectionValid()) {
            EXPECT_EQ(highlight(), expectedHighlight());
        }
    }
    EXPECT_FALSE(HasFailure()) << history;
}

INSTANTIATE_TEST_SUITE_P(Seeds, RandomScrolling, ::testing::Range(1u, 9u));

}  // namespace
}  // namespace kortest
