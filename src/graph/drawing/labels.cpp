// Axis labels and titles.
#include <korcontrols/graph.h>

#include <algorithm>

#include "base/gdi_scopes.h"
#include "graph/data/axes.h"
#include "graph/drawing/frame.h"
#include "graph/scale/number_format.h"
#include "graph/scale/ticks.h"
#include "numbers/truncate.h"
#include "text/text_run.h"

namespace kor {

namespace {

constexpr int kRowGap = 4;
constexpr int kTitleGap = 8;
constexpr int kClipInset = 6;
constexpr int kYTitleLeft = 4;
constexpr int kYTitleStrip = 25;  // pixels, whatever the font

void DrawCentred(HDC dc, const wchar_t* text, const RECT& cell) {
    TextRun(dc, text).Draw(cell, DT_CENTER);
}

void DrawNumber(const GraphRecord& graph, HDC dc, double value, const RECT& cell) {
    wchar_t text[kNumberTextCapacity];
    FormatGraphNumber(value, text, kGraphPrecision);
    DrawNumberText(dc, graph.numberWidths, text, cell, DT_CENTER);
}

// The categories whose pixels may lie in view: labels stand at the integers from 1 up.
struct CategoryRange {
    int first;
    int last;
};

CategoryRange CategoriesBetween(const GraphRecord& graph, double valueA, double valueB) {
    const double low = std::min(valueA, valueB) - 1;
    const double high = std::max(valueA, valueB) + 1;
    const int first = low > 1 ? TruncateToInt(low) : 1;
    const int last = high < graph.categoryCount ? TruncateToInt(high) : graph.categoryCount;
    return {first, last};
}

bool HasText(const wchar_t* text) { return text && *text; }

void DrawXCategories(const GraphRecord& graph, HDC dc, int top) {
    const RECT plot = PlotArea(graph);
    const int bottom = top + graph.xLabelHeight;
    ClipToArea(graph, dc, {plot.left + kClipInset, top, plot.right, bottom});
    const CategoryRange range = CategoriesBetween(graph, ValueAt(XAxis(graph), plot.left - 1),
                                                  ValueAt(XAxis(graph), plot.right + 1));
    for (int i = range.first; i <= range.last; ++i) {
        const wchar_t* label = graph.categoryLabels[i - 1];
        const int x = xPixel(graph, i);
        if (x < plot.left || x >= plot.right || !HasText(label)) continue;
        DrawCentred(dc, label,
                    {x - graph.xTickHalfSpacing, top, x + graph.xTickHalfSpacing, bottom});
    }
    ClipToSurface(graph, dc);
}

void DrawYCategories(const GraphRecord& graph, HDC dc, int left, int right) {
    const RECT plot = PlotArea(graph);
    const CategoryRange range = CategoriesBetween(graph, ValueAt(YAxis(graph), plot.top - 1),
                                                  ValueAt(YAxis(graph), plot.bottom + 1));
    for (int i = range.first; i <= range.last; ++i) {
        const wchar_t* label = graph.categoryLabels[i - 1];
        const int y = yPixel(graph, i);
        if (y <= plot.top || y > plot.bottom || !HasText(label)) continue;
        DrawCentred(dc, label, {left, y - graph.labelHalfHeight, right, y + graph.labelHalfHeight});
    }
}

}  // namespace

void DrawXAxisLabels(const GraphRecord& graph, HDC dc) {
    if (!HasOption(graph, KORGRAPH_XLABELS)) return;
    SelectScope font(dc, graph.hfontAxis);
    const RECT plot = PlotArea(graph);
    const int top = plot.bottom + kRowGap;
    if (graph.categoryLabels && graph.chartType != kBar) {
        DrawXCategories(graph, dc, top);
        return;
    }
    TickWalk tick(XAxis(graph), graph.xTickStep, plot.left, plot.right);
    while (tick.Next()) {
        DrawNumber(graph, dc, tick.value(),
                   {tick.pixel() - graph.xTickHalfSpacing, top,
                    tick.pixel() + graph.xTickHalfSpacing, top + graph.xLabelHeight});
    }
}

void DrawYAxisLabels(const GraphRecord& graph, HDC dc) {
    if (!HasOption(graph, KORGRAPH_YLABELS)) return;
    SelectScope font(dc, graph.hfontAxis);
    const RECT plot = PlotArea(graph);
    const int right = graph.marginLeft - kRowGap;
    const int left = right - 2 * graph.labelMaxWidth;
    if (graph.categoryLabels && graph.chartType == kBar) {
        DrawYCategories(graph, dc, left, right);
        return;
    }
    TickWalk tick(YAxis(graph), graph.yTickStep, plot.top, plot.bottom);
    while (tick.Next()) {
        DrawNumber(graph, dc, tick.value(),
                   {left, tick.pixel() - graph.labelHalfHeight, right,
                    tick.pixel() + graph.labelHalfHeight});
    }
}

void DrawGraphTitle(const GraphRecord& graph, HDC dc) {
    SelectScope font(dc, graph.hfontTitle);
    if (!HasOption(graph, KORGRAPH_TITLE) || !graph.title) return;
    const RECT& surface = graph.rcPlot;
    DrawCentred(dc, graph.title, {surface.left, surface.top, surface.right, graph.marginTop});
}

void DrawXAxisTitle(const GraphRecord& graph, HDC dc) {
    if (!HasOption(graph, KORGRAPH_XTITLE) || !graph.xAxisTitle) return;
    SelectScope font(dc, graph.hfontXTitle);
    const RECT plot = PlotArea(graph);
    DrawCentred(
        dc, graph.xAxisTitle,
        {plot.left, plot.bottom + graph.xLabelHeight + kTitleGap, plot.right, graph.rcPlot.bottom});
}

// Compatibility: the title begins at the middle of the plot and runs upwards, instead of being
// centred (GraphTitles.OfTheYAxisBeginsAtTheMiddleAndRunsUp).
void DrawYAxisTitle(const GraphRecord& graph, HDC dc) {
    if (!HasOption(graph, KORGRAPH_YTITLE) || !graph.yAxisTitle) return;
    SelectScope font(dc, graph.hfontYTitle);
    const RECT plot = PlotArea(graph);
    const int height = plot.bottom - graph.rcPlot.top - graph.marginTop;
    const RECT strip = {0, plot.top, kYTitleStrip, plot.bottom};
    ExtTextOutW(dc, kYTitleLeft, plot.bottom - (height >> 1), ETO_CLIPPED, &strip, graph.yAxisTitle,
                static_cast<UINT>(wcslen(graph.yAxisTitle)), nullptr);
}

}  // namespace kor
