#include "grid/scroll_bars.h"

#include <algorithm>

#include "base/windows_helpers.h"
#include "grid/headers.h"
#include "grid/state.h"

namespace kor {

namespace {

// The view's position along one bar.
struct BarView {
    int bar;  // SB_HORZ or SB_VERT
    int first;
    int visibleCount;
    int dataRange;
};

BarView ColumnView() {
    return {SB_HORZ, grid.firstVisibleColumn, grid.visibleColumnCount, grid.horizontalDataRange};
}

BarView RowView() {
    return {SB_VERT, grid.firstVisibleRow, grid.visibleRowCount, grid.verticalDataRange};
}

// The first visible index while the visible ones lie within the data.
// Compatibility: otherwise the end of the visible ones; pinned by
// ScrollBars.VerticalDataRangePutsAViewPastTheDataBehindIt.
int ThumbWithinData(const BarView& view) {
    const int end = view.visibleCount + view.first;
    return end <= view.dataRange ? view.first : end;
}

int ThumbAfterScroll(const BarView& view) { return view.first == 0 ? 0 : ThumbWithinData(view); }

LONG SetBar(const BarView& view, int thumb) {
    SCROLLINFO info = {};
    info.cbSize = sizeof info;
    info.fMask = SIF_RANGE | SIF_PAGE | SIF_POS;
    info.nMax = std::max(view.visibleCount + view.first, view.dataRange);
    info.nPage = static_cast<UINT>(view.visibleCount);
    info.nPos = thumb;
    return SetScrollInfo(grid.hwndGrid, view.bar, &info, TRUE);
}

// Compatibility: the grid's window handle is the result when the bar was not set; pinned by
// ScrollBars.HiddenBarsTakeDataRangesWithoutBeingSet.
LONG GridHandleAsResult() { return static_cast<LONG>(reinterpret_cast<LONG_PTR>(grid.hwndGrid)); }

void ToggleBar(bool& hidden, const BarView& view) {
    hidden = !hidden;
    if (hidden) {
        SetScrollRange(grid.hwndGrid, view.bar, 0, 0, TRUE);
    } else {
        SetBar(view, ThumbWithinData(view));
    }
}

}  // namespace

void SetColumnBarAfterScroll() {
    if (!grid.horizontalScrollBarHidden) SetBar(ColumnView(), ThumbAfterScroll(ColumnView()));
}

void SetRowBarAfterScroll() {
    if (!grid.verticalScrollBarHidden) SetBar(RowView(), ThumbAfterScroll(RowView()));
}

void SetBarPositions() {
    SetScrollPos(grid.hwndGrid, SB_HORZ, grid.firstVisibleColumn, TRUE);
    SetScrollPos(grid.hwndGrid, SB_VERT, grid.firstVisibleRow, TRUE);
}

}  // namespace kor

using namespace kor;

extern "C" LONG KORCONTROLS_API SetHorizontalDataRange(LONG columns) {
    grid.horizontalDataRange = std::max<LONG>(columns, grid.visibleColumnCount);
    if (!grid.hwndGrid || grid.horizontalScrollBarHidden) return GridHandleAsResult();
    // Compatibility: the first column in any case, unlike rows; pinned by
    // ScrollBars.HorizontalDataRangeKeepsTheFirstColumnAsPosition.
    return SetBar(ColumnView(), grid.firstVisibleColumn);
}

extern "C" LONG KORCONTROLS_API SetVerticalDataRange(LONG rows) {
    grid.verticalDataRange = std::max<LONG>(rows, grid.visibleRowCount);
    if (!grid.hwndGrid || grid.verticalScrollBarHidden) return GridHandleAsResult();
    return SetBar(RowView(), ThumbWithinData(RowView()));
}

// A bar takes room from the other axis while it is shown.
extern "C" DWORD KORCONTROLS_API ToggleHorizontalScrollBar(void) {
    ToggleBar(grid.horizontalScrollBarHidden, ColumnView());
    return static_cast<DWORD>(UpdateRowHeaderOverCells());
}

extern "C" DWORD KORCONTROLS_API ToggleVerticalScrollBar(void) {
    ToggleBar(grid.verticalScrollBarHidden, RowView());
    return static_cast<DWORD>(UpdateColumnHeaderOverCells());
}
