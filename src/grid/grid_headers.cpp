#include "grid/grid_headers.h"

#include <korcontrols/header.h>

#include <algorithm>

#include "grid/grid_sizes.h"
#include "platform/runtime.h"
#include "platform/windows_helpers.h"
#include "zoom/zoom.h"

namespace kor {

namespace {

// A strip gets so many items: new ones are appended empty, surplus ones taken away at the front.
// All are labelled afterwards, so it does not matter which go.
void SetItemCount(HWND header, int wanted, int defaultSize) {
    const int count = KorHeader_GetItemCount(header);
    wchar_t empty[] = L"";
    const HeaderItemDesc item = {empty, static_cast<WORD>(defaultSize)};
    for (int i = count; i < wanted; ++i) KorHeader_InsertItem(header, -1, &item);
    for (int i = wanted; i < count; ++i) KorHeader_DeleteItem(header, 0);
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

// Each message to a strip may change the grid: what an item says is looked up when it is its turn.
LRESULT UpdateColumnHeader(int width) {
    const int count =
        CountVisible(ColumnAxis(), grid.firstVisibleColumn, kColumnLimit, width, zoomLevel);
    SetItemCount(grid.hwndColumnHeader, count, PixelsFromUnits(kDefaultColumnWidth, zoomLevel));
    grid.visibleColumnCount = static_cast<uint8_t>(count);
    grid.maxVisibleColumnCount = std::max(grid.maxVisibleColumnCount, grid.visibleColumnCount);
    FillColumnHeader();
    return 1;
}

LRESULT UpdateRowHeader(int height) {
    const int count = CountVisible(RowAxis(), grid.firstVisibleRow, kRowLimit, height, zoomLevel);
    SetItemCount(grid.hwndRowHeader, count, PixelsFromUnits(kDefaultRowHeight, zoomLevel));
    grid.visibleRowCount = static_cast<uint8_t>(count);
    grid.maxVisibleRowCount = std::max(grid.maxVisibleRowCount, grid.visibleRowCount);
    FillRowHeader();
    return 1;
}

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
