#include "grid/grid_scrolling.h"

#include <algorithm>

#include "grid/grid_drawing.h"
#include "grid/grid_headers.h"
#include "grid/grid_layout.h"
#include "grid/grid_scroll_bars.h"
#include "platform/windows_helpers.h"

namespace kor {

namespace {

// The new first column of a scroll code, or -1 when the step is refused.
int ColumnAfterScroll(int code, int thumbPosition) {
    const int first = grid.firstVisibleColumn;
    const bool atStart = first < 1;
    const bool atEnd = grid.maxVisibleColumnCount + first >= kColumnLimit + 1;
    switch (code) {
    case SB_LINEUP: return atStart ? -1 : first - 1;
    case SB_LINEDOWN: return atEnd ? -1 : std::min(first + 1, kColumnLimit - 1);
    case SB_PAGEUP: return atStart ? -1 : std::max(first - grid.visibleColumnCount + 1, 0);
    case SB_PAGEDOWN:
        return atEnd ? -1 : std::min(first + grid.visibleColumnCount - 1, kColumnLimit - 1);
    default: return thumbPosition;
    }
}

// Rows at the top are not refused upward steps: the view is redrawn where it is.
int RowAfterScroll(int code, int thumbPosition) {
    const int first = grid.firstVisibleRow;
    switch (code) {
    case SB_LINEUP: return std::max(first - 1, 0);
    case SB_LINEDOWN:
        return grid.maxVisibleRowCount + first >= kRowLimit + 1
                   ? -1
                   : std::min(first + 1, kRowLimit - 1);
    case SB_PAGEUP: return std::max(first - grid.visibleRowCount, 0);
    case SB_PAGEDOWN: return std::min(first + grid.visibleRowCount - 1, kRowLimit - 1);
    default: return thumbPosition;
    }
}

// The view moves when the thumb is let go, not while it is dragged.
bool IsHandled(int code) { return code >= SB_LINEUP && code <= SB_THUMBPOSITION; }

}  // namespace

LRESULT OnHorizontalScroll(int code, int thumbPosition) {
    if (!IsHandled(code)) return 1;
    const int first = ColumnAfterScroll(code, thumbPosition);
    if (first < 0) return 0;
    InvertSelection(Invalidate::no);
    grid.firstVisibleColumn = first;
    SetColumnBarAfterScroll();
    UpdateColumnHeader(ClientRectOf(grid.hwndGrid).right);  // the full width, row header or not
    RedrawClient();
    return 0;
}

LRESULT OnVerticalScroll(int code, int thumbPosition) {
    if (!IsHandled(code)) return 1;
    const int first = RowAfterScroll(code, thumbPosition);
    if (first < 0) return 0;
    InvertSelection(Invalidate::no);
    FitRowHeaderTo(first);
    grid.firstVisibleRow = first;
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
