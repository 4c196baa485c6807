#include "storms/pictures.h"

#include "graph/data/record.h"
#include "graph/pictures/chart_pair.h"
#include "literal_chart/literal_chart.h"
#include "storms/failure.h"
#include "storms/stage.h"

#include <algorithm>
#include <cmath>

namespace kortest {
namespace {

constexpr int kLargestSide = 400;
constexpr double kLargestValue = 1e6;
constexpr int kMostPoints = 400;

int compared = 0;

bool IsPlain(double value) { return std::isfinite(value) && std::fabs(value) <= kLargestValue; }

bool IsPlainRange(double low, double high) {
    return IsPlain(low) && IsPlain(high) && high - low >= 1e-3;
}

bool IsPlainSeries(const kor::GraphSeries& series) {
    return series.pointCount <= kMostPoints &&
           std::all_of(series.values, series.values + series.pointCount, IsPlain);
}

bool CanBeDrawn(const kor::GraphRecord& graph) {
    if (!graph.hdcMem || !graph.hbmMem || graph.chartType < 0 || graph.chartType >= kor::kPie) {
        return false;
    }
    if (graph.options & KORGRAPH_LIVE || graph.printing != kor::PrintState::none) return false;
    if (graph.rcPlot.right < 1 || graph.rcPlot.right > kLargestSide || graph.rcPlot.bottom < 1 ||
        graph.rcPlot.bottom > kLargestSide) {
        return false;
    }
    if (!IsPlainRange(graph.xMin, graph.xMax) || !IsPlainRange(graph.yMin, graph.yMax)) {
        return false;
    }
    return std::all_of(graph.series, graph.series + graph.seriesCount,
                       [](const kor::GraphSeries* series) { return IsPlainSeries(*series); });
}

std::wstring TextOrNone(const wchar_t* text) { return text ? text : L""; }

// The same state told to the tests' own account of a chart.
void Tell(ChartState& state, const kor::GraphRecord& graph) {
    for (int i = 0; i < graph.seriesCount; ++i) {
        const kor::GraphSeries& series = *graph.series[i];
        state.series.push_back({{series.values, series.values + series.pointCount}, series.colour});
    }
    state.type = graph.chartType;
    state.background = graph.crBack;
    state.labelMaxWidth = graph.labelMaxWidth;
    state.options = graph.options;
    state.title = TextOrNone(graph.title);
    state.xTitle = TextOrNone(graph.xAxisTitle);
    state.yTitle = TextOrNone(graph.yAxisTitle);
    if (graph.categoryLabels && graph.categoryCount > 0) {
        state.categories.emplace();
        for (int i = 0; i < graph.categoryCount; ++i) {
            state.categories->push_back(TextOrNone(graph.categoryLabels[i]));
        }
    }
    state.xMin = graph.xMin;
    state.xMax = graph.xMax;
    state.yMin = graph.yMin;
    state.yMax = graph.yMax;
    state.zoom = graph.zoom;
    state.surface = graph.rcPlot;
    state.toggle(0);  // lays out and scales
}

void CompareChart(HWND window) {
    const auto* graph =
        reinterpret_cast<const kor::GraphRecord*>(GetWindowLongPtrW(window, GWLP_USERDATA));
    if (!graph || !CanBeDrawn(*graph)) return;
    // What was panned goes back to the middle: the tests' account has its own.
    KorGraph_ToggleOptions(window, 0);
    if (!CanBeDrawn(*graph)) return;
    HDC screen = GetDC(nullptr);
    HDC measuring = CreateCompatibleDC(screen);
    ReleaseDC(nullptr, screen);
    {
        const ChartFonts fonts(measuring);
        ChartState state(fonts);
        Tell(state, *graph);
        const Surface expected(window, graph->rcPlot.right, graph->rcPlot.bottom);
        KorGraph_Redraw(window);
        if (DrawLiteral(state, fonts, expected.dc())) {
            ++compared;
            if (!SamePixels(graph->hdcMem, expected.dc(), expected.width(), expected.height())) {
                const Picture image =
                    ReadDC(graph->hdcMem, {0, 0, expected.width(), expected.height()});
                FailStorm("chart: the picture is not that of plain calls: %s",
                          FirstDifference(expected.picture(), image).c_str());
            }
        }
    }
    DeleteDC(measuring);
}

}  // namespace

void CompareCharts(Stage& stage) {
    for (int place = 0; place < kPlaces; ++place) {
        HWND window = stage.window(kChart, place);
        if (!window || !stage.isLive(window) || stage.isWithoutRecord(window)) continue;
        stage.runAlone([&] { CompareChart(window); });
    }
}

int ChartsCompared() { return compared; }

}  // namespace kortest
