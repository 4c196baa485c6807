// A second account of how the grid scrolls, selects and answers keys and the mouse: numbers only,
// no window. Tests drive it side by side with the real grid and compare the two after every step.
#pragma once

#include "support/recording_host.h"

#include <map>

namespace kortest {

// What GetScrollInfo tells of one bar, and what the platform makes of it.
struct BarModel {
    bool hidden = false;  // by the host's toggle
    bool shown = false;   // takes room in the window
    bool known = false;   // a range was set once
    int maximum = 0;
    int page = 0;
    int position = 0;

    void set(int newMaximum, int newPage, int newPosition);
    void setPosition(int newPosition);
    void collapse();
    bool isScrollable() const { return maximum - (page > 1 ? page - 1 : 0) > 0; }
};

// One direction: columns, or rows.
struct AxisModel {
    int limit;        // 256 columns, 16384 rows
    int defaultSize;  // units
    int first = 0;
    int count = 0;
    int highestCount = 0;
    int dataRange = 0;
    std::map<int, int> units{};  // of those that were resized
    BarModel bar{};

    int end() const { return first + count; }
};

class UseModel {
public:
    // The sizes are the grid window's; the equation bar's height depends on the system's font.
    UseModel(int windowWidth, int windowHeight, int equationBarHeight);

    // The host's calls.
    void create();
    void resize(int windowWidth, int windowHeight);
    void setFirstVisibleCell(int column, int row);
    void setHorizontalDataRange(int range);
    void setVerticalDataRange(int range);
    void toggleHorizontalScrollBar();
    void toggleVerticalScrollBar();
    void toggleHeaders();
    void toggleGridLines();
    void setZoom(int level);
    void setColumnWidth(int column, int pixels);
    void setRowHeight(int row, int pixels);
    bool setSelection(GridSelection wanted);

    // The grid's messages.
    int scrollColumns(int code, int thumb);
    int scrollRows(int code, int thumb);
    int key(int virtualKey, bool shift);
    void press(int x, int y, bool shift);
    void move(int x, int y);
    void release(bool shift);
    void timer();
    void clickHeader(bool isColumnHeader, int pressed, int current);
    void selectAll();

    // The table does not say which of two rules is first for Page Up in this state.
    bool isPageUpOpen() const;

    int widthOf(int column) const { return sizeOf(columns, column); }
    int heightOf(int row) const { return sizeOf(rows, row); }
    int clientWidth() const;
    int clientHeight() const;
    GridCellPair cellFromPoint(int x, int y) const;
    bool isSelectionValid() const { return isValid(selection); }
    bool hasAnchor() const { return anchorColumn != -1 && anchorRow != -1; }

    AxisModel columns{256, 60};
    AxisModel rows{16384, 16};
    GridSelection selection{};
    int anchorColumn = -1;
    int anchorRow = -1;
    int zoom = 4;
    int rowHeaderWidth = 30;
    int cellsLeft = 30;
    int cellsTop = 0;
    bool headersHidden = false;
    int equationBarHeight;
    Lines transcript;

private:
    static bool isValid(const GridSelection& block);
    int sizeOf(const AxisModel& axis, int index) const;
    int indexFromPoint(const AxisModel& axis, int start, int position) const;
    void layOut();
    void redraw();
    void refresh(AxisModel& axis, int pixels);
    void refreshColumns(int pixels) { refresh(columns, pixels); }
    void refreshRows() { refresh(rows, clientHeight() - cellsTop); }
    void followRowNumbers(int newFirstRow);
    void applyBar(AxisModel& axis, int position);
    int settledPosition(const AxisModel& axis) const;
    void toggleBar(AxisModel& axis);
    void select(const GridSelection& block) { selection = block; }
    GridSelection spanTo(GridCellPair cell) const;
    void tellCurrentCell();

    void pageUp();
    void pageDown();
    void left(bool extend);
    void up(bool extend);
    void right(bool extend);
    void down(bool extend);

    int windowWidth_;
    int windowHeight_;
    int lastX_ = 0;
    int lastY_ = 0;
    int columnHeaderHeight_ = 16;
};

}  // namespace kortest
