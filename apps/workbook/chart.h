// What the program knows about its chart view. The chart itself is asked for its type, zoom and
// options; what is charted belongs to the sheet (see ChartChoice).
#pragma once

#include <windows.h>

#include "chart_data.h"

namespace workbook {

struct LiveDemonstration {
    bool isRunning = false;
    LONG mode = 0;  // KORGRAPH_SWEEP or KORGRAPH_REPLACE
    int step = 0;
};

// The bar belongs to the main window, the combo boxes to the bar.
struct ChartBar {
    HWND window = nullptr;
    HWND zoom = nullptr;
    HWND type = nullptr;
};

struct Chart {
    ChartBar bar;
    HWND pane = nullptr;  // borderless, so that the tooltip is placed right: see chart_pane.h
    HWND graph = nullptr;
    HWND livePane = nullptr;  // in the pane, shown while the demonstration runs
    HWND liveGraph = nullptr;

    bool isShown = false;
    bool isStale = false;  // the sheet was edited; brought up to date when no message waits
    ChartData data;        // as the chart has it
    COLORREF background = RGB(255, 255, 255);
    LiveDemonstration live;
};

}  // namespace workbook
