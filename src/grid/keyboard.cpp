#include "grid/keyboard.h"

#include "base/windows_helpers.h"
#include "grid/moves.h"
#include "grid/notify.h"
#include "grid/scrolling.h"
#include "grid/selection.h"
#include "grid/state.h"

namespace kor {

namespace {

constexpr WPARAM kFirstExaminedKey = VK_TAB;
constexpr WPARAM kLastExaminedKey = VK_DELETE;

Anchor ShiftAnchor() {
    if (!IsShiftDown()) return {kNoAnchor, kNoAnchor};
    return {grid.anchorColumn, grid.anchorRow};
}

// Compatibility: an invalid selection (page down can leave one past the last row) moves to A1;
// pinned by InvalidSelection.BecomesA1ByEveryArrowAndPageKey.
template <typename Move>
void MoveSelection(Move move) {
    const CellBlock block = grid.selection;
    ShowSelection(IsValidRange(block) ? move(block) : CellBlock{0, 0, 0, 0});
}

bool IsBelowView() { return grid.selection.bottom >= grid.firstVisibleRow + grid.visibleRowCount; }

void OnLeft() {
    MoveSelection([](CellBlock block) { return MoveLeft(block, ShiftAnchor()); });
    if (grid.selection.left < grid.firstVisibleColumn) ScrollHorizontally(SB_LINEUP);
    NotifyCurrentCell();
}

void OnRight() {
    MoveSelection([](CellBlock block) { return MoveRight(block, ShiftAnchor()); });
    if (grid.selection.right >= grid.firstVisibleColumn + grid.visibleColumnCount) {
        ScrollHorizontally(SB_LINEDOWN);
    }
    NotifyCurrentCell();
}

void OnUp() {
    MoveSelection([](CellBlock block) { return MoveUp(block, ShiftAnchor()); });
    if (grid.selection.top < grid.firstVisibleRow) ScrollVertically(SB_LINEUP);
    NotifyCurrentCell();
}

void OnDown() {
    MoveSelection([](CellBlock block) { return MoveDown(block, ShiftAnchor()); });
    if (IsBelowView()) ScrollVertically(SB_LINEDOWN);
    NotifyCurrentCell();
}

void OnPageUp() {
    // Compatibility: within the first page the selection stays and nothing is notified; pinned by
    // PageKeys.PageUpInTheFirstScreenOnlyScrolls.
    if (IsValidRange(grid.selection) && grid.selection.top <= grid.visibleRowCount) {
        ScrollVertically(SB_PAGEUP);
        return;
    }
    MoveSelection([](CellBlock block) { return MovePageUp(block, grid.visibleRowCount); });
    if (IsBelowView()) ScrollVertically(SB_LINEDOWN);
    ScrollVertically(SB_PAGEUP);
    NotifyCurrentCell();
}

void OnPageDown() {
    MoveSelection([](CellBlock block) { return MovePageDown(block, grid.visibleRowCount); });
    if (IsBelowView()) ScrollVertically(SB_LINEDOWN);
    ScrollVertically(SB_PAGEDOWN);
    NotifyCurrentCell();
}

// Tab and Enter move like an arrow key, without extending.
LRESULT OnAdvance(int arrowKey) {
    if (!HasCurrentCell()) return 1;
    SetFocus(grid.hwndGrid);
    ClearAnchor();
    PressGridKey(arrowKey);
    return 0;
}

}  // namespace

bool IsShiftDown() { return GetKeyState(VK_SHIFT) < 0; }

void PressGridKey(int key) { SendMessageW(grid.hwndGrid, WM_KEYDOWN, static_cast<WPARAM>(key), 1); }

LRESULT OnGridKeyDown(WPARAM key, LPARAM flags) {
    if (key < kFirstExaminedKey || key > kLastExaminedKey) {
        return DefWindowProcW(grid.hwndGrid, WM_KEYDOWN, key, flags);
    }
    switch (key) {
    case VK_TAB: return OnAdvance(IsShiftDown() ? VK_LEFT : VK_RIGHT);
    case VK_RETURN: return OnAdvance(VK_DOWN);
    case VK_PRIOR: OnPageUp(); break;
    case VK_NEXT: OnPageDown(); break;
    case VK_LEFT: OnLeft(); break;
    case VK_UP: OnUp(); break;
    case VK_RIGHT: OnRight(); break;
    case VK_DOWN: OnDown(); break;
    case VK_DELETE: NotifyDeleteKey(); break;
    default: break;  // Control, Escape and the rest have no effect
    }
    return 0;
}

}  // namespace kor
