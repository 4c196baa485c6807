#include "grid/use_model.h"

#include <algorithm>

namespace kortest {

namespace {

WORD Word(int value) { return static_cast<WORD>(value); }

std::string Number(int value) { return std::to_string(value); }

}  // namespace

// ---- Scroll bars
// ---------------------------------------------------------------------------------

void BarModel::set(int newMaximum, int newPage, int newPosition) {
    known = true;
    maximum = newMaximum;
    page = std::clamp(newPage, 0, newMaximum + 1);
    setPosition(newPosition);
}

// The platform keeps the last page whole: no position beyond maximum - page + 1.
void BarModel::setPosition(int newPosition) {
    position = std::max(0, std::min(newPosition, maximum - (page > 1 ? page - 1 : 0)));
}

void BarModel::collapse() {
    if (known) set(0, page, position);
    maximum = 0;
}

void UseModel::applyBar(AxisModel& axis, int position) {
    if (axis.bar.hidden) return;
    axis.bar.set(std::max(axis.end(), axis.dataRange), axis.count, position);
    const bool wasShown = axis.bar.shown;
    axis.bar.shown = axis.bar.isScrollable();
    if (axis.bar.shown != wasShown) layOut();
}

int UseModel::settledPosition(const AxisModel& axis) const {
    return axis.end() <= axis.dataRange ? axis.first : axis.end();
}

void UseModel::toggleBar(AxisModel& axis) {
    if (axis.bar.hidden) {
        axis.bar.hidden = false;
        applyBar(axis, settledPosition(axis));
        return;
    }
    axis.bar.hidden = true;
    axis.bar.collapse();
    if (!axis.bar.shown) return;
    axis.bar.shown = false;
    layOut();
}

void UseModel::toggleHorizontalScrollBar() {
    toggleBar(columns);
    refreshRows();
}

void UseModel::toggleVerticalScrollBar() {
    toggleBar(rows);
    refreshColumns(clientWidth() - cellsLeft);
}

void UseModel::setHorizontalDataRange(int range) {
    columns.dataRange = std::max(range, columns.count);
    applyBar(columns, columns.first);
}

void UseModel::setVerticalDataRange(int range) {
    rows.dataRange = std::max(range, rows.count);
    applyBar(rows, settledPosition(rows));
}

// ---- Layout
// --------------------------------------------------------------------------------------

UseModel::UseModel(int windowWidth, int windowHeight, int barHeight)
    : equationBarHeight(barHeight), windowWidth_(windowWidth), windowHeight_(windowHeight) {}

int UseModel::clientWidth() const {
    return std::max(0, windowWidth_ - (rows.bar.shown ? GetSystemMetrics(SM_CXVSCROLL) : 0));
}

int UseModel::clientHeight() const {
    return std::max(0, windowHeight_ - (columns.bar.shown ? GetSystemMetrics(SM_CYHSCROLL) : 0));
}

int UseModel::sizeOf(const AxisModel& axis, int index) const {
    const auto found = axis.units.find(index);
    const int units = found == axis.units.end() ? axis.defaultSize : found->second;
    return Word(units * zoom / 4);
}

void UseModel::create() { layOut(); }

void UseModel::resize(int windowWidth, int windowHeight) {
    windowWidth_ = windowWidth;
    windowHeight_ = windowHeight;
    layOut();
}

void UseModel::layOut() {
    if (clientWidth() < 1) return;
    cellsTop = columnHeaderHeight_ + equationBarHeight;
    refreshColumns(clientWidth() - cellsLeft);
    refreshRows();
    redraw();
}

void UseModel::refresh(AxisModel& axis, int pixels) {
    int counted = 0;
    for (int sum = 0; sum < pixels && axis.first + counted < axis.limit && counted < 255;
         ++counted) {
        sum += sizeOf(axis, axis.first + counted);
    }
    axis.count = counted;
    axis.highestCount = std::max(axis.highestCount, counted);
}

void UseModel::redraw() {
    transcript.push_back("sent GRIDN_PAINTCELLS columns " + Number(Word(columns.first)) + "-" +
                         Number(Word(columns.end())) + " rows " + Number(Word(rows.first)) + "-" +
                         Number(Word(rows.end())));
}

void UseModel::followRowNumbers(int newFirstRow) {
    const int highest = newFirstRow + rows.count;
    const int width = highest < 1000 ? 30 : highest < 10000 ? 35 : 40;
    if (width == rowHeaderWidth) return;
    rowHeaderWidth = width;
    cellsLeft = headersHidden ? 0 : width;
    layOut();
}

void UseModel::toggleHeaders() {
    headersHidden = !headersHidden;
    cellsLeft = headersHidden ? 0 : rowHeaderWidth;
    columnHeaderHeight_ = headersHidden ? 0 : zoom * 4;
    layOut();
}

void UseModel::setZoom(int level) {
    zoom = level;
    headersHidden = !headersHidden;
    toggleHeaders();
}

void UseModel::toggleGridLines() {
    refreshColumns(clientWidth() - cellsLeft);
    refreshRows();
    redraw();
}

void UseModel::setColumnWidth(int column, int pixels) {
    int units = Word(pixels) * 4 / zoom;
    const int room = clientWidth() - cellsLeft;
    if (units > room) units = std::max(0, room - 10);
    columns.units[columns.first + column] = units;
}

void UseModel::setRowHeight(int row, int pixels) {
    int units = Word(pixels) * 4 / zoom;
    const int room = clientHeight() - cellsTop;
    if (units > room) units = std::max(0, room - 10);
    rows.units[rows.first + row] = units;
}

// ---- Scrolling
// -----------------------------------------------------------------------------------

void UseModel::setFirstVisibleCell(int column, int row) {
    columns.first = Word(column);
    rows.first = Word(row);
    followRowNumbers(rows.first);
    columns.bar.setPosition(columns.first);
    rows.bar.setPosition(rows.first);
    refreshColumns(clientWidth());
    refreshRows();
    redraw();
}

int UseModel::scrollColumns(int code, int thumb) {
    const bool isAtEnd = columns.highestCount + columns.first >= 257;
    int target = columns.first;
    switch (code) {
    case SB_LINEUP:
        if (columns.first < 1) return 0;
        target = std::max(0, columns.first - 1);
        break;
    case SB_LINEDOWN:
        if (isAtEnd) return 0;
        target = std::min(255, columns.first + 1);
        break;
    case SB_PAGEUP:
        if (columns.first < 1) return 0;
        target = std::max(0, columns.first - columns.count + 1);
        break;
    case SB_PAGEDOWN:
        if (isAtEnd) return 0;
        target = std::min(255, columns.first + columns.count - 1);
        break;
    case SB_THUMBPOSITION: target = Word(thumb); break;
    default: return 1;
    }
    columns.first = target;
    applyBar(columns, target == 0 ? 0 : settledPosition(columns));
    refreshColumns(clientWidth());
    redraw();
    return 0;
}

int UseModel::scrollRows(int code, int thumb) {
    int target = rows.first;
    switch (code) {
    case SB_LINEUP: target = std::max(0, rows.first - 1); break;
    case SB_LINEDOWN:
        if (rows.highestCount + rows.first >= 16385) return 0;
        target = std::min(16383, rows.first + 1);
        break;
    case SB_PAGEUP: target = std::max(0, rows.first - rows.count); break;
    case SB_PAGEDOWN: target = std::min(16383, rows.first + rows.count - 1); break;
    case SB_THUMBPOSITION: target = Word(thumb); break;
    default: return 1;
    }
    followRowNumbers(target);  // the view is still at the old row
    rows.first = target;
    applyBar(rows, target == 0 ? 0 : settledPosition(rows));
    refreshRows();
    redraw();
    return 0;
}

// ---- Selection
// -----------------------------------------------------------------------------------

bool UseModel::isValid(const GridSelection& block) {
    return block.left <= block.right && block.right < 256 && block.top <= block.bottom &&
           block.bottom < 16384;
}

bool UseModel::setSelection(GridSelection wanted) {
    if (!isValid(wanted)) return false;
    select(wanted);
    return true;
}

void UseModel::selectAll() { select({0, 255, 0, 16383}); }

void UseModel::clickHeader(bool isColumnHeader, int pressed, int current) {
    const int low = std::min(pressed, current);
    const int high = std::max(pressed, current);
    if (isColumnHeader) {
        select({Word(columns.first + low), Word(columns.first + high), 0, 16383});
    } else {
        select({0, 255, Word(rows.first + low), Word(rows.first + high)});
    }
}

void UseModel::tellCurrentCell() {
    transcript.push_back("sent GRIDN_CURRENTCELL " + CellName(selection.left, selection.top));
}

// ---- Mouse
// ---------------------------------------------------------------------------------------

int UseModel::indexFromPoint(const AxisModel& axis, int start, int position) const {
    int end = start + sizeOf(axis, axis.first);
    if (position <= end) return axis.first;
    for (int past = 1; past <= axis.count; ++past) {
        end += sizeOf(axis, axis.first + past);
        if (position <= end) return axis.first + past;
    }
    return 0;
}

GridCellPair UseModel::cellFromPoint(int x, int y) const {
    if (x < 0 || y < 0) return {0, 0};
    return {Word(indexFromPoint(columns, cellsLeft, std::min(x, clientWidth()))),
            Word(indexFromPoint(rows, cellsTop, std::min(y, clientHeight())))};
}

GridSelection UseModel::spanTo(GridCellPair cell) const {
    return {Word(std::min<int>(anchorColumn, cell.column)),
            Word(std::max<int>(anchorColumn, cell.column)),
            Word(std::min<int>(anchorRow, cell.row)), Word(std::max<int>(anchorRow, cell.row))};
}

void UseModel::press(int x, int y, bool shift) {
    if (x > clientWidth() && y > clientHeight()) return;
    const GridCellPair hit = cellFromPoint(x, y);
    lastX_ = x;
    lastY_ = y;
    if (shift && hasAnchor()) {
        select(spanTo(hit));
    } else {
        select({hit.column, hit.column, hit.row, hit.row});
        anchorColumn = hit.column;
        anchorRow = hit.row;
    }
    transcript.push_back("sent GRIDN_CELLCLICKED " + CellName(hit.column, hit.row));
}

void UseModel::move(int x, int y) {
    lastX_ = x;
    lastY_ = std::max(0, y);
    if (!hasAnchor()) return;
    const GridSelection span = spanTo(cellFromPoint(x, lastY_));
    if (span.left == selection.left && span.right == selection.right && span.top == selection.top &&
        span.bottom == selection.bottom) {
        return;
    }
    select(span);
    transcript.push_back("sent GRIDN_SELECTING " + CellName(span.left, span.top) + ":" +
                         CellName(span.right, span.bottom));
}

void UseModel::release(bool shift) {
    if (!shift) anchorColumn = anchorRow = -1;
    lastX_ = lastY_ = 0;
    transcript.push_back("sent GRIDN_SELECTIONDONE " + CellName(selection.left, selection.top) +
                         ":" + CellName(selection.right, selection.bottom));
}

void UseModel::timer() {
    // The edges are those from before the first scroll.
    const int right = clientWidth();
    const int bottom = clientHeight();
    if (lastX_ < cellsLeft) scrollColumns(SB_LINEUP, 0);
    if (lastX_ > right - 10) scrollColumns(SB_LINEDOWN, 0);
    if (lastY_ < equationBarHeight) scrollRows(SB_LINEUP, 0);
    if (lastY_ > bottom - 10) scrollRows(SB_LINEDOWN, 0);
}

}  // namespace kortest
