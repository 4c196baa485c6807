#include "view_commands.h"

#include <algorithm>
#include <iterator>

#include "equation_bar.h"
#include "sizes.h"
#include "workbook.h"

namespace workbook {

namespace {

constexpr DWORD kZoomSteps[] = {2, 3, 4, 6, 8};  // quarters

// The scroll bars reach this far even in an empty sheet.
constexpr int kFewestColumns = 26;
constexpr int kFewestRows = 100;
constexpr int kSpareColumns = 2;
constexpr int kSpareRows = 10;

void ZoomBy(Workbook& workbook, int steps) {
    const auto current =
        std::find(std::begin(kZoomSteps), std::end(kZoomSteps), workbook.view.zoom);
    const auto position = std::clamp<std::ptrdiff_t>(current - std::begin(kZoomSteps) + steps, 0,
                                                     std::ssize(kZoomSteps) - 1);
    SetZoom(workbook, kZoomSteps[position]);
}

void ScrollBy(const Workbook& workbook, UINT message, int steps) {
    const WPARAM code = steps < 0 ? SB_LINEUP : SB_LINEDOWN;  // the same numbers sideways
    for (int step = 0; step < std::abs(steps); ++step) {
        SendMessageW(workbook.grid, message, code, 0);
    }
}

int StepsPerNotch() {
    UINT steps = 3;
    SystemParametersInfoW(SPI_GETWHEELSCROLLLINES, 0, &steps, 0);
    return static_cast<int>(std::clamp(steps, 1u, 10u));  // "a page at a time" is a huge number
}

}  // namespace

void UpdateScrollRanges(const Workbook& workbook) {
    const SheetExtent extent = workbook.sheet().extent();
    SetHorizontalDataRange(
        std::clamp(extent.columns + kSpareColumns, kFewestColumns, kColumnCount));
    SetVerticalDataRange(std::clamp(extent.rows + kSpareRows, kFewestRows, kRowCount));
}

void SetZoom(Workbook& workbook, DWORD quarters) {
    if (quarters == workbook.view.zoom) return;
    workbook.view.zoom = quarters;
    workbook.shown.statusIsStale = true;
    SetGridZoomLevel(quarters);
    UpdateScrollRanges(workbook);
}

void ToggleHeaders(Workbook& workbook) {
    workbook.view.headers = ToggleViewStateOfHeaders() == 0;
    UpdateScrollRanges(workbook);
}

void ToggleLines(Workbook& workbook) {
    workbook.view.gridLines = !workbook.view.gridLines;  // first: the title row draws its own
    ToggleGridLines();
}

void ToggleHorizontalBar(Workbook& workbook) {
    workbook.view.horizontalScrollBar = !workbook.view.horizontalScrollBar;
    ToggleHorizontalScrollBar();
    UpdateScrollRanges(workbook);
}

void ToggleVerticalBar(Workbook& workbook) {
    workbook.view.verticalScrollBar = !workbook.view.verticalScrollBar;
    ToggleVerticalScrollBar();
    UpdateScrollRanges(workbook);
}

void ToggleTitleRow(Workbook& workbook) {
    workbook.sheetView().titleRow = !workbook.sheetView().titleRow;
    KorGrid_Redraw(workbook.grid);
}

void FitSizesAndRedraw(Workbook& workbook) {
    CommitTyping(workbook);
    FitSizes(workbook);
    KorGrid_Redraw(workbook.grid);
    UpdateScrollRanges(workbook);
}

void OnMouseWheel(Workbook& workbook, WORD keys, int distance) {
    // Smooth wheels report fractions of a notch.
    workbook.wheelDistance += distance;
    const int notches = workbook.wheelDistance / WHEEL_DELTA;
    workbook.wheelDistance -= notches * WHEEL_DELTA;
    if (keys & MK_CONTROL) {
        ZoomBy(workbook, notches);
    } else {
        const UINT message = keys & MK_SHIFT ? WM_HSCROLL : WM_VSCROLL;
        ScrollBy(workbook, message, -notches * StepsPerNotch());
    }
}

}  // namespace workbook
