/* The chart: line, area, bar, column and pie charts of numeric series.
 *
 * Create it as a child window of class KORGRAPH_CLASS (or GetGraphControlClassName()) after
 * RegisterGraphControl, and control it with the messages below. The chart keeps copies of all data
 * and texts passed to it. It draws into an off-screen image that WM_PAINT copies to the window.
 *
 * New series and values, ranges, options and titles rescale the axes but draw nothing: make all
 * changes, then send GN_REDRAW once. (GN_CLEAR and GN_RESET rescale nothing.) A change of size,
 * zoom or chart type draws at once.
 *
 * Give the chart WS_CLIPSIBLINGS | WS_CLIPCHILDREN; otherwise it paints over its tooltip (a
 * sibling) and its legend (a child). Give it a parent without a frame: the tooltip is positioned as
 * if the parent's client area began at the corner of the parent's window. The tooltip outlives the
 * chart and is destroyed with the parent, so a host that creates charts repeatedly should create a
 * parent for each.
 *
 * Codes GN_... act only inside WM_NOTIFY (code in wParam, argument in lParam, no NMHDR). Sent as
 * messages of their own they do nothing. The chart sends nothing to its parent.
 *
 * Point k of a series, counted from 0, stands at k + 1 on the category axis. Where a message needs
 * a pointer, a null pointer changes nothing and stores nothing; the result is then 0, or 1 from
 * GM_ADDSERIES.
 *
 * A chart whose record could not be allocated still exists as a window and passes every message to
 * default processing. */
#ifndef KORCONTROLS_GRAPH_H
#define KORCONTROLS_GRAPH_H

#include <korcontrols/korcontrols.h>

#include <commctrl.h> /* TBBUTTON */

#ifdef __cplusplus
extern "C" {
#endif

#define KORGRAPH_CLASS L"KORVANE Corporation GraphControl"

/* ---- Types ---- */

/* Chart types. */
#define KORGRAPH_LINE 0
#define KORGRAPH_AREA 1
#define KORGRAPH_BAR 2 /* horizontal bars: categories along y, values along x */
#define KORGRAPH_COLUMN 3
#define KORGRAPH_PIE 4 /* shows the first series only */

/* Options. All but live mode are initially on. */
#define KORGRAPH_HORIZONTALGRID 0x001
#define KORGRAPH_VERTICALGRID 0x002
#define KORGRAPH_XTICKS 0x004
#define KORGRAPH_YTICKS 0x008
#define KORGRAPH_TITLE 0x010
#define KORGRAPH_XLABELS 0x020
#define KORGRAPH_YLABELS 0x040
#define KORGRAPH_XTITLE 0x080
#define KORGRAPH_YTITLE 0x100
#define KORGRAPH_PERCENTAGES 0x200 /* beside the slices of a pie */
#define KORGRAPH_LIVE 0x400        /* set it before adding series */

/* Zoom indexes. */
#define KORGRAPH_ZOOM25 0
#define KORGRAPH_ZOOM50 1
#define KORGRAPH_ZOOM100 2
#define KORGRAPH_ZOOM200 3

/* Live modes. */
#define KORGRAPH_SWEEP 0   /* each live update is one new sample */
#define KORGRAPH_REPLACE 1 /* each live update replaces a series' values */

/* Axes. */
#define KORGRAPH_X 0
#define KORGRAPH_Y 1

/* A series as the host passes it. 16 bytes on 32-bit systems, 32 on 64-bit ones. */
typedef struct GraphSeriesData {
    LONG pointCount;      /* at least 1 */
    LPCWSTR name;         /* copied; may be null or empty; not read by the replacing codes */
    const double* values; /* pointCount values, copied */
    LONG seriesIndex;     /* which series; read by the replacing codes only */
} GraphSeriesData;

/* One value. 16 bytes. */
typedef struct GraphValue {
    LONG seriesIndex;
    LONG pointIndex;
    double value;
} GraphValue;

/* The range of an axis, in data units. 24 bytes. */
typedef struct GraphRange {
    LONG axis; /* KORGRAPH_X or KORGRAPH_Y */
    LONG reserved;
    double min;
    double max;
} GraphRange;

/* ---- Messages ---- */

/* GM_ADDSERIES: adds a series. Its colour is the next one of the palette.
 *   wParam  0
 *   lParam  const GraphSeriesData*
 *   result  0, or 1 for a null pointer, a count below 1, lack of memory, or while the chart's page
 *           is being printed (nothing is added then) */
#define GM_ADDSERIES (WM_USER + 6000)

/* GM_SETTITLE, GM_SETXTITLE, GM_SETYTITLE: set the chart's and the axes' titles.
 *   wParam  0
 *   lParam  LPCWSTR, copied; null or empty removes the title
 *   result  0 */
#define GM_SETTITLE (WM_USER + 6001)
#define GM_SETXTITLE (WM_USER + 6002)
#define GM_SETYTITLE (WM_USER + 6004)

/* GM_GETTITLE, GM_GETXTITLE, GM_GETYTITLE: read the titles.
 *   wParam  0
 *   lParam  LPCWSTR*; receives a pointer to the chart's own text, or null without one. It is valid
 *           until the title is set again or the chart is destroyed.
 *   result  0 */
#define GM_GETTITLE (WM_USER + 6005)
#define GM_GETXTITLE (WM_USER + 6006)
#define GM_GETYTITLE (WM_USER + 6007)

/* GM_SETCATEGORIES: names the points. Label i belongs to point i.
 *   wParam  count; below 1 removes all labels
 *   lParam  const LPCWSTR*, count texts, copied; any of them may be null
 *   result  0, or 1 for lack of memory (the labels copied so far stay), or while the chart's page
 *           is being printed (nothing changes then) */
#define GM_SETCATEGORIES (WM_USER + 6008)

/* GM_SETTYPE: changes the chart type and draws. A change between Bar and any other type swaps the
 * ranges and titles of the axes, but not whether they are automatic: fix the range of an axis again
 * after such a change.
 *   wParam  0
 *   lParam  KORGRAPH_LINE to KORGRAPH_PIE; any other number is stored and draws nothing
 *   result  0 */
#define GM_SETTYPE (WM_USER + 6009)

/* GM_GETTYPE: reads the chart type.
 *   wParam  0
 *   lParam  LONG*
 *   result  0 */
#define GM_GETTYPE (WM_USER + 6010)

/* GM_SETRANGE: fixes the range of an axis. Equal ends show one unit. The ends are not sorted: a
 * minimum above the maximum gives no useful picture. The category axis of a bar chart (y) ignores
 * the given ends and follows the number of points.
 *   wParam  0
 *   lParam  const GraphRange*; an axis that is neither of the two changes nothing
 *   result  0 */
#define GM_SETRANGE (WM_USER + 6011)

/* GM_AUTORANGE: lets an axis follow the data again, that is, the values that the series were added
 * with. Values set or replaced later do not affect automatic ranges; add the series again if they
 * matter.
 *   wParam  0
 *   lParam  KORGRAPH_X or KORGRAPH_Y
 *   result  0 */
#define GM_AUTORANGE (WM_USER + 6012)

/* GM_SETZOOM: sets the zoom and draws.
 *   wParam  0
 *   lParam  KORGRAPH_ZOOM25 to KORGRAPH_ZOOM200; other numbers are ignored
 *   result  0 */
#define GM_SETZOOM (WM_USER + 6013)

/* GM_TOGGLEOPTIONS: turns options on or off.
 *   wParam  0
 *   lParam  options to invert
 *   result  0 */
#define GM_TOGGLEOPTIONS (WM_USER + 6014)

/* GM_GETOPTIONS: reads the options.
 *   wParam  0
 *   lParam  DWORD*
 *   result  0 */
#define GM_GETOPTIONS (WM_USER + 6015)

/* GN_RESET, inside WM_NOTIFY: removes all series and labels.
 *   lParam  nonzero also makes the ranges automatic again, from 0 to 1. The zoom stays. One unit is
 *           then one pixel, with a tick on each, until a new series, range, option or title
 *           rescales the axes: change one of these before the next redraw.
 *   result  0 */
#define GN_RESET (WM_USER + 6016)

/* GN_PROPERTIES, inside WM_NOTIFY: runs the modal property sheet "Graph Properties", with one page
 * for the titles and one for ranges, type and zoom. OK applies the pages that were shown, and draws
 * if anything was sent. The host is not notified. The message returns when the sheet is closed; the
 * host's messages are dispatched meanwhile. The sheet's owner is the chart. The platform decides
 * whether more windows than the chart are disabled, so a host must not send this while a sheet is
 * open.
 *   lParam  0
 *   result  0 */
#define GN_PROPERTIES (WM_USER + 6017)

/* GN_SETVALUE, inside WM_NOTIFY: sets one value.
 *   lParam  const GraphValue*; bad indexes are ignored
 *   result  0 */
#define GN_SETVALUE (WM_USER + 6018)

/* GN_REDRAW, inside WM_NOTIFY: draws the chart. The next paint shows it on the screen.
 *   lParam  0
 *   result  0 */
#define GN_REDRAW (WM_USER + 6019)

/* GN_PRINT, inside WM_NOTIFY: shows the platform's print dialog and prints the chart on one page.
 * The message returns when that is done; the host's messages are dispatched while the dialog is
 * open. After a print the chart's window is disabled and the host must enable it again. A cancelled
 * dialog does not disable it. Does nothing if printing is not available, or inside another print.
 *   lParam  0
 *   result  0 */
#define GN_PRINT (WM_USER + 6020)

/* GN_LIVEUPDATE, inside WM_NOTIFY: one step of live mode. Without KORGRAPH_LIVE it does nothing.
 * The next paint draws the trace, on the screen only: let it happen (UpdateWindow) before the next
 * step.
 *   lParam  in sweep mode an integer, the new sample; in replace mode const GraphSeriesData*
 *   result  0 */
#define GN_LIVEUPDATE (WM_USER + 6021)

/* GN_REPLACESERIES, inside WM_NOTIFY: replaces a series' values. The series keeps its own number of
 * points: surplus values are dropped, missing ones are 0.
 *   lParam  const GraphSeriesData*
 *   result  default processing's */
#define GN_REPLACESERIES (WM_USER + 6022)

/* GN_CLEAR, inside WM_NOTIFY: removes all series and labels; ranges stay.
 *   lParam  0
 *   result  0 */
#define GN_CLEAR (WM_USER + 6023)

/* GM_SETDATAMODE: selects what a live update does.
 *   wParam  0
 *   lParam  KORGRAPH_SWEEP or KORGRAPH_REPLACE
 *   result  0 */
#define GM_SETDATAMODE (WM_USER + 6024)

/* GM_SHOWLEGEND: creates and shows the legend, once in a chart's life. Later requests are ignored,
 * even if the legend has been destroyed: hide, show and move its window (GetDlgItem with
 * KORLEGEND_ID) instead. Its height is rounded up to whole lines.
 *   wParam  0
 *   lParam  const RECT*, in the chart's client coordinates
 *   result  0 */
#define GM_SHOWLEGEND (WM_USER + 6025)

/* GM_GETSERIESCOLOR: reads the colour of a series, or of a slice while the chart is a pie.
 *   wParam  index
 *   lParam  COLORREF*; receives 0 for a bad index
 *   result  0 */
#define GM_GETSERIESCOLOR (WM_USER + 6026)

/* GM_SETBKCOLOR: sets the background colour, for the next redraw.
 *   wParam  0
 *   lParam  COLORREF
 *   result  0 */
#define GM_SETBKCOLOR (WM_USER + 6027)

/* GM_GETZOOM: reads the zoom index.
 *   wParam  0
 *   lParam  LONG*
 *   result  0 */
#define GM_GETZOOM (WM_USER + 6028)

/* GM_GETRANGE: reads an axis' range as it is shown at 100 %.
 *   wParam  0
 *   lParam  GraphRange*; its axis is read (any number but KORGRAPH_X means y), min and max are set
 *   result  0 */
#define GM_GETRANGE (WM_USER + 6029)

/* GM_COPY: puts the chart's image on the clipboard, as a CF_DIB of 8 bits per pixel in the colours
 * of the series palette. Width and height are those of the client area, rounded up to multiples of
 * 4. The previous contents of the clipboard are lost, even if there is no memory for the image.
 *   wParam  0
 *   lParam  0
 *   result  0 */
#define GM_COPY (WM_USER + 6030)

/* ---- Functions ---- */

/* Registers the chart's window class under the host's `instance`, once per process.
 *   result  nonzero; 0 when the first call could not register it (no later call tries again: they
 *           return 1) */
DWORD KORCONTROLS_API RegisterGraphControl(HINSTANCE instance);

/* The chart's class name. The library owns the text. */
LPCWSTR KORCONTROLS_API GetGraphControlClassName(void);

/* Fills a command bar of the host with the chart's controls: the library's three button images
 * (show chart, properties, legend: image indexes 0 to 2 of an empty bar), the host's buttons, the
 * zoom combo box and the chart type combo box, in this order from the left. The items' data are the
 * arguments of GM_SETZOOM and GM_SETTYPE; "100%" and "Line" are selected. The host's window
 * receives the commands and controls the chart; the library connects nothing.
 *
 * The tooltip texts (of the first two buttons, the zoom and the type combo box, and one more) are
 * sent to the bar as WM_USER + 81 (wParam 5, lParam LPCWSTR*). The library owns the array and the
 * texts, which stay valid. The first text changes with the chart, "Show Grid" while it is shown and
 * "Show Graph" while it is hidden, so a bar must read it again each time.
 *
 * To a desktop toolbar that message has another meaning: it would read the count as a pointer. So a
 * toolbar receives it only if the host has set the window property "korcontrols tooltips" on it, to
 * anything but null. With it the host declares that its own procedure handles the message and does
 * not pass it on. A bar of any other window class always receives it.
 *   instance       the host's, under which the combo boxes are created
 *   commandBar     a command bar, or on a desktop a toolbar that was sent TB_BUTTONSTRUCTSIZE
 *   buttons        buttonCount descriptions, added as they are; null or a count of 0 adds none
 *   zoomComboOut   receives the zoom combo box, or null when it could not be created; may be null
 *   zoomComboId    its control id
 *   typeComboOut   the same for the chart type
 *   typeComboId    its control id
 *   result         1, or 0 for a null bar (nothing is done or stored then) */
DWORD KORCONTROLS_API SetupGraphCommandBar(HINSTANCE instance, HWND commandBar,
                                           const TBBUTTON* buttons, LONG buttonCount,
                                           HWND* zoomComboOut, UINT zoomComboId, HWND* typeComboOut,
                                           UINT typeComboId);

/* Whether charts can be printed, that is, whether the two modules that printing needs are loaded.
 * Creating a chart tries to load them.
 *   result  1, or 0 */
DWORD KORCONTROLS_API IsPrintingAvailableForGraphControl(void);

/* ---- The messages as functions ---- */

static __inline LRESULT KorGraph_Notify(HWND graph, UINT code, LPARAM argument) {
    return SendMessageW(graph, WM_NOTIFY, (WPARAM)code, argument);
}

static __inline BOOL KorGraph_AddSeries(HWND graph, const GraphSeriesData* series) {
    return SendMessageW(graph, GM_ADDSERIES, 0, (LPARAM)series) == 0;
}

static __inline void KorGraph_SetTitle(HWND graph, LPCWSTR text) {
    SendMessageW(graph, GM_SETTITLE, 0, (LPARAM)text);
}

static __inline void KorGraph_SetXTitle(HWND graph, LPCWSTR text) {
    SendMessageW(graph, GM_SETXTITLE, 0, (LPARAM)text);
}

static __inline void KorGraph_SetYTitle(HWND graph, LPCWSTR text) {
    SendMessageW(graph, GM_SETYTITLE, 0, (LPARAM)text);
}

static __inline BOOL KorGraph_SetCategories(HWND graph, LONG count, const LPCWSTR* labels) {
    return SendMessageW(graph, GM_SETCATEGORIES, (WPARAM)count, (LPARAM)labels) == 0;
}

static __inline void KorGraph_SetType(HWND graph, LONG type) {
    SendMessageW(graph, GM_SETTYPE, 0, (LPARAM)type);
}

static __inline LONG KorGraph_GetType(HWND graph) {
    LONG type = 0;
    SendMessageW(graph, GM_GETTYPE, 0, (LPARAM)&type);
    return type;
}

static __inline void KorGraph_SetRange(HWND graph, LONG axis, double low, double high) {
    GraphRange range;
    range.axis = axis;
    range.reserved = 0;
    range.min = low;
    range.max = high;
    SendMessageW(graph, GM_SETRANGE, 0, (LPARAM)&range);
}

static __inline void KorGraph_AutoRange(HWND graph, LONG axis) {
    SendMessageW(graph, GM_AUTORANGE, 0, (LPARAM)axis);
}

static __inline void KorGraph_SetZoom(HWND graph, LONG zoomIndex) {
    SendMessageW(graph, GM_SETZOOM, 0, (LPARAM)zoomIndex);
}

static __inline LONG KorGraph_GetZoom(HWND graph) {
    LONG zoomIndex = 0;
    SendMessageW(graph, GM_GETZOOM, 0, (LPARAM)&zoomIndex);
    return zoomIndex;
}

static __inline void KorGraph_ToggleOptions(HWND graph, DWORD options) {
    SendMessageW(graph, GM_TOGGLEOPTIONS, 0, (LPARAM)options);
}

static __inline DWORD KorGraph_GetOptions(HWND graph) {
    DWORD options = 0;
    SendMessageW(graph, GM_GETOPTIONS, 0, (LPARAM)&options);
    return options;
}

static __inline void KorGraph_SetDataMode(HWND graph, LONG mode) {
    SendMessageW(graph, GM_SETDATAMODE, 0, (LPARAM)mode);
}

static __inline void KorGraph_ShowLegend(HWND graph, const RECT* place) {
    SendMessageW(graph, GM_SHOWLEGEND, 0, (LPARAM)place);
}

static __inline COLORREF KorGraph_GetSeriesColour(HWND graph, LONG index) {
    COLORREF colour = 0;
    SendMessageW(graph, GM_GETSERIESCOLOR, (WPARAM)index, (LPARAM)&colour);
    return colour;
}

static __inline void KorGraph_SetBackgroundColour(HWND graph, COLORREF colour) {
    SendMessageW(graph, GM_SETBKCOLOR, 0, (LPARAM)colour);
}

static __inline void KorGraph_Redraw(HWND graph) { KorGraph_Notify(graph, GN_REDRAW, 0); }

static __inline void KorGraph_ShowProperties(HWND graph) {
    KorGraph_Notify(graph, GN_PROPERTIES, 0);
}

static __inline void KorGraph_Copy(HWND graph) { SendMessageW(graph, GM_COPY, 0, 0); }

static __inline void KorGraph_Print(HWND graph) { KorGraph_Notify(graph, GN_PRINT, 0); }

static __inline void KorGraph_Clear(HWND graph) { KorGraph_Notify(graph, GN_CLEAR, 0); }

static __inline void KorGraph_Reset(HWND graph, BOOL ranges) {
    KorGraph_Notify(graph, GN_RESET, (LPARAM)ranges);
}

static __inline void KorGraph_SetValue(HWND graph, LONG seriesIndex, LONG pointIndex,
                                       double value) {
    GraphValue point;
    point.seriesIndex = seriesIndex;
    point.pointIndex = pointIndex;
    point.value = value;
    KorGraph_Notify(graph, GN_SETVALUE, (LPARAM)&point);
}

static __inline void KorGraph_ReplaceSeries(HWND graph, const GraphSeriesData* series) {
    KorGraph_Notify(graph, GN_REPLACESERIES, (LPARAM)series);
}

#ifdef __cplusplus
}
#endif

#endif /* KORCONTROLS_GRAPH_H */
