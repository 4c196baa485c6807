#include "grid/scrolling.h"

#include <algorithm>
#include <optional>

#include "base/windows_helpers.h"
#include "grid/drawing.h"
#include "grid/headers.h"
#include "grid/layout.h"
#include "grid/scroll_bars.h"
#include "grid/state.h"

namespace kor {

namespace {

// The new first column after a scroll code, or none when the step is refused.
// Compatibility: while nothing is visible a page forward moves one column back, from the first one
// to -1; there is no current cell then, until the view scrolls into the sheet again; pinned by
// RowScrollingElsewhere.PageDownOfNothingMakesTheOriginNegative.
std::optional<int> ColumnAfterScroll(int code, int thumbPosition) {
    const int first = grid.firstVisibleColumn;
    const bool atStart = first < 1;
    const bool atEnd = grid.maxVisibleColumnCount + first >= kColumnLimit + 1;
    const int page = grid.visibleColumnCount - 1;
    switch (code) {
    case SB_LINEUP:
    case SB_PAGEUP:
        if (atStart) return std::nullopt;
        return std::max(first - (code == SB_LINEUP ? 1 : page), 0);
    case SB_LINEDOWN:
    case SB_PAGEDOWN:
        if (atEnd) return std::nullopt;
        return std::min(first + (code == SB_LINEDOWN ? 1 : page), kColumnLimit - 1);
    default: return thumbPosition;
    }
}

// Compatibility: unlike columns, rows at the top are not refused upward steps, and the view is
// redrawn where it is; pinned by RowScrolling.LineUpGoesOneBackAndRedrawsAtTheFirstRow.
std::optional<int> RowAfterScroll(int code, int thumbPosition) {
    const int first = grid.firstVisibleRow;
    const bool atEnd = grid.maxVisibleRowCount + first >= kRowLimit + 1;
    switch (code) {
    case SB_LINEUP: return std::max(first - 1, 0);
    case SB_LINEDOWN:
        if (atEnd) return std::nullopt;
        return std::min(first + 1, kRowLimit - 1);
    case SB_PAGEUP: return std::max(first - grid.visibleRowCount, 0);
    case SB_PAGEDOWN: return std::min(first + grid.visibleRowCount - 1, kRowLimit - 1);
    default: return thumbPosition;
    }
}

// The view moves when the thumb is released, not while it is dragged.
bool IsHandled(int code) { return code >= SB_LINEUP && code <= SB_THUMBPOSITION; }

}  // namespace

LRESULT OnHorizontalScroll(int code, int thumbPosition) {
    if (!IsHandled(code)) return 1;
    const std::optional<int> first = ColumnAfterScroll(code, thumbPosition);
    if (!first) return 0;
    InvertSelection(Invalidate::no);
    grid.firstVisibleColumn = *first;
    SetColumnBarAfterScroll();
    // Compatibility: columns are counted over the full client width, row header or not; pinned by
    // ColumnScrollingElsewhere.CountsColumnsOverTheFullClientWidth.
    UpdateColumnHeader(ClientRectOf(grid.hwndGrid).right);
    RedrawClient();
    return 0;
}

LRESULT OnVerticalScroll(int code, int thumbPosition) {
    if (!IsHandled(code)) return 1;
    const std::optional<int> first = RowAfterScroll(code, thumbPosition);
    if (!first) return 0;
    InvertSelection(Invalidate::no);
    FitRowHeaderTo(*first);
    grid.firstVisibleRow = *first;
    SetRowBarAfterScroll();
    UpdateRowHeaderOverCells();
    RedrawClient();
    return 0;
}

void ScrollHorizontally(int code) {
    SendMessageW(grid.hwndGrid, WM_HSCROLL, static_cast<WPARAM>(code), 0);
}

void ScrollVertically(int code) {
    SendMessageW(grid.hwndGrid, WM_VSCROLL, static_cast<WPARAM>(code), 0);
}

}  // namespace kor

extern "C" DWORD KORCONTROLS_API SetFirstVisibleCell(CellIndex cell) {
    using namespace kor;
    InvertSelection(Invalidate::no);
    grid.firstVisibleColumn = KORGRID_CELLCOLUMN(cell);
    grid.firstVisibleRow = KORGRID_CELLROW(cell);
    FitRowHeaderTo(grid.firstVisibleRow);
    SetBarPositions();
    UpdateColumnHeader(ClientRectOf(grid.hwndGrid).right);
    UpdateRowHeaderOverCells();
    RedrawClient();
    return 1;
}
