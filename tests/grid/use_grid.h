// A grid whose cell area has a chosen size, and the model that goes with it.
#pragma once

#include "grid/grid_fixture.h"
#include "grid/use_model.h"

namespace kortest {

// Of a fresh grid.
constexpr int kRowHeaderWidth = 30;
constexpr int kColumnHeaderHeight = 16;
constexpr int kColumnWidth = 60;
constexpr int kRowHeight = 16;
constexpr WPARAM kAutoScrollTimer = 10101;

class GridUse : public GridTest {
protected:
    GridUse() : GridTest(1200, 900) {}

    enum class Bars {
        WhenRanged,  // the platform shows a bar as soon as it gets a range
        FromBegin,   // both take their room from the first layout on
    };

    // Creates the grid so that its cells, beside headers and bars, have this size.
    void open(int cellsWidth, int cellsHeight, Bars bars = Bars::FromBegin);

    // The lines since the last call. The creation is not told.
    Lines told();

    int clientWidth() const { return static_cast<int>(client().right); }
    int clientHeight() const { return static_cast<int>(client().bottom); }
    int barHeight() const { return expected.equationBarHeight; }  // the equation bar's
    int cellsTop() const { return barHeight() + kColumnHeaderHeight; }

    // The middle of a cell of a fresh grid.
    static int middleX(int column) {
        return kRowHeaderWidth + column * kColumnWidth + kColumnWidth / 2;
    }
    int middleY(int row) const { return cellsTop() + row * kRowHeight + kRowHeight / 2; }

    SCROLLINFO bar(int which) const;  // SB_HORZ, SB_VERT

    LRESULT send(UINT message, WPARAM wParam = 0, LPARAM lParam = 0) {
        return SendMessageW(grid, message, wParam, lParam);
    }
    LRESULT scrollColumns(int code, int thumb = 0) {
        return send(WM_HSCROLL, MAKEWPARAM(code, thumb));
    }
    LRESULT scrollRows(int code, int thumb = 0) {
        return send(WM_VSCROLL, MAKEWPARAM(code, thumb));
    }
    LRESULT press(int x, int y, bool shift = false);
    LRESULT move(int x, int y);
    LRESULT release(bool shift = false);
    LRESULT timer(WPARAM id = kAutoScrollTimer) { return send(WM_TIMER, id); }
    LRESULT clickHeader(HWND header, int pressed, int current);

    // Presses and lets go at the middle of a cell of a fresh grid. With Shift the anchor stays.
    void pressCell(int column, int row, bool shift = false);

    // Presses without Shift, lets go with it: the anchor is at the cell afterwards.
    void anchorAt(int column, int row);

    // Everything that can be seen of the grid: origin, counts, selection, bars, headers.
    ::testing::AssertionResult isAsModel() const;

    // Which of the visible cells the window shows inverted, and which the model has selected: a
    // line of '#' and '.' for each row, '?' for a cell that begins outside the client area.
    Lines highlight();
    Lines expectedHighlight() const;

    UseModel model{0, 0, 0};  // as the grid was created; tests change both alike

private:
    Lines cellMap(const std::function<char(int column, int row, int x, int y)>& mark) const;
};

class GuardedGridUse : public GridUse {
protected:
    GuardedGridUse() : heap(spy) {}
    ~GuardedGridUse() override;
    void TearDown() override;

    GuardHeap heap;
};

// "C5:E9"
std::string BlockName(const GridSelection& block);
GridSelection Block(int left, int right, int top, int bottom);
DWORD Select(int left, int right, int top, int bottom);  // SetSelectedRanged
GridVisibleRange Range(int firstColumn, int endColumn, int firstRow, int endRow);

// "A", "B", ... "Z", "AA", ...
std::string ColumnLabel(int column);

// A header strip's labels and sizes: "A 60".
Lines HeaderItems(HWND header);

// What SetScrollInfo was given, one line a call: "horizontal mask 7 min 0 max 9 page 6 position 3
// redraw 1". Begins to watch on construction.
class ScrollInfoLog {
public:
    explicit ScrollInfoLog(ImportSpy& spy);
    Lines lines() const { return lines_; }
    void clear() { lines_.clear(); }

private:
    Lines lines_;
};

// A recorded call's arguments, cut to 32 bits: the rest of an integer's register or stack place is
// undefined on 64-bit systems. Handles have no more than 32 bits.
std::vector<DWORD> ArgumentsOf(const ImportCall& call);
DWORD HandleValue(HWND window);

std::string BarCall(bool isHorizontal, int maximum, int page, int position);

}  // namespace kortest
