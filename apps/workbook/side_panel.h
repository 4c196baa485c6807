// The panel at the left: a tree of the open sheets with their columns, and below it a list with
// statistics of the current sheet's columns.
#pragma once

#include <windows.h>

#include <commctrl.h>

#include <set>
#include <string>
#include <vector>

#include "model/column_statistics.h"

namespace workbook {

struct OpenSheet;
struct Workbook;

// A row of the list.
struct ColumnEntry {
    int column = 0;
    LONG image = 0;
    ColumnStatistics statistics;

    friend bool operator==(const ColumnEntry&, const ColumnEntry&) = default;
};

struct TreeColumn {
    std::wstring text;
    LONG image = 0;

    friend bool operator==(const TreeColumn&, const TreeColumn&) = default;
};

// A sheet as the tree shows it.
struct TreeSheet {
    const OpenSheet* sheet = nullptr;  // to know it again; it may be gone
    std::wstring name;
    LONG image = 0;
    std::vector<TreeColumn> columns;

    friend bool operator==(const TreeSheet&, const TreeSheet&) = default;
};

struct SidePanel {
    HWND window = nullptr;
    HWND tree = nullptr;
    HWND list = nullptr;
    int width = 250;

    bool isShown = false;
    bool isStale = false;    // brought up to date when no message waits
    bool isFilling = false;  // what is selected meanwhile is not the user's choice
    std::vector<TreeSheet> sheets;
    std::vector<ColumnEntry> entries;
    std::vector<COLORREF> seriesColours;  // of the list's images
    std::set<int> hidden;                 // columns that were removed from the list
    const OpenSheet* listedSheet = nullptr;
};

//   result  whether the panel exists
bool CreateSidePanel(Workbook& workbook);

// Before the window goes: frees what the list's rows and the images hold.
void DestroySidePanel(Workbook& workbook);

void ToggleSidePanel(Workbook& workbook);

// How wide the panel is to be; 0 while it is hidden.
int SidePanelWidth(const Workbook& workbook, int windowWidth);

// To be called when no message waits.
void RefreshSidePanel(Workbook& workbook);

// Whether the window is the panel's tree, list or one of their children.
bool IsInSidePanel(const Workbook& workbook, HWND window);

// F6: from the sheet to the tree, to the list, and back.
void StepFocus(Workbook& workbook);

}  // namespace workbook
