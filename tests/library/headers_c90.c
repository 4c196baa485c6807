/* What the public headers promise, checked by a C compiler: sizes, offsets and numbers, and that
 * the headers can be included twice and in any order.                                           */
#include <korcontrols/listhelpers.h>
#include <korcontrols/header.h>
#include <korcontrols/tooltip.h>
#include <korcontrols/graph.h>
#include <korcontrols/legend.h>
#include <korcontrols/funkybar.h>
#include <korcontrols/grid.h>
#include <korcontrols/korcontrols.h>
#include <korcontrols/funkybar.h>
#include <korcontrols/graph.h>
#include <korcontrols/legend.h>
#include <korcontrols/listhelpers.h>
#include <korcontrols/tooltip.h>
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

/* Members of 4 bytes each, of which pointers and handles widen. */
#define BITS(of32, of64) (sizeof(void *) == 4 ? (of32) : (of64))

CHECK(bar_item, sizeof(FunkyBarItemDesc) == BITS(32, 40));
CHECK(bar_item_mask, offsetof(FunkyBarItemDesc, mask) == 0);
CHECK(bar_item_index, offsetof(FunkyBarItemDesc, index) == 4);
CHECK(bar_item_text, offsetof(FunkyBarItemDesc, text) == 8);
CHECK(bar_item_capacity, offsetof(FunkyBarItemDesc, textCapacity) == BITS(12, 16));
CHECK(bar_item_image, offsetof(FunkyBarItemDesc, image) == BITS(16, 20));
CHECK(bar_item_colour, offsetof(FunkyBarItemDesc, textColour) == BITS(20, 24));
CHECK(bar_item_background, offsetof(FunkyBarItemDesc, backgroundColour) == BITS(24, 28));
CHECK(bar_item_data, offsetof(FunkyBarItemDesc, userData) == BITS(28, 32));

CHECK(bar_notification, sizeof(FunkyBarNotification) == BITS(16, 32));
CHECK(bar_notification_index, offsetof(FunkyBarNotification, index) == BITS(12, 24));

CHECK(bar_bits, FBIF_TEXT == 1 && FBIF_IMAGE == 2 && FBIF_COLOURS == 4 && FBIF_USERDATA == 8);
CHECK(bar_messages, FBM_INSERTITEM == 7074 && FBM_GETITEM == 7075 && FBM_SETIMAGELIST == 7076 &&
                        FBM_GETIMAGELIST == 7077 && FBM_DELETEITEM == 7078 &&
                        FBM_DELETEALL == 7079 && FBM_GETCOUNT == 7080 && FBM_SETCURSEL == 7081 &&
                        FBM_GETCURSEL == 7082);
CHECK(bar_notification_code, FBN_SELECTED == 256);

CHECK(series, sizeof(GraphSeriesData) == BITS(16, 32));
CHECK(series_name, offsetof(GraphSeriesData, name) == BITS(4, 8));
CHECK(series_values, offsetof(GraphSeriesData, values) == BITS(8, 16));
CHECK(series_index, offsetof(GraphSeriesData, seriesIndex) == BITS(12, 24));
CHECK(value, sizeof(GraphValue) == 16 && offsetof(GraphValue, value) == 8);
CHECK(graph_range, sizeof(GraphRange) == 24 && offsetof(GraphRange, min) == 8 &&
                       offsetof(GraphRange, max) == 16);
CHECK(tip_request, sizeof(ToolTipRequest) == BITS(16, 24));
CHECK(tip_request_x, offsetof(ToolTipRequest, x) == BITS(4, 8));
CHECK(tip_request_limit, offsetof(ToolTipRequest, limit) == BITS(12, 16));
CHECK(graph_messages, GM_ADDSERIES == 7024 && GM_GETRANGE == 7053 && GN_RESET == 7040 &&
                          GN_CLEAR == 7047 && TIPM_SHOW == 6024 && TIPM_HIDE == 6025);
CHECK(child_ids, KORLEGEND_ID == 30 && KORTOOLTIP_ID == 10);

/* Also keeps the linker from finding that this file holds nothing. */
DWORD sizesSeenByC(void);

DWORD sizesSeenByC(void)
{
    return (DWORD)(sizeof(GridSelection) << 16 | sizeof(HeaderItemDesc));
}
