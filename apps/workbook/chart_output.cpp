#include "chart_output.h"

#include <windows.h>

#include <korcontrols/graph.h>

#include <optional>
#include <string>

#include "chart_view.h"
#include "equation_bar.h"
#include "workbook.h"

namespace workbook {

namespace {

std::wstring TitleOf(HWND graph, UINT message) {
    LPCWSTR text = nullptr;
    SendMessageW(graph, message, 0, reinterpret_cast<LPARAM>(&text));
    return text ? text : L"";
}

// The chart's axes are x and y, of which x has the values in a bar chart.
ChartTitles TitlesInChart(const Workbook& workbook) {
    const HWND graph = workbook.chart.graph;
    const std::wstring x = TitleOf(graph, GM_GETXTITLE);
    const std::wstring y = TitleOf(graph, GM_GETYTITLE);
    const bool isBar = ValueAxis(workbook) == KORGRAPH_X;
    return {TitleOf(graph, GM_GETTITLE), isBar ? y : x, isBar ? x : y};
}

struct Settings {
    ChartTitles titles;
    ValueRange values;
    ValueRange positions;
};

Settings SettingsInChart(const Workbook& workbook) {
    const LONG axis = ValueAxis(workbook);
    return {TitlesInChart(workbook), ShownRange(workbook, axis),
            ShownRange(workbook, OtherAxis(axis))};
}

// A range that was changed is one that the user has chosen, and no longer automatic.
void NoteChange(std::optional<ValueRange>& range, const ValueRange& before,
                const ValueRange& after) {
    if (before != after) range = after;
}

}  // namespace

void EditChartProperties(Workbook& workbook) {
    CommitTyping(workbook);
    const Settings before = SettingsInChart(workbook);
    KorGraph_ShowProperties(workbook.chart.graph);
    const Settings after = SettingsInChart(workbook);
    ChartChoice& choice = workbook.sheetView().chart;
    if (before.titles != after.titles) choice.titles = after.titles;
    NoteChange(choice.values, before.values, after.values);
    NoteChange(choice.positions, before.positions, after.positions);
    workbook.panel.isStale = true;
    // After a change of type the axes have traded places.
    ApplyCategories(workbook);
    ApplyTitles(workbook);
    ApplyRange(workbook);
    DrawChart(workbook);
}

void CopyChart(Workbook& workbook) { KorGraph_Copy(workbook.chart.graph); }

bool CanPrintChart(const Workbook& workbook) {
    return workbook.chart.isShown && IsPrintingAvailableForGraphControl() != 0;
}

void PrintChart(Workbook& workbook) {
    if (!CanPrintChart(workbook)) return;
    CommitTyping(workbook);
    KorGraph_Print(workbook.chart.graph);
    EnableWindow(workbook.chart.graph, TRUE);  // the chart stays disabled after printing
    DrawChart(workbook);
}

}  // namespace workbook
