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

LRESULT UpdateColumnHeader(int width) {
    const GridAxis axis = ColumnAxis();
    const int count = CountVisible(axis, grid.firstVisibleColumn, kColumnLimit, width, zoomLevel);
    SetItemCount(grid.hwndColumnHeader, count, PixelsFromUnits(kDefaultColumnWidth, zoomLevel));
    grid.visibleColumnCount = static_cast<uint8_t>(count);
    grid.maxVisibleColumnCount = std::max(grid.maxVisibleColumnCount, grid.visibleColumnCount);
    for (int i = 0; i < count; ++i) {
        wchar_t name[kColumnNameCapacity];
        FormatColumnName(grid.firstVisibleColumn + i, name);
        const HeaderItemDesc item = {
            name, static_cast<WORD>(SizeOf(axis, grid.firstVisibleColumn + i, zoomLevel))};
        KorHeader_SetItem(grid.hwndColumnHeader, i, &item);
    }
    Repaint(grid.hwndColumnHeader);
    return 1;
}

LRESULT UpdateRowHeader(int height) {
    const GridAxis axis = RowAxis();
    const int count = CountVisible(axis, grid.firstVisibleRow, kRowLimit, height, zoomLevel);
    SetItemCount(grid.hwndRowHeader, count, PixelsFromUnits(kDefaultRowHeight, zoomLevel));
    grid.visibleRowCount = static_cast<uint8_t>(count);
    grid.maxVisibleRowCount = std::max(grid.maxVisibleRowCount, grid.visibleRowCount);
    for (int i = 0; i < count; ++i) {
        wchar_t number[kDecimalCapacity];
        FormatDecimal(grid.firstVisibleRow + i + 1, number);
        const HeaderItemDesc item = {
            number, static_cast<WORD>(SizeOf(axis, grid.firstVisibleRow + i, zoomLevel))};
        KorHeader_SetItem(grid.hwndRowHeader, i, &item);
    }
    Repaint(grid.hwndRowHeader);
    return 1;
}

LRESULT UpdateColumnHeaderOverCells() {
    return UpdateColumnHeader(ClientRectOf(grid.hwndGrid).right - grid.cellsLeft);
}

LRESULT UpdateRowHeaderOverCells() {
    return UpdateRowHeader(ClientRectOf(grid.hwndGrid).bottom - grid.cellsTop);
}

}  // namespace kor
