#include "storms/checks.h"

#include "graph/data/record.h"
#include "storms/failure.h"
#include "storms/library.h"

#include <algorithm>
#include <cmath>

namespace kortest {
namespace {

constexpr int kCheckedItems = 6;

// ---- Strips
// ----------------------------------------------------------------------------------------

LRESULT ItemSize(HWND strip, int index) {
    return SendMessageW(strip, HCM_GETITEMSIZE, static_cast<WPARAM>(index), 0);
}

void CheckStrip(HWND strip) {
    const int count = KorHeader_GetItemCount(strip);
    if (count < 0) FailStorm("strip: count %d", count);
    for (int i = 0; i < std::min(count, kCheckedItems); ++i) {
        const LRESULT size = ItemSize(strip, i);
        if (size < 0 || size > 65535)
            FailStorm("strip: item %d of %d, size %ld", i, count, static_cast<long>(size));
    }
    if (ItemSize(strip, count) < 0) FailStorm("strip: no spare place behind %d items", count);
    if (ItemSize(strip, count + 1) != -1) FailStorm("strip: an item behind the spare place");
    if (ItemSize(strip, -1) != -1) FailStorm("strip: an item before the first");
}

// ---- The grid
// --------------------------------------------------------------------------------------

constexpr bool IsOrdered(const GridSelection& block) {
    return block.left <= block.right && block.top <= block.bottom;
}

void CheckVisibleRange(const GridVisibleRange& range) {
    const DWORD columns = GetNumberOfVisibleColumns();
    const DWORD rows = GetNumberOfVisibleRows();
    if (columns > 255 || rows > 255) FailStorm("grid: %lu columns, %lu rows", columns, rows);
    if (static_cast<WORD>(range.endColumn - range.firstColumn) != columns ||
        static_cast<WORD>(range.endRow - range.firstRow) != rows) {
        FailStorm("grid: range %u-%u, %u-%u of %lu columns and %lu rows", range.firstColumn,
                  range.endColumn, range.firstRow, range.endRow, columns, rows);
    }
    const bool isShown =
        columns && rows && range.firstColumn < KORGRID_COLUMNS && range.firstRow < KORGRID_ROWS;
    if (isShown && !IsIndexVisible(KORGRID_CELL(range.firstColumn, range.firstRow))) {
        FailStorm("grid: the first visible cell is not visible");
    }
    if (isShown && IsIndexVisible(KORGRID_CELL(range.endColumn, range.firstRow))) {
        FailStorm("grid: the column behind the last visible one is visible");
    }
}

// A press can reach one column or row behind the sheet; other ways out are known to the stage.
void CheckSelection(Stage& stage) {
    GridSelection selection = {1, 0, 1, 0};
    GetSelectedRanged(&selection);
    const bool isInSheet = IsOrdered(selection) && selection.right < KORGRID_COLUMNS &&
                           selection.bottom < KORGRID_ROWS;
    if (isInSheet) stage.selectionIsAnything = false;
    const bool isNearSheet = IsOrdered(selection) && selection.right <= KORGRID_COLUMNS &&
                             selection.bottom <= KORGRID_ROWS;
    if (!isNearSheet && !stage.selectionIsAnything) {
        FailStorm("grid: selection %u-%u, %u-%u", selection.left, selection.right, selection.top,
                  selection.bottom);
    }
    GridCellPair current = {0xFFFF, 0xFFFF};
    if (GetCurrentSelectedCell(&current) &&
        (current.column != selection.left || current.row != selection.top)) {
        FailStorm("grid: current cell %u, %u", current.column, current.row);
    }
}

// -1 for a strip that is gone.
int CountInStrip(HWND grid, int id) {
    HWND strip = GetDlgItem(grid, id);
    const int count = strip ? KorHeader_GetItemCount(strip) : -1;
    if (count >= 0) CheckStrip(strip);
    return count;
}

// A new grid tells what the one before showed, until it has been laid out.
void CheckGridStrips(Stage& stage, HWND grid) {
    const int columns = CountInStrip(grid, 2);
    const int rows = CountInStrip(grid, 3);
    const DWORD visibleColumns = GetNumberOfVisibleColumns();
    const DWORD visibleRows = GetNumberOfVisibleRows();
    const bool areInStep = (columns < 0 || static_cast<DWORD>(columns) == visibleColumns) &&
                           (rows < 0 || static_cast<DWORD>(rows) == visibleRows);
    if (stage.stripsInStep && !areInStep) {
        FailStorm("grid: %d columns and %d rows in the strips, %lu and %lu visible", columns, rows,
                  visibleColumns, visibleRows);
    }
    stage.stripsInStep = areInStep;
}

void CheckGrid(Stage& stage) {
    GridVisibleRange range = {};
    GetVisibleRange(&range);
    CheckVisibleRange(range);
    CheckSelection(stage);
    HWND grid = stage.currentGrid();
    if (grid && stage.isLive(grid) && !stage.hasMixedGrids) CheckGridStrips(stage, grid);
}

// ---- Charts
// ----------------------------------------------------------------------------------------

constexpr bool IsPartOf(int index, int count) { return index >= 0 && index < count; }

// Neither is a number, or they are in order.
bool IsRange(double low, double high) { return !(low > high); }

void CheckSeries(const kor::GraphSeries* series, int place) {
    if (!series) FailStorm("chart: no series at %d", place);
    if (series->pointCount < 1 || !series->values) {
        FailStorm("chart: series %d of %d points", place, series->pointCount);
    }
    if (!IsPartOf(series->minIndex, series->pointCount) ||
        !IsPartOf(series->maxIndex, series->pointCount)) {
        FailStorm("chart: series %d of %d points, extremes at %d and %d", place, series->pointCount,
                  series->minIndex, series->maxIndex);
    }
    // A single value that becomes none leaves the other extreme as it was, even as the last number.
    const bool hasNumbers = std::any_of(series->values, series->values + series->pointCount,
                                        [](double value) { return std::isfinite(value); });
    if (hasNumbers && !IsRange(series->minValue, series->maxValue)) {
        FailStorm("chart: series %d from %g to %g", place, series->minValue, series->maxValue);
    }
    if (series->livePointCount < 0 || series->livePointCount > std::max(series->pointCount, 3)) {
        FailStorm("chart: series %d of %d points, %d of them live", place, series->pointCount,
                  series->livePointCount);
    }
}

void CheckChart(HWND window) {
    const auto* graph =
        reinterpret_cast<const kor::GraphRecord*>(GetWindowLongPtrW(window, GWLP_USERDATA));
    if (!graph) return;
    if (graph->hwnd != window) FailStorm("chart: the record of another window");
    if (graph->seriesCount < 0 || (graph->seriesCount > 0 && !graph->series)) {
        FailStorm("chart: %d series", graph->seriesCount);
    }
    for (int i = 0; i < graph->seriesCount; ++i) CheckSeries(graph->series[i], i);
    if (graph->zoom != 0.25 && graph->zoom != 0.5 && graph->zoom != 1 && graph->zoom != 2) {
        FailStorm("chart: zoom %g", graph->zoom);
    }
    if (!IsRange(graph->xDataMin, graph->xDataMax) || !IsRange(graph->yDataMin, graph->yDataMax)) {
        FailStorm("chart: data from %g to %g, %g to %g", graph->xDataMin, graph->xDataMax,
                  graph->yDataMin, graph->yDataMax);
    }
    if (graph->panArrows > 15) FailStorm("chart: pan arrows %u", graph->panArrows);
    if (graph->xAutoRange > 1 || graph->yAutoRange > 1) FailStorm("chart: automatic by 2");
    if (graph->liveIndex < 0) FailStorm("chart: live index %d", graph->liveIndex);
    if (graph->xTickStep == 0 || graph->yTickStep == 0) FailStorm("chart: ticks without a step");
    if (graph->rcPlot.right < 0 || graph->rcPlot.bottom < 0) FailStorm("chart: an image below 0");
    if (graph->hbmMem && GetCurrentObject(graph->hdcMem, OBJ_BITMAP) != graph->hbmMem) {
        FailStorm("chart: the image is not in its DC");
    }
    HWND legend = GetDlgItem(window, KORLEGEND_ID);
    if (legend && graph->hwndLegend != legend) FailStorm("chart: another legend");
}

// ---- The function bar
// ------------------------------------------------------------------------------

void CheckBar(HWND bar) {
    const LONG count = KorFunkyBar_GetCount(bar);
    const LONG current = KorFunkyBar_GetCurrent(bar);
    if (count < 0 || current < -1 || current >= count) {
        FailStorm("bar: item %ld of %ld", current, count);
    }
    FunkyBarItemDesc item = {};
    for (LONG i = 0; i <= count; ++i) {
        item.index = i;
        if (KorFunkyBar_GetItem(bar, &item) != (i < count)) {
            FailStorm("bar: item %ld of %ld", i, count);
        }
    }
}

void CheckWindows(Stage& stage, Kind kind, void (*check)(HWND window)) {
    for (int place = 0; place < kPlaces; ++place) {
        HWND window = stage.window(kind, place);
        if (!stage.isTouched(kind, place) || !window || !stage.isLive(window)) continue;
        if (!stage.isWithoutRecord(window)) check(window);
    }
}

}  // namespace

void CheckStage(Stage& stage) {
    CheckWindows(stage, kStrip, CheckStrip);
    CheckGrid(stage);
    CheckWindows(stage, kChart, CheckChart);
    CheckWindows(stage, kBar, CheckBar);
}

// ---- Notifications
// ---------------------------------------------------------------------------------

namespace {

void PaintSome(const Stage& stage, const GridVisibleRange& range) {
    const int manner = stage.paintingManner & 3;
    if (manner == 0) return;
    const int endColumn = std::min<int>(range.endColumn, range.firstColumn + 4);
    const int endRow = std::min<int>(range.endRow, range.firstRow + 4);
    for (int row = range.firstRow; row < endRow; ++row) {
        for (int column = range.firstColumn; column < endColumn; ++column) {
            const CellIndex cell = KORGRID_CELL(column, row);
            if (manner > 1) {
                SetCellBackGroundColor(cell, static_cast<HBRUSH>(GetStockObject(LTGRAY_BRUSH)));
                SetCellBorder(cell, static_cast<HPEN>(GetStockObject(BLACK_PEN)), 1, 1, 0, 1);
            }
            SetCellValue(cell, TextOf(column + row), nullptr, RGB(0, 0, 0), RGB(255, 255, 255), 0,
                         manner > 2 ? column % 3 : 0, manner > 2 ? row % 4 - 1 : 0, manner > 2, 0);
        }
    }
}

void CheckPainting(const Stage& stage, const GridVisibleRange& told) {
    GridVisibleRange range = {};
    GetVisibleRange(&range);
    if (told.firstColumn != range.firstColumn || told.endColumn != range.endColumn ||
        told.firstRow != range.firstRow || told.endRow != range.endRow) {
        FailStorm("grid: asks for other cells than it says are visible");
    }
    PaintSome(stage, range);
}

void CheckToldSelection(const GridSelection& told) {
    GridSelection selection = {};
    GetSelectedRanged(&selection);
    if (told.left != selection.left || told.right != selection.right || told.top != selection.top ||
        told.bottom != selection.bottom) {
        FailStorm("grid: tells another selection than it has");
    }
}

}  // namespace

void CheckNotification(Stage& stage, UINT message, WPARAM wParam, LPARAM lParam) {
    if (message == GRIDN_EQUATIONENTERED) {
        const auto* text = reinterpret_cast<const wchar_t*>(wParam);
        if (!text || wcslen(text) > 255) FailStorm("grid: a committed text of more than 255");
        return;
    }
    if (message != WM_NOTIFY) return;
    switch (wParam) {
    case GRIDN_PAINTCELLS:
        CheckPainting(stage, *reinterpret_cast<const GridVisibleRange*>(lParam));
        break;
    case GRIDN_SELECTING:
    case GRIDN_SELECTIONDONE:
        CheckToldSelection(*reinterpret_cast<const GridSelection*>(lParam));
        break;
    case GRIDN_EDITKILLFOCUS:
        if (lParam != 0 && lParam != 1)
            FailStorm("grid: the focus goes in manner %ld", static_cast<long>(lParam));
        break;
    default: break;
    }
}

}  // namespace kortest
