// The chart: each type, live mode, zoom and settings; its legend and its tooltip.
#include "faults/chart.h"
#include "faults/scenarios.h"

#include "support/input.h"

#include <algorithm>

namespace kortest {

namespace {

const std::initializer_list<const char*> kMemory = {"LocalAlloc", "malloc"};

// Presses at some places and lets the tooltip show what it finds there.
void Tap(const Life& life, HWND chart, int x, int y) {
    PressAt(chart, x, y);
    Paint(GetDlgItem(life.parent(), KORTOOLTIP_ID));
    ReleaseAt(chart, x, y);
}

void LiveChartOfType(Life& life, LONG type) {
    life.count(false);
    const HWND chart = CreateChart(life);
    AddSeries(life, chart, {3, -1, 2}, L"one");
    AddSeries(life, chart, {1, 4, 5}, nullptr);
    SetCategories(life, chart, {L"a", nullptr, L"c"});
    KorGraph_SetTitle(chart, L"title");
    KorGraph_SetXTitle(chart, L"along");
    KorGraph_SetYTitle(chart, L"up");
    KorGraph_SetType(chart, type == KORGRAPH_LINE ? KORGRAPH_PIE : KORGRAPH_LINE);
    life.host->pump();
    life.count(true);
    KorGraph_SetType(chart, type);
    Tap(life, chart, 75, 60);
    Tap(life, chart, 60, 80);
    EndChart(life, chart);
}

}  // namespace

HWND CreateChart(Life& life, int width, int height) {
    StandInForPrinting(life);
    if (!IsClassRegistered(KORGRAPH_CLASS)) {
        // It is tried once: later calls answer 1.
        life.statedNot("RegisterGraphControl", 0, {"RegisterClassW"}, [] {
            return static_cast<LRESULT>(RegisterGraphControl(ProgramInstance()));
        });
    }
    const HWND chart =
        CreateControl(life, KORGRAPH_CLASS, WS_CLIPSIBLINGS | WS_CLIPCHILDREN, width, height);
    life.host->pump();
    return chart;
}

void EndChart(Life& life, HWND chart) {
    life.host->pump();
    if (chart) KorGraph_Redraw(chart);
    life.look(chart, "chart");
    if (chart) DestroyWindow(chart);
}

void AddSeries(Life& life, HWND chart, const std::vector<double>& values, const wchar_t* name) {
    if (!HasRecord(chart)) return;
    const GraphSeriesData data = {static_cast<LONG>(values.size()), name, values.data(), -1};
    life.stated("GM_ADDSERIES", 0, 1, kMemory, [&] {
        return SendMessageW(chart, GM_ADDSERIES, 0, reinterpret_cast<LPARAM>(&data));
    });
}

void SetCategories(Life& life, HWND chart, const std::vector<const wchar_t*>& labels) {
    if (!HasRecord(chart)) return;
    life.stated("GM_SETCATEGORIES", 0, 1, kMemory, [&] {
        return SendMessageW(chart, GM_SETCATEGORIES, labels.size(),
                            reinterpret_cast<LPARAM>(labels.data()));
    });
}

bool HasRecord(HWND chart) {
    LONG type = -1;
    SendMessageW(chart, GM_GETTYPE, 0, reinterpret_cast<LPARAM>(&type));
    return type != -1;
}

// What can be made of a chart whose creation has failed somewhere is then used in every way.
void LiveChartCreation(Life& life) {
    const HWND chart = CreateChart(life);
    life.count(false);
    AddSeries(life, chart, {3, -1, 2}, L"one");
    AddSeries(life, chart, {1, 4, 5}, nullptr);
    SetCategories(life, chart, {L"a", nullptr, L"c"});
    KorGraph_SetYTitle(chart, L"up");
    const RECT place = {20, 10, 110, 75};
    KorGraph_ShowLegend(chart, &place);
    Paint(GetDlgItem(chart, KORLEGEND_ID));
    for (LONG type = KORGRAPH_LINE; type <= KORGRAPH_PIE; ++type) KorGraph_SetType(chart, type);
    Tap(life, chart, 75, 60);
    KorGraph_SetType(chart, KORGRAPH_COLUMN);
    KorGraph_SetZoom(chart, KORGRAPH_ZOOM200);
    Tap(life, chart, 6, 50);
    KorGraph_Copy(chart);
    KorGraph_ToggleOptions(chart, KORGRAPH_LIVE);
    KorGraph_Notify(chart, GN_LIVEUPDATE, 4);
    EndChart(life, chart);
}

void LiveLineChart(Life& life) { LiveChartOfType(life, KORGRAPH_LINE); }
void LiveAreaChart(Life& life) { LiveChartOfType(life, KORGRAPH_AREA); }
void LiveBarChart(Life& life) { LiveChartOfType(life, KORGRAPH_BAR); }
void LiveColumnChart(Life& life) { LiveChartOfType(life, KORGRAPH_COLUMN); }
void LivePieChart(Life& life) { LiveChartOfType(life, KORGRAPH_PIE); }

// So many that the chart learns what a marker looks like and draws all of them as one area.
void LiveManyPoints(Life& life) {
    life.count(false);
    const HWND chart = CreateChart(life);
    KorGraph_ToggleOptions(chart, kAllOptions);
    std::vector<double> values;
    for (int i = 0; i < 700; ++i) values.push_back(i % 7 + i / 100);
    AddSeries(life, chart, values, nullptr);
    life.count(true);
    for (const LONG type : {KORGRAPH_LINE, KORGRAPH_AREA}) {
        KorGraph_SetType(chart, type);
        KorGraph_Redraw(chart);
    }
    life.count(false);
    EndChart(life, chart);
}

void LiveSweep(Life& life) {
    life.count(false);
    const HWND chart = CreateChart(life);
    KorGraph_ToggleOptions(chart, KORGRAPH_LIVE);
    KorGraph_SetRange(chart, KORGRAPH_X, 0, 6);
    KorGraph_SetRange(chart, KORGRAPH_Y, 0, 10);
    life.count(true);
    KorGraph_SetDataMode(chart, KORGRAPH_SWEEP);
    for (const LONG sample : {3, 5, 1, 8}) {
        KorGraph_Notify(chart, GN_LIVEUPDATE, sample);
        Paint(chart);
    }
    life.count(false);
    EndChart(life, chart);
}

void LiveReplacement(Life& life) {
    life.count(false);
    const HWND chart = CreateChart(life);
    life.count(true);
    KorGraph_ToggleOptions(chart, KORGRAPH_LIVE);
    AddSeries(life, chart, {3, 1, 2}, L"one");
    AddSeries(life, chart, {1, 4, 5}, nullptr);
    KorGraph_SetDataMode(chart, KORGRAPH_REPLACE);
    const double values[] = {2, 2, 4};
    for (const LONG series : {0, 1}) {
        const GraphSeriesData data = {3, nullptr, values, series};
        KorGraph_Notify(chart, GN_LIVEUPDATE, reinterpret_cast<LPARAM>(&data));
        Paint(chart);
    }
    life.count(false);
    EndChart(life, chart);
}

void LiveZoom(Life& life) {
    life.count(false);
    const HWND chart = CreateChart(life);
    AddSeries(life, chart, {3, 1, 2, 5, 4}, nullptr);
    life.count(true);
    KorGraph_SetZoom(chart, KORGRAPH_ZOOM200);
    for (const POINT arrow : {POINT{6, 50}, POINT{144, 50}, POINT{75, 6}, POINT{75, 94}})
        Tap(life, chart, arrow.x, arrow.y);
    KorGraph_SetZoom(chart, KORGRAPH_ZOOM50);
    life.count(false);
    EndChart(life, chart);
}

void LiveSettings(Life& life) {
    life.count(false);
    const HWND chart = CreateChart(life);
    life.count(true);
    AddSeries(life, chart, {3, 1, 2}, L"one");
    SetCategories(life, chart, {L"a", nullptr, L"c"});
    KorGraph_SetXTitle(chart, L"along");
    KorGraph_SetYTitle(chart, L"up");
    KorGraph_SetTitle(chart, L"first");
    KorGraph_SetTitle(chart, L"second");
    KorGraph_SetTitle(chart, nullptr);
    KorGraph_ToggleOptions(chart, KORGRAPH_XLABELS | KORGRAPH_HORIZONTALGRID);
    KorGraph_SetRange(chart, KORGRAPH_Y, -2, 7);
    KorGraph_SetValue(chart, 0, 1, 9);
    const double values[] = {4, 5};
    const GraphSeriesData data = {2, nullptr, values, 0};
    KorGraph_ReplaceSeries(chart, &data);
    KorGraph_AutoRange(chart, KORGRAPH_Y);
    KorGraph_Reset(chart, TRUE);
    AddSeries(life, chart, {1, 2}, nullptr);
    KorGraph_Clear(chart);
    ShowWindow(chart, SW_HIDE);
    ShowWindow(chart, SW_SHOW);
    KorGraph_SetBackgroundColour(chart, RGB(1, 2, 3));
    SetWindowPos(chart, nullptr, 0, 0, kChartWidth - 20, kChartHeight + 10, SWP_NOMOVE);
    life.count(false);
    EndChart(life, chart);
}

// ---- Children ---------------------------------------------------------------------------------

// The chart registers the class; the tip is then the host's own.
void LiveToolTip(Life& life) {
    life.count(false);
    const HWND chart = CreateChart(life, 20, 20);
    if (chart) DestroyWindow(chart);
    life.count(true);
    const HWND tip = CreateControl(life, KORTOOLTIP_CLASS, 0, 10, 10, 77);
    for (const wchar_t* text : {L"Value:4", L"two\nlines"}) {
        const ToolTipRequest request = {text, 40, 60, 200};
        KorToolTip_Show(tip, &request);
        life.look(tip, "tooltip");
    }
    KorToolTip_Hide(tip);
    if (tip) DestroyWindow(tip);
}

void LiveLegend(Life& life) {
    life.count(false);
    const HWND chart = CreateChart(life);
    KorGraph_ToggleOptions(chart, kAllOptions);
    AddSeries(life, chart, {3, 1}, L"one");
    AddSeries(life, chart, {1, 4}, L"two");
    AddSeries(life, chart, {2, 4}, nullptr);
    life.count(true);
    const RECT place = {20, 10, 110, 75};
    KorGraph_ShowLegend(chart, &place);
    const HWND legend = GetDlgItem(chart, KORLEGEND_ID);
    Paint(legend);
    SendMessageW(legend, WM_VSCROLL, SB_LINEDOWN, 0);
    life.look(legend, "legend");
    SendMessageW(legend, WM_VSCROLL, SB_TOP, 0);
    KorGraph_SetType(chart, KORGRAPH_PIE);
    if (legend) InvalidateRect(legend, nullptr, TRUE);
    life.look(legend, "legend of a pie");
    life.count(false);
    EndChart(life, chart);
}

}  // namespace kortest
