#include "chart_commands.h"

#include <commdlg.h>
#include <korcontrols/graph.h>

#include <array>

#include "chart_dialogs.h"
#include "chart_live.h"
#include "chart_output.h"
#include "chart_pane.h"
#include "chart_view.h"
#include "equation_bar.h"
#include "menu_marks.h"
#include "resource.h"
#include "selection.h"
#include "view_commands.h"
#include "workbook.h"
#include "workbook_window.h"

namespace workbook {

namespace {

struct Background {
    UINT command;
    COLORREF colour;
};

constexpr std::array<Background, 3> kBackgrounds = {
    {{IDM_CHART_BACKGROUND_WHITE, RGB(255, 255, 255)},
     {IDM_CHART_BACKGROUND_YELLOW, RGB(255, 255, 224)},
     {IDM_CHART_BACKGROUND_GREY, RGB(224, 224, 224)}}};

bool IsBetween(UINT command, UINT first, UINT last) { return first <= command && command <= last; }

// The chart counts its options in bits, the menu in numbers.
constexpr DWORD OptionOf(UINT command) { return DWORD{1} << (command - IDM_CHART_OPTION_FIRST); }

void ShowPane(Workbook& workbook, bool shown) {
    workbook.panel.isStale = true;
    workbook.chart.isShown = shown;
    LayOutWindow(workbook);
    ShowWindow(workbook.chart.pane, shown ? SW_SHOW : SW_HIDE);
    // The chart's own visibility chooses the bar's tooltip, "Show Grid" or "Show Graph".
    ShowWindow(workbook.chart.graph, shown ? SW_SHOW : SW_HIDE);
    UpdateScrollRanges(workbook);
}

void ChartSelection(Workbook& workbook) {
    CommitTyping(workbook);
    if (!workbook.chart.isShown) ShowPane(workbook, true);
    ChartBlockOf(workbook, SelectedBlock());
}

// With a single cell selected the chart comes back as it was.
void ToggleChart(Workbook& workbook) {
    if (workbook.chart.isShown) {
        StopLiveData(workbook);
        return ShowPane(workbook, false);
    }
    if (SelectedBlock() != BlockOf(CurrentCell())) return ChartSelection(workbook);
    CommitTyping(workbook);
    ShowPane(workbook, true);
    ShowChartOfSheet(workbook);
}

// Titles and ranges belong to values and categories, the chart's to x and y.
void SetType(Workbook& workbook, LONG type) {
    workbook.panel.isStale = true;
    KorGraph_SetType(workbook.chart.graph, type);
    ApplyCategories(workbook);
    ApplyTitles(workbook);
    ApplyRange(workbook);
    DrawChart(workbook);
}

void SetZoomStep(Workbook& workbook, LONG zoomIndex) {
    KorGraph_SetZoom(workbook.chart.graph, zoomIndex);
    ApplyCategories(workbook);
    DrawChart(workbook);
}

void ToggleOption(Workbook& workbook, DWORD option) {
    KorGraph_ToggleOptions(workbook.chart.graph, option);
    DrawChart(workbook);
}

void SetBackground(Workbook& workbook, COLORREF colour) {
    workbook.chart.background = colour;
    KorGraph_SetBackgroundColour(workbook.chart.graph, colour);
    DrawChart(workbook);
}

void ChooseBackground(Workbook& workbook) {
    static std::array<COLORREF, 16> customColours = {};
    CHOOSECOLORW dialog = {};
    dialog.lStructSize = sizeof dialog;
    dialog.hwndOwner = workbook.window;
    dialog.rgbResult = workbook.chart.background;
    dialog.lpCustColors = customColours.data();
    dialog.Flags = CC_RGBINIT | CC_FULLOPEN;
    if (ChooseColorW(&dialog)) SetBackground(workbook, dialog.rgbResult);
}

void SetChartRange(Workbook& workbook, const std::optional<ValueRange>& range) {
    workbook.sheetView().chart.values = range;
    ApplyRange(workbook);
    DrawChart(workbook);
}

UINT BackgroundCommand(COLORREF colour) {
    for (const Background& each : kBackgrounds) {
        if (each.colour == colour) return each.command;
    }
    return IDM_CHART_BACKGROUND_CHOOSE;
}

void RunBackgroundCommand(Workbook& workbook, UINT command) {
    for (const Background& each : kBackgrounds) {
        if (each.command == command) return SetBackground(workbook, each.colour);
    }
    ChooseBackground(workbook);
}

UINT LiveCommand(const LiveDemonstration& live) {
    if (!live.isRunning) return IDM_CHART_LIVE_OFF;
    return live.mode == KORGRAPH_SWEEP ? IDM_CHART_LIVE_SWEEP : IDM_CHART_LIVE_REPLACE;
}

void MarkOne(HMENU menu, UINT first, UINT last, UINT marked) {
    CheckMenuRadioItem(menu, first, last, marked, MF_BYCOMMAND);
}

// Greys what is about a chart while there is none to see.
void EnableAll(HMENU menu, bool enabled) {
    for (UINT command = IDM_CHART_LINE; command <= IDM_CHART_LAST; ++command) {
        Enable(menu, command, enabled);
    }
}

}  // namespace

void RunChartCommand(Workbook& workbook, UINT command) {
    const auto place = [&](UINT first) { return static_cast<LONG>(command - first); };
    if (command == IDM_CHART_SHOW) return ToggleChart(workbook);
    if (command == IDM_CHART_SELECTION) return ChartSelection(workbook);
    if (!workbook.chart.isShown) return;
    if (IsBetween(command, IDM_CHART_LINE, IDM_CHART_PIE)) {
        return SetType(workbook, place(IDM_CHART_LINE));
    }
    if (IsBetween(command, IDM_CHART_ZOOM_25, IDM_CHART_ZOOM_200)) {
        return SetZoomStep(workbook, place(IDM_CHART_ZOOM_25));
    }
    if (IsBetween(command, IDM_CHART_OPTION_FIRST, IDM_CHART_OPTION_LAST)) {
        return ToggleOption(workbook, OptionOf(command));
    }
    if (IsBetween(command, IDM_CHART_BACKGROUND_WHITE, IDM_CHART_BACKGROUND_CHOOSE)) {
        return RunBackgroundCommand(workbook, command);
    }
    switch (command) {
    case IDM_CHART_LEGEND: return ToggleLegend(workbook);
    case IDM_CHART_TITLES: return EditChartTitles(workbook);
    case IDM_CHART_PROPERTIES: return EditChartProperties(workbook);
    case IDM_CHART_COPY: return CopyChart(workbook);
    case IDM_CHART_RANGE_AUTOMATIC: return SetChartRange(workbook, std::nullopt);
    case IDM_CHART_RANGE_FIX:
        return SetChartRange(workbook, ShownRange(workbook, ValueAxis(workbook)));
    case IDM_CHART_RANGE_EDIT: return EditChartRange(workbook);
    case IDM_CHART_LIVE_OFF: return StopLiveData(workbook);
    case IDM_CHART_LIVE_SWEEP: return StartLiveData(workbook, KORGRAPH_SWEEP);
    case IDM_CHART_LIVE_REPLACE: return StartLiveData(workbook, KORGRAPH_REPLACE);
    default: return;
    }
}

void PrepareChartMenu(const Workbook& workbook, HMENU menu) {
    const Chart& chart = workbook.chart;
    Check(menu, IDM_CHART_SHOW, chart.isShown);
    EnableAll(menu, chart.isShown);
    MarkOne(menu, IDM_CHART_LINE, IDM_CHART_PIE,
            IDM_CHART_LINE + static_cast<UINT>(KorGraph_GetType(chart.graph)));
    MarkOne(menu, IDM_CHART_ZOOM_25, IDM_CHART_ZOOM_200,
            IDM_CHART_ZOOM_25 + static_cast<UINT>(KorGraph_GetZoom(chart.graph)));
    const DWORD options = KorGraph_GetOptions(chart.graph);
    for (UINT command = IDM_CHART_OPTION_FIRST; command <= IDM_CHART_OPTION_LAST; ++command) {
        Check(menu, command, (options & OptionOf(command)) != 0);
    }
    MarkOne(menu, IDM_CHART_BACKGROUND_WHITE, IDM_CHART_BACKGROUND_CHOOSE,
            BackgroundCommand(chart.background));
    Check(menu, IDM_CHART_LEGEND, IsLegendShown(workbook));
    Check(menu, IDM_CHART_RANGE_AUTOMATIC, !workbook.sheetView().chart.values);
    MarkOne(menu, IDM_CHART_LIVE_OFF, IDM_CHART_LIVE_REPLACE, LiveCommand(chart.live));
}

}  // namespace workbook
