/* The spreadsheet grid: a view of 256 columns and 16,384 rows that stores no cell contents.
 *
 * The grid keeps column widths, row heights, zoom, scroll position, selection and an equation bar.
 * Whenever cells must be drawn it sends its parent GRIDN_PAINTCELLS with the visible range; the
 * parent responds inside that notification with SetCellBackGroundColor, SetCellBorder and
 * SetCellValue. Everything is drawn into an off-screen image; WM_PAINT copies it to the window.
 *
 * There is one grid per process: the functions take no window handle and act on that grid. Create
 * it as a child window of class KORGRID_CLASS with WS_CHILD | WS_VISIBLE | WS_CLIPCHILDREN, after
 * RegisterGridControl. A second window of the class takes everything over from the first, which
 * never works again, not even after the second is destroyed. Positions are pixels in the grid's
 * client area. Ends of the visible range are exclusive, ends of a selection inclusive. Sizes "in
 * units" are pixels at 100 % zoom.
 *
 * No function reads the zoom level, a size, or what is hidden: the host must remember what it set.
 *
 * Functions called before the grid's window exists, or after it is destroyed, store or return the
 * grid's state and draw nothing. After its destruction, those that redraw still ask its parent to
 * paint cells (GRIDN_PAINTCELLS); the parent's calls then have no effect. */
#ifndef KORCONTROLS_GRID_H
#define KORCONTROLS_GRID_H

#include <korcontrols/korcontrols.h>

#ifdef __cplusplus
extern "C" {
#endif

#define KORGRID_CLASS L"KV Grid Control"

#define KORGRID_COLUMNS 256
#define KORGRID_ROWS 16384

/* ---- Types ---- */

/* A cell: column in the low 16 bits, row in the high 16 bits. */
typedef DWORD CellIndex;

#define KORGRID_CELL(column, row) ((CellIndex)((DWORD)(WORD)(column) | (DWORD)(WORD)(row) << 16))
#define KORGRID_CELLCOLUMN(cell) ((WORD)((DWORD)(cell)&0xFFFF))
#define KORGRID_CELLROW(cell) ((WORD)((DWORD)(cell) >> 16))

/* A selected block, both ends inclusive; the current cell is (left, top). 8 bytes.
 * Some functions take a block as two values: left | right << 16 and top | bottom << 16. */
typedef struct GridSelection {
    WORD left;
    WORD right;
    WORD top;
    WORD bottom;
} KORCONTROLS_EVEN GridSelection;

#define KORGRID_PAIR(low, high) ((DWORD)(WORD)(low) | (DWORD)(WORD)(high) << 16)

/* The visible cells, ends exclusive. A partly visible last column or row is included. After a
 * horizontal scroll, SetFirstVisibleCell or the resizing of a column, columns are counted over the
 * whole client width, as if there were no row header. The last column, or several narrow ones, may
 * then lie outside the window. WM_SIZE and GRIDM_REDRAW count over the cells alone. 8 bytes. */
typedef struct GridVisibleRange {
    WORD firstColumn;
    WORD endColumn;
    WORD firstRow;
    WORD endRow;
} KORCONTROLS_EVEN GridVisibleRange;

/* A cell that a notification points to. 4 bytes. */
typedef struct GridCellPair {
    WORD column;
    WORD row;
} KORCONTROLS_EVEN GridCellPair;

/* ---- Notifications to the parent ----
 *
 * All are sent (SendMessage), so the parent handles them before the grid continues. Results are
 * ignored. Pointers are valid during the call only. Those marked WM_NOTIFY arrive as WM_NOTIFY with
 * the code below in wParam and the data itself in lParam: lParam is NOT an NMHDR pointer, so a
 * parent with other controls must look at wParam first. (A control's id cannot be confused with a
 * code as long as ids stay below 3425.) */

/* WM_NOTIFY: cells must be drawn. lParam: const GridVisibleRange*. The area is white and has its
 * grid lines; draw the cells of the range, then return. */
#define GRIDN_PAINTCELLS 3425

/* WM_NOTIFY: the left button was pressed. lParam: const GridCellPair*, the cell under the pointer.
 * No GRIDN_CURRENTCELL accompanies it: show the current cell's text here as well (with Shift, the
 * current cell is not the pressed cell). The second press of a double click is not notified. Beyond
 * the last visible column or row the index is 0. Up to one default size past the last column or row
 * of the sheet it is KORGRID_COLUMNS or KORGRID_ROWS, so check before indexing. */
#define GRIDN_CELLCLICKED 3427

/* WM_NOTIFY: the border of a column, or row, was dragged and released. The grid has already
 * redrawn, but at zoom levels other than 100 % perhaps not enough: respond with GRIDM_REDRAW.
 * lParam (a value): low word the new size in units, high word the absolute column or row. */
#define GRIDN_COLUMNRESIZED 3430
#define GRIDN_ROWRESIZED 3431

#define KORGRID_RESIZEDSIZE(lParam) LOWORD(lParam)
#define KORGRID_RESIZEDINDEX(lParam) HIWORD(lParam)

/* A message of its own, not WM_NOTIFY: text was committed in the equation bar.
 *   wParam  LPCWSTR, at most 255 characters; copy what you keep
 *   lParam  low word the current ROW, high word the current COLUMN (the reverse of a CellIndex)
 * A redraw of all cells follows, so the parent need only store the text. */
#define GRIDN_EQUATIONENTERED 3432

#define KORGRID_EQUATIONROW(lParam) LOWORD(lParam)
#define KORGRID_EQUATIONCOLUMN(lParam) HIWORD(lParam)

/* A message of its own, not WM_NOTIFY: an emptied equation bar was committed. wParam 0, lParam as
 * above. The edit's modified flag stays set, so a second commit sends it again. */
#define GRIDN_EQUATIONEMPTY 3433

/* WM_NOTIFY: the current cell may have changed (keys; Escape or "X" in the equation bar). The
 * parent shows the cell's text with KorGrid_SetEquationText. lParam: const GridCellPair*. */
#define GRIDN_CURRENTCELL 3434

/* WM_NOTIFY: a drag changed the selection. lParam: const GridSelection*. */
#define GRIDN_SELECTING 3435

/* WM_NOTIFY: the left button was released. A double click sends it twice. lParam: const
 * GridSelection*. */
#define GRIDN_SELECTIONDONE 3436

/* WM_NOTIFY: the equation edit got the focus. lParam: 0. */
#define GRIDN_EDITFOCUS 3437

/* WM_NOTIFY: the equation edit lost the focus and is about to commit. lParam: 1 when a press in the
 * grid took the focus, else 0. */
#define GRIDN_EDITKILLFOCUS 3438

/* The parent also receives a posted WM_COMMAND, with the number given to
 * SetFunctionButtonMessageID, when "fx" is clicked, and a sent WM_KEYDOWN, with wParam VK_DELETE
 * and lParam 1, when Delete is pressed in the grid. */

/* ---- Messages to the grid ---- */

/* GRIDM_REDRAW: lays out the headers' items again and redraws all cells.
 *   wParam, lParam  0
 *   result          0 */
#define GRIDM_REDRAW 3424

/* GRIDM_SETEQUATIONTEXT: shows a text in the equation bar without committing anything.
 *   wParam  passed on to the edit, 0
 *   lParam  LPCWSTR, copied; null changes nothing
 *   result  0 */
#define GRIDM_SETEQUATIONTEXT 3429

static __inline void KorGrid_Redraw(HWND grid) { SendMessageW(grid, GRIDM_REDRAW, 0, 0); }

static __inline void KorGrid_SetEquationText(HWND grid, LPCWSTR text) {
    SendMessageW(grid, GRIDM_SETEQUATIONTEXT, 0, (LPARAM)text);
}

/* ---- Life ---- */

/* Registers the grid's window class under the host's `instance`.
 *   result  nonzero, or 0 when the class could not be registered (for example because it already
 *           is) */
DWORD KORCONTROLS_API RegisterGridControl(HINSTANCE instance);

/* Discards all column widths and row heights, scrolls to A1 and empties the equation bar. Keeps the
 * selection and the zoom. Repaints nothing: call SetFirstVisibleCell(0) afterwards. */
void KORCONTROLS_API ResetGrid(void);

/* ---- Drawing, inside GRIDN_PAINTCELLS ----
 *
 * Each does nothing for a cell outside the visible range. A cell's box is x, y to x + width,
 * y + height; its grid lines are the box's left and top edges. */

/* Fills the box and the lines around it (one pixel more to the right and below), so a cell filled
 * with white has no grid lines: fill only cells that have a colour of their own. The caller keeps
 * the brush. A null brush draws nothing. */
void KORCONTROLS_API SetCellBackGroundColor(CellIndex cell, HBRUSH brush);

/* Draws those edges of the box whose flags have any of the low 16 bits set. The caller keeps the
 * pen. */
void KORCONTROLS_API SetCellBorder(CellIndex cell, HPEN pen, DWORD left, DWORD right, DWORD top,
                                   DWORD bottom);

/* Draws a cell's text.
 *   text        zero-terminated; null draws nothing
 *   font        font at 100 % zoom, scaled by the grid; 0: the image's current font, unscaled
 *   textColour  colour of the letters
 *   backColour  colour behind them: letters are drawn on a box of this colour, so pass the cell's
 *               own
 *   format      DrawTextW flags; 0 means DT_NOPREFIX | DT_VCENTER | DT_CENTER. Without DT_NOPREFIX
 *               a "&" underlines what follows it
 *   spanLeft    > 0: the text's rectangle begins this many columns further left (not before the
 *               first visible one)
 *   spanRight   > 0: it ends this many columns further right; < 0: it runs past the client area
 *   fitCheck    nonzero: a text too wide for the rectangle becomes a row of "#"
 *   keepSpan    nonzero: a centred text that fits stays centred over the span, not in its own cell
 * The rectangle leaves 3 pixels free on the left and right and 1 above. */
void KORCONTROLS_API SetCellValue(CellIndex cell, LPCWSTR text, HFONT font, COLORREF textColour,
                                  COLORREF backColour, UINT format, LONG spanLeft, LONG spanRight,
                                  DWORD fitCheck, DWORD keepSpan);

/* Shows or hides the grid lines and redraws.
 *   result  1 */
DWORD KORCONTROLS_API ToggleGridLines(void);

/* ---- Sizes and zoom ---- */

/* Sets a size in pixels at the current zoom (only the low 16 bits are used). Repaints nothing. To
 * restore a size in units, set (units * level + 3) / 4 pixels. From 100 % up this is exact; below,
 * not every size can be set.
 *   column, row  counted from the first visible one. It need not be in view; negative numbers are
 *                those before the first visible one
 *   result       1, or 0 for lack of memory or a column or row outside the sheet
 * The size in units is compared with the cell area in pixels, at any zoom. A larger size is clamped
 * to the area less 10, in units (never below 0). Without a client area nothing is clamped. */
DWORD KORCONTROLS_API SetColumnWidth(LONG column, LONG width);
DWORD KORCONTROLS_API SetRowHeight(LONG row, LONG height);

/* Sets the zoom in quarters (4 = 100 %), lays everything out again and redraws. 0 is refused and
 * leaves the level unchanged. There is no upper limit; above some level not even one whole cell
 * fits.
 *   result  nonzero when the headers are hidden */
DWORD KORCONTROLS_API SetGridZoomLevel(DWORD level);

/* Shows or hides both headers and the corner button, and lays everything out again.
 *   result  nonzero when the headers are hidden now */
DWORD KORCONTROLS_API ToggleViewStateOfHeaders(void);

/* ---- Scrolling ---- */

/* Makes `cell` the top left visible cell and redraws. The cell is not checked: past column 255 or
 * row 16383 no cells are shown.
 *   result  1 */
DWORD KORCONTROLS_API SetFirstVisibleCell(CellIndex cell);

/* Sets how many columns, or rows, the host's data has. This is the scroll bar's extent, but at
 * least the number of visible ones. The scroll bar is set at once, with the number visible now as
 * its page. Until the first call, or a scroll, a grid's scroll bars have the system's range of 0 to
 * 100. Sizing and zooming do not update them, so call these functions once the grid has its size,
 * and again after WM_SIZE and after a zoom.
 *   result  the scroll bar's position. While the scroll bar is hidden it is the grid's window
 *           handle, which is 0 before there is a grid. The number is stored in any case. */
LONG KORCONTROLS_API SetHorizontalDataRange(LONG columns);
LONG KORCONTROLS_API SetVerticalDataRange(LONG rows);

/* Shows or hides a scroll bar. Scrolling works without it.
 *   result  1 */
DWORD KORCONTROLS_API ToggleHorizontalScrollBar(void);
DWORD KORCONTROLS_API ToggleVerticalScrollBar(void);

/* Fills *range with the visible cells; a null pointer is ignored. */
void KORCONTROLS_API GetVisibleRange(GridVisibleRange* range);

/* How many columns, or rows, are visible, a partly visible last one included: 0 to 255. */
DWORD KORCONTROLS_API GetNumberOfVisibleColumns(void);
DWORD KORCONTROLS_API GetNumberOfVisibleRows(void);

/* Whether a cell is in the visible range, and whether it also lies completely inside the client
 * area. Only cells of the last visible column and row are measured; all other cells of the range
 * count as completely visible.
 *   result  1 or 0 */
DWORD KORCONTROLS_API IsIndexVisible(CellIndex cell);
DWORD KORCONTROLS_API IsIndexCompletelyVisible(CellIndex cell);

/* ---- Selection ---- */

/* Selects a block and highlights it. Nothing is scrolled or notified, and the anchor for Shift
 * stays. Text that is being typed would be committed to the new current cell: give the grid the
 * focus first.
 *   columns  KORGRID_PAIR(left, right)
 *   rows     KORGRID_PAIR(top, bottom)
 *   result   nonzero, or 0 (and no change) for a block that is inverted or leaves the sheet */
DWORD KORCONTROLS_API SetSelectedRanged(DWORD columns, DWORD rows);

/* Fills *selection with the selected block; a null pointer is ignored. */
void KORCONTROLS_API GetSelectedRanged(GridSelection* selection);

/* Fills *cell with the current cell.
 *   result  1, or 0 (nothing written) for a null pointer or while the first visible column or row
 *           is negative */
DWORD KORCONTROLS_API GetCurrentSelectedCell(GridCellPair* cell);

/* ---- Equation bar ---- */

/* The equation bar's edit control, or 0 before the grid exists. After the grid's destruction it is
 * the handle of the destroyed edit. The grid owns the edit. */
HWND KORCONTROLS_API GetHandleToEquationControl(void);

/* The grid's window or the edit, whichever had the focus last; 0 before either had it. */
HWND KORCONTROLS_API GetControlWithFocus(void);

/* Sets the WM_COMMAND number that a click on "fx" posts to the parent. */
void KORCONTROLS_API SetFunctionButtonMessageID(DWORD id);

/* Commits the equation bar. The current cell stays, whereas a click on "OK" also moves it down.
 *   result  0, or 1 when nothing was typed */
LONG KORCONTROLS_API PressOKButton(void);

#ifdef __cplusplus
}
#endif

#endif /* KORCONTROLS_GRID_H */
