#include "grid/sizes.h"

#include <algorithm>

#include "base/assert.h"
#include "base/local_heap.h"
#include "base/runtime.h"
#include "base/windows_helpers.h"
#include "grid/state.h"
#include "zoom/zoom.h"

namespace kor {

namespace {

constexpr uint32_t kTableStep = 16;  // entries by which a table grows

// Makes sure the table can take one entry more. A table is grown by a step when it
// is full, the first time one entry before that; when that fails its block is lost to the grid, and
// so are its entries.
bool MakeRoom(SizeOverride*& table, uint32_t& count) {
    if (!table) {
        table = AllocateLocal<SizeOverride>(kTableStep);
    } else if ((count + 1) % kTableStep == 0) {
        table = ReallocateLocal(table, count + kTableStep);
    }
    if (!table) count = 0;
    return table != nullptr;
}

bool StoreSize(SizeOverride*& table, uint32_t& count, int defaultSize, int index, uint16_t units) {
    const SizeOverride entry = {static_cast<uint16_t>(index), units, units - defaultSize};
    if (!table) count = 0;
    uint32_t place = 0;
    while (place < count && table[place].index < entry.index) ++place;
    if (place < count && table[place].index == entry.index) {
        table[place] = entry;
        return true;
    }
    if (!MakeRoom(table, count)) return false;
    KOR_ASSERT(place == count || table[place].index > entry.index);  // sorted, without duplicates
    memmove(table + place + 1, table + place, (count - place) * sizeof(SizeOverride));
    table[place] = entry;
    ++count;
    return true;
}

// Units of a size that the host gives in pixels, of which the low 16 bits count; clamped to the
// cell area unless the client area is empty.
uint16_t UnitsFor(LONG pixels, int clientExtent, int cellsStart) {
    const auto wanted = static_cast<uint16_t>(pixels);
    return clientExtent > 0 ? UnitsWithinArea(wanted, zoomLevel, clientExtent - cellsStart)
                            : UnitsFromPixels(wanted, zoomLevel);
}

// Adds with wrap-round: a host may pass any number.
int IndexFrom(int first, LONG relative) {
    return static_cast<int>(static_cast<uint32_t>(first) + static_cast<uint32_t>(relative));
}

}  // namespace

GridAxis ColumnAxis() { return {grid.columnWidths, grid.columnOverrideCount, kDefaultColumnWidth}; }

GridAxis RowAxis() { return {grid.rowHeights, grid.rowOverrideCount, kDefaultRowHeight}; }

int ColumnWidth(int column) { return SizeOf(ColumnAxis(), column, zoomLevel); }

int RowHeight(int row) { return SizeOf(RowAxis(), row, zoomLevel); }

int ColumnsWidth(int first, int end) { return SizeOfRange(ColumnAxis(), first, end, zoomLevel); }

int RowsHeight(int first, int end) { return SizeOfRange(RowAxis(), first, end, zoomLevel); }

bool StoreColumnWidth(int column, uint16_t units) {
    if (column < 0 || column >= kColumnLimit) return false;
    return StoreSize(grid.columnWidths, grid.columnOverrideCount, kDefaultColumnWidth, column,
                     units);
}

bool StoreRowHeight(int row, uint16_t units) {
    if (row < 0 || row >= kRowLimit) return false;
    return StoreSize(grid.rowHeights, grid.rowOverrideCount, kDefaultRowHeight, row, units);
}

void ForgetSizes() {
    if (grid.columnWidths) LocalFree(grid.columnWidths);
    if (grid.rowHeights) LocalFree(grid.rowHeights);
    grid.columnWidths = nullptr;
    grid.rowHeights = nullptr;
    grid.columnOverrideCount = 0;
    grid.rowOverrideCount = 0;
}

}  // namespace kor

extern "C" DWORD KORCONTROLS_API SetColumnWidth(LONG column, LONG width) {
    using namespace kor;
    const RECT client = ClientRectOf(grid.hwndGrid);
    return StoreColumnWidth(IndexFrom(grid.firstVisibleColumn, column),
                            UnitsFor(width, client.right, grid.cellsLeft));
}

extern "C" DWORD KORCONTROLS_API SetRowHeight(LONG row, LONG height) {
    using namespace kor;
    const RECT client = ClientRectOf(grid.hwndGrid);
    return StoreRowHeight(IndexFrom(grid.firstVisibleRow, row),
                          UnitsFor(height, client.bottom, grid.cellsTop));
}
