/* Numbers that the resources and the code share. They are stable: programs that drive the workbook
 * from outside send them as WM_COMMAND numbers and find its windows by them. */
#ifndef WORKBOOK_RESOURCE_H
#define WORKBOOK_RESOURCE_H

/* Child windows of the main window. All stay below 3425, the first of the grid's codes in
 * WM_NOTIFY, so that a status bar's notification is never taken for the grid's. */
#define IDC_GRID 101
#define IDC_STATUS 102

/* Resources. */
#define IDR_MENU 200
#define IDR_KEYS_ALWAYS 201 /* accelerators that work everywhere in the window */
#define IDR_KEYS_GRID 202   /* accelerators that the equation bar keeps for its text */
#define IDD_GOTO 210
#define IDC_GOTO_ADDRESS 211
#define IDD_KEYS 220

/* File. */
#define IDM_FILE_NEW 1001
#define IDM_FILE_OPEN 1002
#define IDM_FILE_SAVE 1003
#define IDM_FILE_SAVE_AS 1004
#define IDM_FILE_EXIT 1005

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

/* Help. */
#define IDM_HELP_KEYS 1301
#define IDM_HELP_ABOUT 1302

/* What the grid posts when "fx" is pressed, and the entries of the menu that answers it. */
#define IDM_FUNCTIONS 1401
#define IDM_FUNCTION_FIRST 1500
#define IDM_FUNCTION_LAST 1599

#endif
