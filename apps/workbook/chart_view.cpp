#include "chart_view.h"

#include <korcontrols/graph.h>

#include <algorithm>
#include <array>
#include <cmath>
#include <optional>
#include <utility>
#include <vector>

#include "workbook.h"

namespace workbook {

namespace {

constexpr std::array<double, 4> kZoomFactors = {0.25, 0.5, 1, 2};

// What a label takes, in pixels.
constexpr size_t kCharacterWidth = 7;
constexpr size_t kLabelGap = 12;
constexpr size_t kLabelHeight = 15;

constexpr const wchar_t* kNothingToChart = L"There are no numbers to chart";

std::wstring WithoutExtension(const std::wstring& name) { return name.substr(0, name.rfind(L'.')); }

// The titles that the sheet suggests.
ChartTitles TitlesOfSheet(const Workbook& workbook) {
    const ChartData& data = workbook.chart.data;
    if (data.series.empty()) return {kNothingToChart, L"", L""};
    return {WithoutExtension(workbook.document().name()), data.categoryTitle,
            data.series.size() == 1 ? data.series.front().name : L""};
}

// `number` counts from 0.
GraphSeriesData AsGraphSeries(const ChartSeries& series, size_t number) {
    return {static_cast<LONG>(series.values.size()), series.name.c_str(), series.values.data(),
            static_cast<LONG>(number)};
}

size_t LongestOf(const std::vector<std::wstring>& texts) {
    size_t longest = 0;
    for (const std::wstring& text : texts) longest = std::max(longest, text.size());
    return longest;
}

// How far apart labels must be to have room beside each other. The chart draws every one. In a pie
// they are the legend's, which lists all.
size_t LabelStep(const Chart& chart) {
    const LONG type = KorGraph_GetType(chart.graph);
    if (type == KORGRAPH_PIE) return 1;
    RECT area = {};
    GetClientRect(chart.graph, &area);
    const bool isBar = type == KORGRAPH_BAR;
    const size_t needed =
        isBar ? kLabelHeight : kLabelGap + kCharacterWidth * LongestOf(chart.data.categories);
    const double room = (isBar ? area.bottom : area.right) *
                        kZoomFactors[static_cast<size_t>(KorGraph_GetZoom(chart.graph))];
    const double wanted = static_cast<double>(chart.data.categories.size() * needed);
    return std::max(size_t{1}, static_cast<size_t>(std::ceil(wanted / std::max(room, 1.0))));
}

void HandOverEverything(const Workbook& workbook) {
    const Chart& chart = workbook.chart;
    KorGraph_Clear(chart.graph);
    for (size_t i = 0; i < chart.data.series.size(); ++i) {
        const GraphSeriesData series = AsGraphSeries(chart.data.series[i], i);
        KorGraph_AddSeries(chart.graph, &series);
    }
    ApplyCategories(workbook);
    ApplyTitles(workbook);
    ApplyRange(workbook);
}

// Where two equally long lists differ: the first place, and whether it is the only one. A place
// behind the end means nowhere.
struct Difference {
    size_t first = 0;
    bool isOnlyOne = false;
};

Difference Compare(const std::vector<double>& before, const std::vector<double>& after) {
    const auto [old, now] = std::ranges::mismatch(before, after);
    const bool isAnywhere = old != before.end();
    return {static_cast<size_t>(old - before.begin()),
            isAnywhere && std::equal(old + 1, before.end(), now + 1)};
}

// One value goes over by itself, several as the whole series. A pie takes the whole series anyway:
// for a single value it need not add up its shares anew.
void HandOverChanges(HWND graph, const ChartData& before, const ChartData& after) {
    const bool isPie = KorGraph_GetType(graph) == KORGRAPH_PIE;
    for (size_t i = 0; i < after.series.size(); ++i) {
        const ChartSeries& now = after.series[i];
        const Difference difference = Compare(before.series[i].values, now.values);
        if (difference.first == now.values.size()) continue;
        if (difference.isOnlyOne && !isPie) {
            KorGraph_SetValue(graph, static_cast<LONG>(i), static_cast<LONG>(difference.first),
                              now.values[difference.first]);
        } else {
            const GraphSeriesData series = AsGraphSeries(now, i);
            KorGraph_ReplaceSeries(graph, &series);
        }
    }
}

void ApplyAxis(HWND graph, LONG axis, const std::optional<ValueRange>& range) {
    if (range) {
        KorGraph_SetRange(graph, axis, range->low, range->high);
    } else {
        KorGraph_AutoRange(graph, axis);
    }
}

}  // namespace

void ChartBlockOf(Workbook& workbook, const Block& selection) {
    workbook.sheetView().chart = {};
    workbook.sheetView().chart.block = ChartedBlock(workbook.sheet(), selection);
    ShowChartOfSheet(workbook);
}

void ShowChartOfSheet(Workbook& workbook) {
    Chart& chart = workbook.chart;
    if (!chart.isShown) return;
    const Sheet& sheet = workbook.sheet();
    std::optional<Block>& block = workbook.sheetView().chart.block;
    if (!block) block = ChartedBlock(sheet, BlockOf({0, 0}));
    chart.data = ReadChartData(sheet, *block);
    chart.isStale = false;
    workbook.panel.isStale = true;  // it shows the series' colours
    HandOverEverything(workbook);
    DrawChart(workbook);
}

void RefreshChart(Workbook& workbook) {
    Chart& chart = workbook.chart;
    const std::optional<Block>& block = workbook.sheetView().chart.block;
    if (!chart.isStale || !chart.isShown || !block) return;
    chart.isStale = false;
    ChartData now = ReadChartData(workbook.sheet(), *block);
    const ChartData before = std::exchange(chart.data, std::move(now));
    // Automatic ranges follow the values that series are added with, not those set later.
    const bool hasSameRange = ValuesOf(before) == ValuesOf(chart.data);
    if (HaveSameShape(before, chart.data) && hasSameRange) {
        HandOverChanges(chart.graph, before, chart.data);
    } else {
        HandOverEverything(workbook);
    }
    DrawChart(workbook);
}

// Labels replace what was there, so handing over none removes the old ones. Those left out are
// null.
void ApplyCategories(const Workbook& workbook) {
    const Chart& chart = workbook.chart;
    const std::vector<std::wstring>& categories = chart.data.categories;
    const size_t step = LabelStep(chart);
    std::vector<const wchar_t*> labels(categories.size());
    for (size_t i = 0; i < labels.size(); i += step) labels[i] = categories[i].c_str();
    KorGraph_SetCategories(chart.graph, static_cast<LONG>(labels.size()), labels.data());
}

// The chart trades the titles of its axes when it becomes a bar chart, and no longer one.
void ApplyTitles(const Workbook& workbook) {
    const Chart& chart = workbook.chart;
    const ChartTitles titles = ShownTitles(workbook);
    const bool isBar = ValueAxis(workbook) == KORGRAPH_X;
    KorGraph_SetTitle(chart.graph, titles.chart.c_str());
    KorGraph_SetXTitle(chart.graph, (isBar ? titles.values : titles.categories).c_str());
    KorGraph_SetYTitle(chart.graph, (isBar ? titles.categories : titles.values).c_str());
}

void ApplyRange(const Workbook& workbook) {
    const LONG valueAxis = ValueAxis(workbook);
    ApplyAxis(workbook.chart.graph, valueAxis, workbook.sheetView().chart.values);
    ApplyAxis(workbook.chart.graph, OtherAxis(valueAxis), workbook.sheetView().chart.positions);
}

ChartTitles ShownTitles(const Workbook& workbook) {
    return workbook.sheetView().chart.titles.value_or(TitlesOfSheet(workbook));
}

ValueRange ShownRange(const Workbook& workbook, LONG axis) {
    GraphRange range = {axis, 0, 0, 0};
    SendMessageW(workbook.chart.graph, GM_GETRANGE, 0, reinterpret_cast<LPARAM>(&range));
    return {range.min, range.max};
}

void DrawChart(const Workbook& workbook) {
    KorGraph_Redraw(workbook.chart.graph);
    RedrawWindow(workbook.chart.graph, nullptr, nullptr, RDW_INVALIDATE | RDW_ALLCHILDREN);
}

LONG ValueAxis(const Workbook& workbook) {
    return KorGraph_GetType(workbook.chart.graph) == KORGRAPH_BAR ? KORGRAPH_X : KORGRAPH_Y;
}

LONG OtherAxis(LONG axis) { return axis == KORGRAPH_X ? KORGRAPH_Y : KORGRAPH_X; }

}  // namespace workbook
