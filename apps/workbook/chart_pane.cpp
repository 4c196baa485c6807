#include "chart_pane.h"

#include <korcontrols/graph.h>
#include <korcontrols/legend.h>
#include <korcontrols/tooltip.h>

#include <algorithm>

#include "chart_live.h"
#include "chart_view.h"
#include "pane_class.h"
#include "resource.h"
#include "workbook.h"

namespace workbook {

namespace {

constexpr const wchar_t* kPaneClass = L"korcontrols Workbook Chart Pane";
constexpr int kPanePercent = 45;
constexpr int kChartPercent = 60;  // of the height, with the live chart below
constexpr int kEdge = 2;           // between grid and chart

constexpr int kLegendWidth = 130;
constexpr int kLegendHeight = 120;
constexpr int kLegendTop = 24;  // below the title
constexpr int kLegendGap = 6;

RECT ClientOf(HWND window) {
    RECT area = {};
    GetClientRect(window, &area);
    return area;
}

HWND LegendOf(const Chart& chart) { return GetDlgItem(chart.graph, KORLEGEND_ID); }

// Where the legend stands when it is shown first: at the right, below the title.
RECT LegendPlace(const Chart& chart) {
    const RECT area = ClientOf(chart.graph);
    const LONG width = std::min<LONG>(kLegendWidth, area.right / 2);
    const LONG left = area.right - width - kLegendGap;
    return {left, kLegendTop, left + width, kLegendTop + kLegendHeight};
}

void PlaceLegend(const Chart& chart) {
    const HWND legend = LegendOf(chart);
    if (!legend) return;
    const RECT place = LegendPlace(chart);
    SetWindowPos(legend, nullptr, place.left, place.top, 0, 0, SWP_NOSIZE | SWP_NOZORDER);
}

HWND CreateChild(const Workbook& workbook, const wchar_t* windowClass, HWND parent, int id,
                 DWORD style) {
    return CreateWindowExW(0, windowClass, nullptr, WS_CHILD | WS_CLIPCHILDREN | style, 0, 0, 0, 0,
                           parent, reinterpret_cast<HMENU>(INT_PTR{id}), workbook.instance,
                           nullptr);
}

LRESULT Dispatch(Workbook& workbook, UINT message, WPARAM wParam, LPARAM lParam) {
    switch (message) {
    case WM_SIZE: LayOutChartPane(workbook); return 0;
    case WM_TIMER: OnLiveTimer(workbook); return 0;
    case WM_SETCURSOR:
        // Charts have no pointer shape of their own.
        if (LOWORD(lParam) != HTCLIENT) break;
        SetCursor(LoadCursorW(nullptr, IDC_ARROW));
        return TRUE;
    default: break;
    }
    return DefWindowProcW(workbook.chart.pane, message, wParam, lParam);
}

void KeepInPane(HWND pane, HWND tooltip) {
    RECT place = {};
    GetWindowRect(tooltip, &place);
    MapWindowPoints(nullptr, pane, reinterpret_cast<POINT*>(&place), 2);
    const LONG beyond = place.right - ClientOf(pane).right;
    if (beyond <= 0) return;
    SetWindowPos(tooltip, nullptr, std::max(0L, place.left - beyond), place.top, 0, 0,
                 SWP_NOSIZE | SWP_NOZORDER);
}

}  // namespace

bool CreateChartPane(Workbook& workbook) {
    if (!RegisterGraphControl(workbook.instance) ||
        !RegisterPaneClass(workbook.instance, kPaneClass, PaneProc<Dispatch>)) {
        return false;
    }
    Chart& chart = workbook.chart;
    const LPCWSTR graphClass = GetGraphControlClassName();
    chart.pane = CreateChild(workbook, kPaneClass, workbook.window, IDC_CHART_PANE, 0);
    // A chart must not paint over the tooltip, a sibling, nor over the legend, a child.
    chart.graph = CreateChild(workbook, graphClass, chart.pane, IDC_CHART, WS_CLIPSIBLINGS);
    // Hiding the live chart itself would change the tool bar's tooltip, which is about the other
    // chart; hiding its pane does not.
    chart.livePane = CreateChild(workbook, kPaneClass, chart.pane, IDC_LIVE_PANE, 0);
    chart.liveGraph = CreateChild(workbook, graphClass, chart.livePane, IDC_LIVE_CHART,
                                  WS_CLIPSIBLINGS | WS_VISIBLE);
    SetWindowLongPtrW(chart.pane, GWLP_USERDATA, reinterpret_cast<LONG_PTR>(&workbook));
    return chart.pane && chart.graph && chart.liveGraph;
}

int ChartPaneWidth(const Workbook& workbook, int windowWidth) {
    return workbook.chart.isShown ? windowWidth * kPanePercent / 100 : 0;
}

void LayOutChartPane(const Workbook& workbook) {
    const Chart& chart = workbook.chart;
    const RECT area = ClientOf(chart.pane);
    const int width = std::max(0, static_cast<int>(area.right) - kEdge);
    const int height = static_cast<int>(area.bottom);
    const int chartHeight = chart.live.isRunning ? height * kChartPercent / 100 : height;
    MoveWindow(chart.graph, kEdge, 0, width, chartHeight, TRUE);
    const int liveTop = chartHeight + kEdge;
    const int liveHeight = std::max(0, height - liveTop);
    MoveWindow(chart.livePane, kEdge, liveTop, width, liveHeight, TRUE);
    MoveWindow(chart.liveGraph, 0, 0, width, liveHeight, TRUE);
    PlaceLegend(chart);
    ApplyCategories(workbook);
    DrawChart(workbook);
}

bool IsLegendShown(const Workbook& workbook) {
    const HWND legend = LegendOf(workbook.chart);
    return legend && (GetWindowLongPtrW(legend, GWL_STYLE) & WS_VISIBLE);
}

// The chart makes its legend once; afterwards it is an ordinary window.
void ToggleLegend(Workbook& workbook) {
    const Chart& chart = workbook.chart;
    const HWND legend = LegendOf(chart);
    if (legend) {
        ShowWindow(legend, IsLegendShown(workbook) ? SW_HIDE : SW_SHOW);
        return;
    }
    const RECT place = LegendPlace(chart);
    KorGraph_ShowLegend(chart.graph, &place);
}

void KeepTooltipsInPane(const Workbook& workbook) {
    for (const HWND pane : {workbook.chart.pane, workbook.chart.livePane}) {
        const HWND tooltip = GetDlgItem(pane, KORTOOLTIP_ID);
        if (tooltip && IsWindowVisible(tooltip)) KeepInPane(pane, tooltip);
    }
}

}  // namespace workbook
