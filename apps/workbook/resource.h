/* Numbers that the resources and the code share. They are stable: programs that drive the workbook
 * from outside send them as WM_COMMAND numbers and find its windows by them. */
#ifndef WORKBOOK_RESOURCE_H
#define WORKBOOK_RESOURCE_H

/* Child windows of the main window. All stay below 3425, the first of the grid's codes in
 * WM_NOTIFY, so that a status bar's notification is never taken for the grid's. */
#define IDC_GRID 101
#define IDC_STATUS 102
#define IDC_CHART_PANE 103

/* Child windows of the chart pane. */
#define IDC_CHART 104
#define IDC_LIVE_CHART 105
#define IDC_LIVE_PANE 106

/* The chart's bar, a child of the main window, and its combo boxes. */
#define IDC_CHART_BAR 107
#define IDC_ZOOM_COMBO 108
#define IDC_TYPE_COMBO 109

/* The bar of sheets, and the side panel with its children. */
#define IDC_SHEET_BAR 110
#define IDC_SIDE_PANEL 111
#define IDC_FILE_TREE 112
#define IDC_STATISTICS 113

/* Resources. */
#define IDR_MENU 200
#define IDR_KEYS_ALWAYS 201 /* accelerators that work everywhere in the window */
#define IDR_KEYS_GRID 202   /* accelerators that the equation bar keeps for its text */
#define IDD_GOTO 210
#define IDC_GOTO_ADDRESS 211
#define IDD_KEYS 220
#define IDD_CHART_TITLES 230
#define IDC_TITLE_CHART 231
#define IDC_TITLE_CATEGORIES 232
#define IDC_TITLE_VALUES 233
#define IDD_CHART_RANGE 240
#define IDC_RANGE_LOW 241
#define IDC_RANGE_HIGH 242

/* File. */
#define IDM_FILE_NEW 1001
#define IDM_FILE_OPEN 1002
#define IDM_FILE_SAVE 1003
#define IDM_FILE_SAVE_AS 1004
#define IDM_FILE_EXIT 1005
#define IDM_FILE_CLOSE 1006
#define IDM_FILE_PRINT 1007

/* Edit. */
#define IDM_EDIT_UNDO 1101
#define IDM_EDIT_REDO 1102
#define IDM_EDIT_CUT 1103
#define IDM_EDIT_COPY 1104
#define IDM_EDIT_PASTE 1105
#define IDM_EDIT_CLEAR 1106
#define IDM_EDIT_SELECT_ALL 1107
#define IDM_EDIT_CELL 1108
#define IDM_EDIT_GOTO 1109
#define IDM_EDIT_FIRST_CELL 1110 /* keys only */
#define IDM_EDIT_LAST_CELL 1111  /* keys only */

/* View. The zoom commands are consecutive: one radio group. */
#define IDM_VIEW_ZOOM_50 1201
#define IDM_VIEW_ZOOM_75 1202
#define IDM_VIEW_ZOOM_100 1203
#define IDM_VIEW_ZOOM_150 1204
#define IDM_VIEW_ZOOM_200 1205
#define IDM_VIEW_HEADERS 1211
#define IDM_VIEW_GRID_LINES 1212
#define IDM_VIEW_HORIZONTAL_SCROLL_BAR 1213
#define IDM_VIEW_VERTICAL_SCROLL_BAR 1214
#define IDM_VIEW_TITLE_ROW 1215
#define IDM_VIEW_FIT_SIZES 1216
#define IDM_VIEW_NEXT_SHEET 1217
#define IDM_VIEW_PREVIOUS_SHEET 1218

#define IDM_VIEW_SIDE_PANEL 1219
#define IDM_VIEW_NEXT_PANE 1220 /* keys only */

/* The menu over the list of columns. */
#define IDM_COLUMN_GO 1251
#define IDM_COLUMN_REMOVE 1252
#define IDM_COLUMN_SHOW_ALL 1253

/* Help. */
#define IDM_HELP_KEYS 1301
#define IDM_HELP_ABOUT 1302

/* What the grid posts when "fx" is pressed, and the entries of the menu that answers it. */
#define IDM_FUNCTIONS 1401
#define IDM_FUNCTION_FIRST 1500
#define IDM_FUNCTION_LAST 1599

/* Chart. Types and zoom are consecutive in the chart's own order, the options in the order of its
 * bits. From the line chart on, entries need a chart to be shown. */
#define IDM_CHART_FIRST 1601
#define IDM_CHART_SHOW 1601
#define IDM_CHART_SELECTION 1602
#define IDM_CHART_LINE 1611
#define IDM_CHART_AREA 1612
#define IDM_CHART_BAR 1613
#define IDM_CHART_COLUMN 1614
#define IDM_CHART_PIE 1615
#define IDM_CHART_LEGEND 1621
#define IDM_CHART_TITLES 1622
#define IDM_CHART_PROPERTIES 1623
#define IDM_CHART_COPY 1624
#define IDM_CHART_ZOOM_25 1631
#define IDM_CHART_ZOOM_50 1632
#define IDM_CHART_ZOOM_100 1633
#define IDM_CHART_ZOOM_200 1634
#define IDM_CHART_OPTION_FIRST 1641
#define IDM_CHART_HORIZONTAL_GRID 1641
#define IDM_CHART_VERTICAL_GRID 1642
#define IDM_CHART_X_TICKS 1643
#define IDM_CHART_Y_TICKS 1644
#define IDM_CHART_TITLE 1645
#define IDM_CHART_X_LABELS 1646
#define IDM_CHART_Y_LABELS 1647
#define IDM_CHART_X_TITLE 1648
#define IDM_CHART_Y_TITLE 1649
#define IDM_CHART_PERCENTAGES 1650
#define IDM_CHART_OPTION_LAST 1650
#define IDM_CHART_BACKGROUND_WHITE 1661
#define IDM_CHART_BACKGROUND_YELLOW 1662
#define IDM_CHART_BACKGROUND_GREY 1663
#define IDM_CHART_BACKGROUND_CHOOSE 1664
#define IDM_CHART_RANGE_AUTOMATIC 1671
#define IDM_CHART_RANGE_FIX 1672
#define IDM_CHART_RANGE_EDIT 1673
#define IDM_CHART_LIVE_OFF 1681
#define IDM_CHART_LIVE_SWEEP 1682
#define IDM_CHART_LIVE_REPLACE 1683
#define IDM_CHART_LAST 1683

#endif
