/* What the public headers promise, checked by a C compiler: sizes, offsets and numbers, and that
 * the headers can be included twice and in any order.                                           */
#include <korcontrols/header.h>
#include <korcontrols/grid.h>
#include <korcontrols/korcontrols.h>
#include <korcontrols/grid.h>
#include <korcontrols/header.h>

#include <stddef.h>

/* C of 1990 has no static assertion: an array of negative size is refused by every compiler. */
#define CHECK(name, condition) typedef char check_##name[(condition) ? 1 : -1]

CHECK(cell_index, sizeof(CellIndex) == 4);

CHECK(selection, sizeof(GridSelection) == 8);
CHECK(selection_left, offsetof(GridSelection, left) == 0);
CHECK(selection_right, offsetof(GridSelection, right) == 2);
CHECK(selection_top, offsetof(GridSelection, top) == 4);
CHECK(selection_bottom, offsetof(GridSelection, bottom) == 6);

CHECK(range, sizeof(GridVisibleRange) == 8);
CHECK(range_first_column, offsetof(GridVisibleRange, firstColumn) == 0);
CHECK(range_end_column, offsetof(GridVisibleRange, endColumn) == 2);
CHECK(range_first_row, offsetof(GridVisibleRange, firstRow) == 4);
CHECK(range_end_row, offsetof(GridVisibleRange, endRow) == 6);

CHECK(pair, sizeof(GridCellPair) == 4);
CHECK(pair_column, offsetof(GridCellPair, column) == 0);
CHECK(pair_row, offsetof(GridCellPair, row) == 2);

CHECK(item, sizeof(HeaderItemDesc) == 2 * sizeof(void *));
CHECK(item_text, offsetof(HeaderItemDesc, text) == 0);
CHECK(item_size, offsetof(HeaderItemDesc, size) == sizeof(void *));

CHECK(messages, HCM_INSERTITEM == WM_USER + 1 && HCM_DELETEITEM == WM_USER + 2 &&
                    HCM_SETITEM == WM_USER + 3 && HCM_SETITEMSTATE == WM_USER + 4 &&
                    HCM_GETITEMCOUNT == WM_USER + 5 && HCM_GETITEM == WM_USER + 6 &&
                    HCM_GETITEMSIZE == WM_USER + 7);
CHECK(header_notifications,
      HCN_ITEMCLICK == 1611 && HCN_ITEMRESIZING == 1612 && HCN_ITEMRESIZED == 1613);
CHECK(header_bits, HCS_VERTICAL == 2 && HIS_SELECTED == 1 && HIS_FRAMED == 2);
CHECK(grid_messages, GRIDM_REDRAW == 3424 && GRIDM_SETEQUATIONTEXT == 3429);
CHECK(grid_notifications,
      GRIDN_PAINTCELLS == 3425 && GRIDN_CELLCLICKED == 3427 && GRIDN_COLUMNRESIZED == 3430 &&
          GRIDN_ROWRESIZED == 3431 && GRIDN_EQUATIONENTERED == 3432 &&
          GRIDN_EQUATIONEMPTY == 3433 && GRIDN_CURRENTCELL == 3434 && GRIDN_SELECTING == 3435 &&
          GRIDN_SELECTIONDONE == 3436 && GRIDN_EDITFOCUS == 3437 && GRIDN_EDITKILLFOCUS == 3438);
CHECK(cells, KORGRID_CELL(0x1234, 0x5678) == 0x56781234 &&
                 KORGRID_CELLCOLUMN(0x56781234) == 0x1234 &&
                 KORGRID_CELLROW(0x56781234) == 0x5678 &&
                 KORGRID_PAIR(0x1234, 0xFFFF) == 0xFFFF1234);
CHECK(cells_cut, KORGRID_CELL(-1, 0) == 0xFFFF && KORGRID_CELL(0x10001, 0x20002) == 0x00020001);
CHECK(sheet, KORGRID_COLUMNS == 256 && KORGRID_ROWS == 16384);

/* Also keeps the linker from finding that this file holds nothing. */
DWORD sizesSeenByC(void);

DWORD sizesSeenByC(void)
{
    return (DWORD)(sizeof(GridSelection) << 16 | sizeof(HeaderItemDesc));
}
