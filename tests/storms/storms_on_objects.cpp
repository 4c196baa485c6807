// The storm linked with the library's objects: every record is in sight, and what the grid and its
// strips show can be drawn again from it.
#include "base/module.h"
#include "funkybar/record.h"
#include "grid/expected_grid.h"
#include "grid/expected_picture.h"
#include "grid/state.h"
#include "header/expected_strip.h"
#include "header/record.h"
#include "storms/failure.h"
#include "storms/library.h"
#include "storms/pictures.h"
#include "storms/stage.h"
#include "support/pixels.h"
#include "zoom/zoom.h"

#include <algorithm>

namespace kortest {
namespace {

// ---- Records
// ---------------------------------------------------------------------------------------

void CheckOverrides(const kor::SizeOverride* table, uint32_t count, int limit, int defaultSize,
                    const char* what) {
    if (!table) return;  // none, whatever the count says
    for (uint32_t i = 0; i < count; ++i) {
        if (table[i].index >= limit || (i > 0 && table[i - 1].index >= table[i].index)) {
            FailStorm("grid: %s %u in place %u of %u", what, table[i].index, i, count);
        }
        if (table[i].delta != table[i].size - defaultSize) {
            FailStorm("grid: %s %u of %u units, delta %d", what, table[i].index, table[i].size,
                      table[i].delta);
        }
    }
}

void CheckGridRecord() {
    const kor::GridState& grid = kor::grid;
    CheckOverrides(grid.columnWidths, grid.columnOverrideCount, KORGRID_COLUMNS, 60, "column");
    CheckOverrides(grid.rowHeights, grid.rowOverrideCount, KORGRID_ROWS, 16, "row");
    if (grid.visibleColumnCount > grid.maxVisibleColumnCount ||
        grid.visibleRowCount > grid.maxVisibleRowCount) {
        FailStorm("grid: more visible than ever");
    }
    if (grid.rowHeaderWidth != 30 && grid.rowHeaderWidth != 35 && grid.rowHeaderWidth != 40) {
        FailStorm("grid: row header of %d pixels", grid.rowHeaderWidth);
    }
    if ((grid.memoryBitmap && !grid.memoryDC) ||
        (grid.memoryBitmap && GetCurrentObject(grid.memoryDC, OBJ_BITMAP) != grid.memoryBitmap)) {
        FailStorm("grid: the image is not in its DC");
    }
}

void CheckStripRecord(HWND strip) {
    const kor::HeaderRecord* record = kor::FindHeaderRecord(strip);
    if (!record) return;
    if (record->count > record->capacity) {
        FailStorm("strip: %u items in %u places", record->count, record->capacity);
    }
    if (!record->texts || !record->sizes || !record->states || record->window != strip) {
        FailStorm("strip: an unfinished record");
    }
    for (uint32_t i = 0; i <= record->capacity; ++i) {
        if (record->states[i] > (HIS_SELECTED | HIS_FRAMED)) {
            FailStorm("strip: item %u in state %u", i, record->states[i]);
        }
    }
}

void CheckDrag() {
    const kor::HeaderDrag& drag = kor::headerDrag;
    if (drag.maximumColumnSize < kor::kMinimumItemSize ||
        drag.maximumRowSize < kor::kMinimumItemSize) {
        FailStorm("strip: bounds %d and %d", drag.maximumColumnSize, drag.maximumRowSize);
    }
    if (drag.resizeItem < -1 || drag.pressAnchor < -1) {
        FailStorm("strip: a drag of %d, a press on %d", drag.resizeItem, drag.pressAnchor);
    }
}

void CheckBarRecord() {
    const kor::FunkyBarState& bar = kor::funkyBar;
    int32_t count = 0;
    const kor::FunkyBarItem* last = nullptr;
    bool hasCurrent = bar.current == nullptr;
    for (const kor::FunkyBarItem* item = bar.first; item; item = item->next) {
        if (++count > bar.count) FailStorm("bar: more items than %d", bar.count);
        if (!item->text) FailStorm("bar: item %d has no text", count - 1);
        hasCurrent = hasCurrent || item == bar.current;
        last = item;
    }
    if (count != bar.count || last != bar.last) {
        FailStorm("bar: %d items in the list, %d counted", count, bar.count);
    }
    if (!hasCurrent) FailStorm("bar: the current item is not in the list");
}

// ---- Pictures
// --------------------------------------------------------------------------------------

constexpr int kLargestSide = 500;
constexpr uint32_t kLargestZoom = 16;

int gridsCompared = 0;
int stripsCompared = 0;

ExpectedGrid DescribeGrid(const RECT& client) {
    const kor::GridState& grid = kor::grid;
    ExpectedGrid expected;
    expected.clientWidth = client.right;
    expected.clientHeight = client.bottom;
    expected.equationBarHeight = grid.equationBarHeight;
    expected.zoom = kor::zoomLevel;
    for (uint32_t i = 0; grid.columnWidths && i < grid.columnOverrideCount; ++i) {
        expected.columns[grid.columnWidths[i].index] = grid.columnWidths[i].size;
    }
    for (uint32_t i = 0; grid.rowHeights && i < grid.rowOverrideCount; ++i) {
        expected.rows[grid.rowHeights[i].index] = grid.rowHeights[i].size;
    }
    expected.firstColumn = grid.firstVisibleColumn;
    expected.firstRow = grid.firstVisibleRow;
    expected.columnCount = grid.visibleColumnCount;
    expected.rowCount = grid.visibleRowCount;
    expected.rowHeaderWidth = grid.rowHeaderWidth;
    expected.headersHidden = grid.headersHidden;
    expected.linesHidden = grid.gridLinesHidden;
    const kor::CellBlock& block = grid.selection;
    expected.selection = {block.left, block.right, block.top, block.bottom};
    return expected;
}

bool IsPlainGrid(const Stage& stage, const RECT& client) {
    const kor::GridState& grid = kor::grid;
    return grid.memoryBitmap && client.right >= 1 && client.bottom >= 1 &&
           client.right <= kLargestSide && client.bottom <= kLargestSide &&
           kor::zoomLevel <= kLargestZoom && grid.firstVisibleColumn >= 0 &&
           grid.firstVisibleColumn < KORGRID_COLUMNS && grid.firstVisibleRow < KORGRID_ROWS &&
           stage.stripsInStep && !stage.hasMixedGrids;
}

// A new size makes a new image, and so takes everything away that came before.
void CompareGrid(Stage& stage) {
    HWND window = stage.currentGrid();
    if (!window || !stage.isLive(window)) return;
    RECT client = {};
    GetClientRect(window, &client);
    if (!IsPlainGrid(stage, client)) return;
    const int manner = stage.paintingManner;
    stage.paintingManner = 0;
    stage.runAlone([&] { SendMessageW(window, WM_SIZE, SIZE_MAXSHOW, 0); });
    stage.paintingManner = manner;
    const ExpectedGrid expected = DescribeGrid(client);
    const Canvas canvas(client.right, client.bottom, RGB(255, 255, 255));
    DrawExpectedRedraw(canvas.dc(), expected, client);
    const Picture image = ReadDC(kor::grid.memoryDC, client);
    const std::string difference = FirstDifference(canvas.picture(), image);
    if (!difference.empty()) {
        FailStorm("grid: the picture is not that of plain calls: %s", difference.c_str());
    }
    ++gridsCompared;
}

// Nothing of it is hidden, or outside of its parent.
bool IsWholeVisible(HWND window, const RECT& client) {
    HDC dc = GetDC(window);
    RECT shown = {};
    const bool isWhole = GetClipBox(dc, &shown) == SIMPLEREGION && EqualRect(&shown, &client);
    ReleaseDC(window, dc);
    return isWhole && IsWindowVisible(window);
}

void CompareStrip(Stage& stage, HWND window) {
    const kor::HeaderRecord* record = kor::FindHeaderRecord(window);
    RECT client = {};
    GetClientRect(window, &client);
    stage.runAlone(
        [&] { SetWindowPos(window, HWND_TOP, 0, 0, 0, 0, SWP_NOSIZE | SWP_NOACTIVATE); });
    if (!record || !IsWholeVisible(window, client) || client.right < 1 || client.bottom < 1 ||
        client.right > kLargestSide || client.bottom > kLargestSide ||
        kor::zoomLevel > kLargestZoom) {
        return;
    }
    Strip strip = {client.right, client.bottom, kor::IsVertical(*record), kor::zoomLevel, {}};
    uint32_t first = 0;  // items without a size at the very start are left out
    while (first < record->count && record->sizes[first] == 0) ++first;
    for (uint32_t i = first; i < record->count; ++i) {
        const wchar_t* text = record->texts[i];
        strip.items.push_back({text ? text : L"", record->sizes[i], record->states[i]});
    }
    stage.runAlone([&] {
        // Children and frame are none of the strip's.
        InvalidateRect(window, nullptr, TRUE);
        UpdateWindow(window);
    });
    const std::string difference = FirstDifference(ExpectedStrip(strip), ReadWindow(window));
    if (!difference.empty()) {
        FailStorm("strip: the picture is not that of plain calls: %s", difference.c_str());
    }
    ++stripsCompared;
}

void ForEachStrip(Stage& stage, void (*visit)(Stage& stage, HWND window)) {
    for (int place = 0; place < kPlaces; ++place) {
        HWND window = stage.window(kStrip, place);
        if (window && stage.isLive(window) && !stage.isWithoutRecord(window)) visit(stage, window);
    }
}

// Nothing attaches the objects to a process, as a DLL's loading would.
struct Attached {
    Attached() {
        kor::InitialiseGridState();
        kor::moduleInstance = GetModuleHandleW(nullptr);
    }
};
const Attached attached;

}  // namespace

HMODULE StormModule() { return GetModuleHandleW(nullptr); }

bool HasOwnImports() { return false; }

void CheckRecords(Stage& stage) {
    CheckGridRecord();
    ForEachStrip(stage, [](Stage&, HWND window) { CheckStripRecord(window); });
    CheckDrag();
    CheckBarRecord();
}

void ComparePictures(Stage& stage) {
    CompareCharts(stage);
    CompareGrid(stage);
    ForEachStrip(stage, CompareStrip);
}

int OtherPicturesCompared() { return gridsCompared + stripsCompared; }

}  // namespace kortest
