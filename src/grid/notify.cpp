#include "grid/notify.h"

#include "base/windows_helpers.h"
#include "grid/state.h"
#include "grid/visible.h"

namespace kor {

namespace {

// WM_NOTIFY with the code in wParam; `data` is a value or a pointer, never an NMHDR.
void Notify(WPARAM code, LPARAM data) { SendMessageW(grid.hwndParent, WM_NOTIFY, code, data); }

template <typename Data>
void NotifyWith(WPARAM code, const Data& data) {
    Data copy = data;  // the parent may change the grid's own data while it reads
    Notify(code, reinterpret_cast<LPARAM>(&copy));
}

// Column in the high word, row in the low one: the reverse of a CellIndex.
LPARAM CurrentCellForEquation() { return WordPair(grid.selection.top, grid.selection.left); }

}  // namespace

void NotifyPaintCells() { NotifyWith(GRIDN_PAINTCELLS, VisibleRange()); }

void NotifyCellClicked(Cell cell) {
    NotifyWith(GRIDN_CELLCLICKED, GridCellPair{cell.column, cell.row});
}

void NotifyCurrentCell() {
    NotifyWith(GRIDN_CURRENTCELL, GridCellPair{grid.selection.left, grid.selection.top});
}

void NotifySelecting() { Notify(GRIDN_SELECTING, reinterpret_cast<LPARAM>(&grid.selection)); }

void NotifySelectionDone() {
    Notify(GRIDN_SELECTIONDONE, reinterpret_cast<LPARAM>(&grid.selection));
}

void NotifyColumnResized(int column, int units) {
    Notify(GRIDN_COLUMNRESIZED, WordPair(units, column));
}

void NotifyRowResized(int row, int units) { Notify(GRIDN_ROWRESIZED, WordPair(units, row)); }

void NotifyEditFocus() { Notify(GRIDN_EDITFOCUS, 0); }

void NotifyEditKillFocus() { Notify(GRIDN_EDITKILLFOCUS, grid.focusByMouse ? 1 : 0); }

void NotifyEquationEntered(const wchar_t* text) {
    SendMessageW(grid.hwndParent, GRIDN_EQUATIONENTERED, reinterpret_cast<WPARAM>(text),
                 CurrentCellForEquation());
}

void NotifyEquationEmpty() {
    SendMessageW(grid.hwndParent, GRIDN_EQUATIONEMPTY, 0, CurrentCellForEquation());
}

void NotifyDeleteKey() { SendMessageW(grid.hwndParent, WM_KEYDOWN, VK_DELETE, 1); }

void PostFunctionCommand() {
    PostMessageW(grid.hwndParent, WM_COMMAND, grid.functionButtonMessageId, 0);
}

}  // namespace kor
