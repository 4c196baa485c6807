// What the program knows about its chart view. The chart itself is asked for its type, zoom and
// options.
#pragma once

#include <windows.h>

#include <optional>
#include <string>

#include "chart_data.h"

namespace workbook {

struct ChartTitles {
    std::wstring chart;
    std::wstring categories;
    std::wstring values;
};

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
    Block block;
    ChartData data;                     // as the chart has it
    std::optional<ChartTitles> titles;  // chosen by the user; otherwise they follow the sheet
    std::optional<ValueRange> range;    // fixed by the user; otherwise automatic
    COLORREF background = RGB(255, 255, 255);
    LiveDemonstration live;
};

}  // namespace workbook
