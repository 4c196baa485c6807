#include "grid/headers.h"

#include <korcontrols/header.h>

#include <algorithm>

#include "base/runtime.h"
#include "base/windows_helpers.h"
#include "grid/sizes.h"
#include "grid/state.h"
#include "zoom/zoom.h"

namespace kor {

namespace {

// Gives a strip as many items as are visible. Missing ones are appended empty, surplus ones deleted
// at the front; all are labelled afterwards, so it does not matter which are deleted. A message to
// the strip may cause another update of it. That one is newer and complete, so this one stops.
void SetItemCount(HWND header, const uint8_t& visibleCount, int defaultSize) {
    const int wanted = visibleCount;
    const int count = KorHeader_GetItemCount(header);
    wchar_t empty[] = L"";
    const HeaderItemDesc item = {empty, static_cast<WORD>(defaultSize)};
    for (int i = count; i < wanted && visibleCount == wanted; ++i) {
        KorHeader_InsertItem(header, -1, &item);
    }
    for (int i = wanted; i < count && visibleCount == wanted; ++i) KorHeader_DeleteItem(header, 0);
}

void Repaint(HWND header) {
    if (header) InvalidateRect(header, nullptr, TRUE);
}

}  // namespace

void FormatColumnName(int column, wchar_t (&name)[kColumnNameCapacity]) {
    constexpr int kLetters = 26;
    wchar_t* letter = name;
    if (column >= kLetters) *letter++ = static_cast<wchar_t>(L'A' - 1 + column / kLetters);
    *letter++ = static_cast<wchar_t>(L'A' + column % kLetters);
    *letter = L'\0';
}

LRESULT UpdateColumnHeader(int width) {
    const int count =
        CountVisible(ColumnAxis(), grid.firstVisibleColumn, kColumnLimit, width, zoomLevel);
    grid.visibleColumnCount = static_cast<uint8_t>(count);
    grid.maxVisibleColumnCount = std::max(grid.maxVisibleColumnCount, grid.visibleColumnCount);
    SetItemCount(grid.hwndColumnHeader, grid.visibleColumnCount,
                 PixelsFromUnits(kDefaultColumnWidth, zoomLevel));
    FillColumnHeader();
    return 1;
}

LRESULT UpdateRowHeader(int height) {
    const int count = CountVisible(RowAxis(), grid.firstVisibleRow, kRowLimit, height, zoomLevel);
    grid.visibleRowCount = static_cast<uint8_t>(count);
    grid.maxVisibleRowCount = std::max(grid.maxVisibleRowCount, grid.visibleRowCount);
    SetItemCount(grid.hwndRowHeader, grid.visibleRowCount,
                 PixelsFromUnits(kDefaultRowHeight, zoomLevel));
    FillRowHeader();
    return 1;
}

// Each message to a strip may change the grid, so an item's label and size are looked up only when
// the item is set.
void FillColumnHeader() {
    for (int i = 0; i < grid.visibleColumnCount; ++i) {
        const int column = grid.firstVisibleColumn + i;
        wchar_t name[kColumnNameCapacity];
        FormatColumnName(column, name);
        const HeaderItemDesc item = {name, static_cast<WORD>(ColumnWidth(column))};
        KorHeader_SetItem(grid.hwndColumnHeader, i, &item);
    }
    Repaint(grid.hwndColumnHeader);
}

void FillRowHeader() {
    for (int i = 0; i < grid.visibleRowCount; ++i) {
        const int row = grid.firstVisibleRow + i;
        wchar_t number[kDecimalCapacity];
        FormatDecimal(row + 1, number);
        const HeaderItemDesc item = {number, static_cast<WORD>(RowHeight(row))};
        KorHeader_SetItem(grid.hwndRowHeader, i, &item);
    }
    Repaint(grid.hwndRowHeader);
}

LRESULT UpdateColumnHeaderOverCells() {
    return UpdateColumnHeader(ClientRectOf(grid.hwndGrid).right - grid.cellsLeft);
}

LRESULT UpdateRowHeaderOverCells() {
    return UpdateRowHeader(ClientRectOf(grid.hwndGrid).bottom - grid.cellsTop);
}

}  // namespace kor
