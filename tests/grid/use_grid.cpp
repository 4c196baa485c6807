#include "grid/use_grid.h"

namespace kortest {

namespace {

int WithBar(int size, bool hasBar, int metric) {
    return hasBar ? size + GetSystemMetrics(metric) : size;
}

std::string Number(int value) { return std::to_string(value); }

std::string Text(int maximum, int page, int position) {
    return "max " + Number(maximum) + " page " + Number(page) + " position " + Number(position);
}

std::string Text(const SCROLLINFO& bar) {
    return Text(bar.nMax, static_cast<int>(bar.nPage), bar.nPos);
}

std::string Text(const BarModel& bar) { return Text(bar.maximum, bar.page, bar.position); }

std::string Text(const GridVisibleRange& range) { return ::testing::PrintToString(range); }

std::string Joined(const Lines& lines) {
    std::string joined;
    for (const std::string& line : lines) joined += line + ", ";
    return joined;
}

void Compare(std::string* differences, const std::string& what, const std::string& expected,
             const std::string& actual) {
    if (expected == actual) return;
    *differences += what + ": expected " + expected + ", is " + actual + "\n";
}

Lines ExpectedItems(const AxisModel& axis, const std::function<std::string(int)>& label,
                    const std::function<int(int)>& size) {
    Lines items;
    for (int index = axis.first; index < axis.end(); ++index) {
        items.push_back(label(index) + " " + Number(size(index)));
    }
    return items;
}

}  // namespace

void GridUse::open(int cellsWidth, int cellsHeight, Bars bars) {
    const bool hasBars = bars == Bars::FromBegin;
    const int barText = EquationBarHeightFor(host.window());
    const int width = WithBar(kRowHeaderWidth + cellsWidth, hasBars, SM_CXVSCROLL);
    const int height = WithBar(barText + kColumnHeaderHeight + cellsHeight, hasBars, SM_CYHSCROLL);
    create(width, height, hasBars ? RecordingHost::kGridStyleWithBars : RecordingHost::kGridStyle);
    model = UseModel(width, height, barText);
    model.columns.bar.shown = model.rows.bar.shown = hasBars;
    model.create();
    model.transcript.clear();
}

Lines GridUse::told() {
    Lines lines = host.transcript();
    host.clear();
    return lines;
}

SCROLLINFO GridUse::bar(int which) const {
    SCROLLINFO info{};
    info.cbSize = sizeof(info);
    info.fMask = SIF_ALL;
    GetScrollInfo(grid, which, &info);
    return info;
}

LRESULT GridUse::press(int x, int y, bool shift) {
    return send(WM_LBUTTONDOWN, MK_LBUTTON | (shift ? MK_SHIFT : 0u), MAKELPARAM(x, y));
}

LRESULT GridUse::move(int x, int y) { return send(WM_MOUSEMOVE, MK_LBUTTON, MAKELPARAM(x, y)); }

LRESULT GridUse::release(bool shift) {
    return send(WM_LBUTTONUP, shift ? MK_SHIFT : 0u, MAKELPARAM(5, 5));
}

LRESULT GridUse::clickHeader(HWND header, int pressed, int current) {
    return send(HCN_ITEMCLICK, reinterpret_cast<WPARAM>(header), MAKELPARAM(pressed, current));
}

void GridUse::pressCell(int column, int row, bool shift) {
    press(middleX(column), middleY(row), shift);
    release(shift);
}

void GridUse::anchorAt(int column, int row) {
    press(middleX(column), middleY(row));
    release(true);
}

::testing::AssertionResult GridUse::isAsModel() const {
    std::string differences;
    const AxisModel& columns = model.columns;
    const AxisModel& rows = model.rows;
    Compare(&differences, "visible",
            Text(Range(columns.first, columns.end(), rows.first, rows.end())),
            Text(VisibleRange()));
    Compare(&differences, "visible columns", Number(columns.count),
            std::to_string(GetNumberOfVisibleColumns()));
    Compare(&differences, "visible rows", Number(rows.count),
            std::to_string(GetNumberOfVisibleRows()));
    Compare(&differences, "selection", BlockName(model.selection), BlockName(Selection()));
    if (columns.bar.known) {
        Compare(&differences, "horizontal bar", Text(columns.bar), Text(bar(SB_HORZ)));
    }
    if (rows.bar.known) {
        Compare(&differences, "vertical bar", Text(rows.bar), Text(bar(SB_VERT)));
    }
    Compare(&differences, "left edge of the cells", Number(model.cellsLeft),
            std::to_string(ChildRect(columnHeader).left));
    Compare(&differences, "column header",
            Joined(ExpectedItems(columns, ColumnLabel, [&](int c) { return model.widthOf(c); })),
            Joined(HeaderItems(columnHeader)));
    Compare(&differences, "row header",
            Joined(ExpectedItems(
                rows, [](int row) { return Number(row + 1); },
                [&](int row) { return model.heightOf(row); })),
            Joined(HeaderItems(rowHeader)));
    if (differences.empty()) return ::testing::AssertionSuccess();
    return ::testing::AssertionFailure() << differences;
}

Lines GridUse::cellMap(const std::function<char(int, int, int, int)>& mark) const {
    Lines lines;
    int y = model.cellsTop;
    for (int row = model.rows.first; row < model.rows.end(); ++row) {
        std::string line;
        int x = model.cellsLeft;
        for (int column = model.columns.first; column < model.columns.end(); ++column) {
            line += mark(column, row, x + 2, y + 2);
            x += model.widthOf(column);
        }
        lines.push_back(line);
        y += model.heightOf(row);
    }
    return lines;
}

Lines GridUse::highlight() {
    UpdateWindow(grid);
    const Picture picture = ReadWindow(grid);
    return cellMap([&](int, int, int x, int y) {
        const COLORREF colour = picture.pixel(x, y);
        if (colour == RGB(255, 255, 255)) return '.';
        return colour == RGB(0, 0, 0) ? '#' : '?';
    });
}

Lines GridUse::expectedHighlight() const {
    const GridSelection& block = model.selection;
    return cellMap([&](int column, int row, int x, int y) {
        if (x >= model.clientWidth() || y >= model.clientHeight()) return '?';
        const bool isSelected = column >= block.left && column <= block.right && row >= block.top &&
                                row <= block.bottom;
        return isSelected ? '#' : '.';
    });
}

GuardedGridUse::~GuardedGridUse() {
    if (IsWindow(grid)) DestroyWindow(grid);
}

void GuardedGridUse::TearDown() { EXPECT_EQ(heap.report(), ""); }

std::string BlockName(const GridSelection& block) {
    return CellName(block.left, block.top) + ":" + CellName(block.right, block.bottom);
}

GridSelection Block(int left, int right, int top, int bottom) {
    return {static_cast<WORD>(left), static_cast<WORD>(right), static_cast<WORD>(top),
            static_cast<WORD>(bottom)};
}

GridVisibleRange Range(int firstColumn, int endColumn, int firstRow, int endRow) {
    return {static_cast<WORD>(firstColumn), static_cast<WORD>(endColumn),
            static_cast<WORD>(firstRow), static_cast<WORD>(endRow)};
}

DWORD Select(int left, int right, int top, int bottom) {
    return SetSelectedRanged(KORGRID_PAIR(left, right), KORGRID_PAIR(top, bottom));
}

// Counted up from A, as one would by hand.
std::string ColumnLabel(int column) {
    std::string label = "A";
    while (column-- > 0) {
        size_t place = label.size();
        while (place > 0 && label[place - 1] == 'Z') label[--place] = 'A';
        if (place > 0) {
            ++label[place - 1];
        } else {
            label.insert(0, 1, 'A');
        }
    }
    return label;
}

Lines HeaderItems(HWND header) {
    Lines items;
    for (int item = 0; item < KorHeader_GetItemCount(header); ++item) {
        std::string line;
        for (const wchar_t letter : HeaderLabel(header, item)) line += static_cast<char>(letter);
        items.push_back(line + " " + Number(KorHeader_GetItemSize(header, item)));
    }
    return items;
}

std::vector<DWORD> ArgumentsOf(const ImportCall& call) {
    std::vector<DWORD> values;
    for (const ULONG_PTR argument : call.arguments) values.push_back(static_cast<DWORD>(argument));
    return values;
}

DWORD HandleValue(HWND window) { return static_cast<DWORD>(reinterpret_cast<ULONG_PTR>(window)); }

std::string BarCall(bool isHorizontal, int maximum, int page, int position) {
    return std::string(isHorizontal ? "horizontal" : "vertical") + " mask 7 min 0 " +
           Text(maximum, page, position) + " redraw 1";
}

ScrollInfoLog::ScrollInfoLog(ImportSpy& spy) {
    spy.watch("SetScrollInfo");
    spy.replace("SetScrollInfo", [this, &spy](ULONG_PTR* arguments) {
        const auto& info = *reinterpret_cast<const SCROLLINFO*>(arguments[2]);
        lines_.push_back(
            (static_cast<DWORD>(arguments[1]) == SB_HORZ ? "horizontal mask " : "vertical mask ") +
            Number(static_cast<int>(info.fMask)) + " min " + Number(info.nMin) + " " + Text(info) +
            " redraw " + std::to_string(static_cast<DWORD>(arguments[3])));
        return spy.callReal("SetScrollInfo", arguments);
    });
}

}  // namespace kortest
