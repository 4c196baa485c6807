// All that the program knows: its windows, the open sheets, and how they are shown.
#pragma once

#include <windows.h>

#include <korcontrols/grid.h>

#include <string>

#include "cell_styles.h"
#include "chart.h"
#include "open_sheets.h"
#include "side_panel.h"
#include "text_measure.h"

namespace workbook {

constexpr DWORD kFullZoom = 4;  // the grid counts zoom in quarters

// What the View menu shows with check marks. The grid starts out like this, and tells nobody when
// it changes, so whoever toggles something there toggles it here.
struct ViewOptions {
    bool headers = true;
    bool gridLines = true;
    bool horizontalScrollBar = true;
    bool verticalScrollBar = true;
    DWORD zoom = kFullZoom;
};

// What the window showed last, to notice what the grid changed without a notification: its headers
// and its corner button select silently.
struct ShownState {
    Block selection;
    bool statusIsStale = true;
    std::wstring
        notice;  // something to tell about the last edit, shown until the selection changes
};

// The last press in the cells, to extend the selection to it with Shift.
struct PressState {
    CellAddress origin;  // where an extended selection begins: the last cell chosen without Shift
    CellAddress pressed;
    bool dragged = false;
};

struct Workbook {
    HINSTANCE instance = nullptr;
    HWND window = nullptr;
    HWND grid = nullptr;
    HWND statusBar = nullptr;
    HWND sheetBar = nullptr;
    HACCEL keysAlways = nullptr;
    HACCEL keysInGrid = nullptr;

    OpenSheets sheets;
    CellStyles styles;
    TextMeasure measure;
    ViewOptions view;
    ShownState shown;
    PressState press;
    Chart chart;
    SidePanel panel;
    HIMAGELIST sheetImages = nullptr;  // of bar and tree
    int wheelDistance = 0;             // turned, but less than a notch so far
    bool isOutOfMemory = false;        // to be told when no message is being handled

    // Of the current sheet.
    Document& document() { return sheets.current().document; }
    const Document& document() const { return sheets.current().document; }
    const Sheet& sheet() const { return document().sheet(); }
    SheetView& sheetView() { return sheets.current().view; }
    const SheetView& sheetView() const { return sheets.current().view; }
};

}  // namespace workbook
