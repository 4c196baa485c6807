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

struct Chart {
    HWND pane = nullptr;  // borderless, so that the tooltip is placed right: see chart_pane.h
    HWND graph = nullptr;
    HWND liveGraph = nullptr;  // shown while the demonstration runs

    bool isShown = false;
    bool isStale = false;  // the sheet was edited; brought up to date when no message waits
    ChartData data;        // as the chart has it
    COLORREF background = RGB(255, 255, 255);
    LiveDemonstration live;
};

}  // namespace workbook
