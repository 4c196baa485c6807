// Identifiers of the library's resources, shared by the sources and korcontrols.rc.
#pragma once

// ---- Strings: the command bar's tooltips, and a legend's caption ----

#define KOR_STRING_SHOWGRAPH 1
#define KOR_STRING_PROPERTIES 2
#define KOR_STRING_ZOOM 3
#define KOR_STRING_TYPE 4
#define KOR_STRING_LINE 5
#define KOR_STRING_BAR 6
#define KOR_STRING_COLUMN 7
#define KOR_STRING_PIE 8
#define KOR_STRING_LEGEND 9
#define KOR_STRING_SHOWGRID 10

// ---- Bitmaps ----

#define KOR_BITMAP_COMMANDBAR 105
#define KOR_BITMAP_ARROW 107

// ---- The property page "Titles" ----

#define KOR_DIALOG_TITLES 3000
#define KOR_EDIT_TITLE 1002
#define KOR_EDIT_XTITLE 1003
#define KOR_EDIT_YTITLE 1004

// ---- The property page "Data" ----

#define KOR_DIALOG_DATA 3001
#define KOR_EDIT_YMIN 1005
#define KOR_EDIT_YMAX 1006
#define KOR_EDIT_XMIN 1007
#define KOR_EDIT_XMAX 1008
#define KOR_COMBO_TYPE 1010
#define KOR_COMBO_ZOOM 1011

// ---- The dialog "Graph Print", which no code shows ----

#define KOR_DIALOG_PRINT 4050
#define KOR_BUTTON_CANCELPRINT 4060
