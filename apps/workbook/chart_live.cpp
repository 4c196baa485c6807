#include "chart_live.h"

#include <korcontrols/graph.h>

#include <array>
#include <cmath>

#include "chart_pane.h"
#include "workbook.h"

namespace workbook {

namespace {

constexpr UINT_PTR kTimer = 1;
constexpr UINT kInterval = 50;  // milliseconds
constexpr int kPoints = 120;
constexpr double kMiddle = 50;
constexpr double kHeight = 100;

using Samples = std::array<double, kPoints>;

// A wave with a slower one on top: something that looks measured, and is the same every time.
double SampleAt(int step) {
    return kMiddle + 30 * std::sin(step * 0.15) + 12 * std::sin(step * 0.047);
}

Samples SamplesFrom(int step) {
    Samples samples;
    for (int i = 0; i < kPoints; ++i) samples[static_cast<size_t>(i)] = SampleAt(step + i);
    return samples;
}

GraphSeriesData AsSeries(const Samples& samples) { return {kPoints, L"Sample", samples.data(), 0}; }

void SetOptions(HWND graph, DWORD options, bool on) {
    const DWORD wanted = on ? options : 0;
    KorGraph_ToggleOptions(graph, (KorGraph_GetOptions(graph) & options) ^ wanted);
}

// Live mode is turned on before the series is added, which needs room for its trace. Drawing comes
// before it as well: live steps draw over the picture there is, which is to be an empty plot. A
// sweep wipes the whole height as it goes, so what it would wipe out is left away.
void Prepare(HWND graph, LONG mode) {
    KorGraph_Reset(graph, TRUE);
    SetOptions(graph, KORGRAPH_LIVE, true);
    SetOptions(graph, KORGRAPH_TITLE | KORGRAPH_XLABELS, mode == KORGRAPH_REPLACE);
    KorGraph_SetDataMode(graph, mode);
    KorGraph_SetTitle(graph, L"Live data");
    KorGraph_SetRange(graph, KORGRAPH_X, 0, kPoints);
    KorGraph_SetRange(graph, KORGRAPH_Y, 0, kHeight);
    KorGraph_Redraw(graph);
    const Samples samples = SamplesFrom(0);
    const GraphSeriesData series = AsSeries(samples);
    KorGraph_AddSeries(graph, &series);
    InvalidateRect(graph, nullptr, FALSE);
}

void ShowLiveChart(Workbook& workbook, bool shown) {
    workbook.chart.live.isRunning = shown;
    ShowWindow(workbook.chart.livePane, shown ? SW_SHOW : SW_HIDE);
    LayOutChartPane(workbook);
}

}  // namespace

void StartLiveData(Workbook& workbook, LONG mode) {
    Chart& chart = workbook.chart;
    chart.live.mode = mode;
    chart.live.step = 0;
    ShowLiveChart(workbook, true);
    Prepare(chart.liveGraph, mode);
    SetTimer(chart.pane, kTimer, kInterval, nullptr);
}

void StopLiveData(Workbook& workbook) {
    KillTimer(workbook.chart.pane, kTimer);
    ShowLiveChart(workbook, false);
}

void OnLiveTimer(Workbook& workbook) {
    Chart& chart = workbook.chart;
    const int step = ++chart.live.step;
    if (chart.live.mode == KORGRAPH_SWEEP) {
        // A sample is a whole number.
        KorGraph_Notify(chart.liveGraph, GN_LIVEUPDATE, std::lround(SampleAt(step)));
    } else {
        const Samples samples = SamplesFrom(step);
        const GraphSeriesData series = AsSeries(samples);
        KorGraph_Notify(chart.liveGraph, GN_LIVEUPDATE, reinterpret_cast<LPARAM>(&series));
    }
    // Each step paints what is new since the last one, so none may be left out.
    UpdateWindow(chart.liveGraph);
}

}  // namespace workbook
