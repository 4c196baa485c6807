#include "interactions.h"

#include "measure.h"
#include "stage.h"

#include <korcontrols/graph.h>
#include <korcontrols/tooltip.h>

#include <cstdio>
#include <cstdlib>

namespace footprint {
namespace {

using Step = std::function<void()>;

const char* const kTypeNames[] = {"line", "area", "bar", "column", "pie"};

HWND chart;    // of this run
POINT target;  // what a press in it is to hit, in its client coordinates

void Redraw() {
    KorGraph_Redraw(chart);
    Settle();
}

Step Chart(int type, int points) {
    return [=] {
        chart = CreateChart(type);
        if (points) AddSeries(chart, points);
        Redraw();
    };
}

Step ZoomTo(int zoom) {
    return [=] {
        KorGraph_SetZoom(chart, zoom);
        Settle();
    };
}

void PressTarget() {
    Press(chart, target.x, target.y);
    Settle();
}

bool ToolTipIsShown() {
    return IsWindowVisible(FindWindowExW(Host(), nullptr, KORTOOLTIP_CLASS, nullptr)) != 0;
}

bool ShowsAValue(const Cost&) { return ToolTipIsShown(); }

// Beside the plot nothing but an arrow makes the chart draw.
bool Pans(const Cost& cost) { return !ToolTipIsShown() && cost.platformCalls > 20; }

// Looks from `first` on, some columns wide, for a place where a press does what is wanted.
void FindTarget(POINT first, LONG stepX, LONG stepY, bool (*isFound)(const Cost&)) {
    constexpr int kColumns = 10;
    for (int column = 0; column < kColumns; ++column) {
        for (LONG y = first.y; y < kHeight; y += stepY) {
            target = {first.x + column * stepX, y};
            const bool found = isFound(CostOf(PressTarget));
            Release(chart, target.x, target.y);
            Settle();
            if (found) return;
        }
    }
    std::printf("device_footprint: no place to press was found\n");
    std::exit(1);
}

// From the middle to the right.
Step ChartWithValue(int type, int points) {
    return [=] {
        Chart(type, points)();
        FindTarget({kWidth / 2, 0}, 6, 6, ShowsAValue);
    };
}

// From the right edge inwards; that pans once.
Step ChartWithArrow(int type, int points) {
    return [=] {
        Chart(type, points)();
        ZoomTo(KORGRAPH_ZOOM200)();
        FindTarget({kWidth - 2, 0}, -4, 5, Pans);
    };
}

Step ChartWithLegend(int type, int points) {
    return [=] {
        Chart(type, points)();
        const RECT place = {100, 100, 200, 200};
        KorGraph_ShowLegend(chart, &place);
        Settle();
    };
}

void RepaintAll() {
    RedrawWindow(chart, nullptr, nullptr, RDW_INVALIDATE | RDW_ALLCHILDREN);
    Settle();
}

// One step of live mode: every value anew.
Step LiveUpdate(int points) {
    return [=] {
        const std::vector<double> values = Noise(points);
        const GraphSeriesData data = {points, nullptr, values.data(), 0};
        KorGraph_Notify(chart, GN_LIVEUPDATE, reinterpret_cast<LPARAM>(&data));
        Settle();
    };
}

Step LiveChart(int mode, int points) {
    return [=] {
        chart = CreateChart(KORGRAPH_LINE);
        KorGraph_ToggleOptions(chart, KORGRAPH_LIVE);
        KorGraph_SetDataMode(chart, mode);
        AddSeries(chart, points);
        Redraw();
        if (mode == KORGRAPH_REPLACE) LiveUpdate(points)();
    };
}

Step SetLabels(int points) {
    return [=] {
        const std::vector<LPCWSTR> labels(static_cast<size_t>(points), L"Label");
        KorGraph_SetCategories(chart, points, labels.data());
    };
}

Step LabelledChart(int points) {
    return [=] {
        Chart(KORGRAPH_COLUMN, points)();
        SetLabels(points)();
        Redraw();
    };
}

}  // namespace

std::vector<Interaction> ChartInteractions(int points) {
    std::vector<Interaction> all;
    for (int type = KORGRAPH_LINE; type <= KORGRAPH_PIE; ++type) {
        all.push_back({std::string("redraw, ") + kTypeNames[type], Chart(type, points), Redraw});
    }
    const std::vector<Interaction> others = {
        {"zoom to 200 %, line", Chart(KORGRAPH_LINE, points), ZoomTo(KORGRAPH_ZOOM200)},
        {"zoom to 50 %, column", Chart(KORGRAPH_COLUMN, points), ZoomTo(KORGRAPH_ZOOM50)},
        {"pan by one tick, line", ChartWithArrow(KORGRAPH_LINE, points), PressTarget},
        {"pan by one tick, column", ChartWithArrow(KORGRAPH_COLUMN, points), PressTarget},
        {"tap on a value, line", ChartWithValue(KORGRAPH_LINE, points), PressTarget},
        {"tap on a value, column", ChartWithValue(KORGRAPH_COLUMN, points), PressTarget},
        {"tap on a slice, pie", ChartWithValue(KORGRAPH_PIE, points), PressTarget},
        {"adding a series", Chart(KORGRAPH_LINE, 0), [=] { AddSeries(chart, points); }},
        {"removing it", Chart(KORGRAPH_LINE, points), [] { KorGraph_Clear(chart); }},
        {"live update of all values", LiveChart(KORGRAPH_REPLACE, points), LiveUpdate(points)},
        {"sample of a sweep", LiveChart(KORGRAPH_SWEEP, points),
         [] {
             KorGraph_Notify(chart, GN_LIVEUPDATE, 5);
             Settle();
         }},
        {"setting a label for each point", Chart(KORGRAPH_COLUMN, points), SetLabels(points)},
        {"redraw with labels, column", LabelledChart(points), Redraw},
        {"room for an input panel made, line", Chart(KORGRAPH_LINE, points),
         [] {
             MoveWindow(chart, 0, 0, kWidth, kHeight - kInputPanelHeight, TRUE);
             Settle();
         }},
        {"repaint with a legend, pie", ChartWithLegend(KORGRAPH_PIE, points), RepaintAll},
        {"copy to the clipboard", Chart(KORGRAPH_LINE, points), [] { KorGraph_Copy(chart); }},
    };
    all.insert(all.end(), others.begin(), others.end());
    return all;
}

std::vector<Creation> Creations() {
    const auto chartWithLegend = ChartWithLegend(KORGRAPH_LINE, 10);
    return {
        {"grid, with its strips and its equation bar", [] { CreateGrid(); }},
        {"header strip of four items, alone", [] { CreateStrip(); }},
        {"chart without data, with its tooltip", Chart(KORGRAPH_LINE, 0)},
        {"chart of 1,000 points", Chart(KORGRAPH_LINE, 1000)},
        {"chart of 10 points with its legend", chartWithLegend},
        {"tooltip alone", [] { CreateToolTip(); }},
        {"function bar of six items", [] { CreateFunctionBar(); }},
    };
}

}  // namespace footprint
