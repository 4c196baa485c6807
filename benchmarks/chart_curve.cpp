#include "chart_curve.h"

#include "interleaved.h"
#include "measured_chart.h"

#include <cmath>

namespace bench {

namespace {

// Reads every value once: what is the least that a program must do to know what to draw.
double PassOver(const std::vector<double>& values) {
    double least = values[0];
    double most = values[0];
    double sum = 0;
    for (const double value : values) {
        if (value < least) least = value;
        if (value > most) most = value;
        sum += std::fabs(value);
    }
    return least + most + sum;
}

// One row, all ways in turns.
CurveRow MeasureRow(int points, int rounds) {
    const std::vector<double> values = Noise(points, 1);
    // Few values pass faster than a clock ticks.
    const int passes = std::max(1, 100000 / points);
    volatile double kept = 0;
    std::vector<HWND> charts;
    std::vector<Way> ways = {{"pass", [&] {
                                  for (int i = 0; i < passes; ++i) kept = PassOver(values);
                              }}};
    for (const int type : {KORGRAPH_LINE, KORGRAPH_AREA, KORGRAPH_BAR, KORGRAPH_COLUMN}) {
        HWND chart = CreateChart();
        KorGraph_SetType(chart, type);
        AddSeries(chart, values);
        ways.push_back({"redraw", [chart] { Redraw(chart); }});
        charts.push_back(chart);
    }
    TimeInTurns(ways, rounds, 1);
    for (HWND chart : charts) DestroyWindow(chart);
    CurveRow row = {points, {}};
    for (size_t i = 0; i < ways.size(); ++i) row.times[i] = ways[i].fastest;
    row.times[0] /= passes;
    return row;
}

}  // namespace

std::vector<CurveRow> MeasureCurve() {
    std::vector<CurveRow> curve;
    for (int points = 10; points <= 10000000; points *= 10) {
        curve.push_back(MeasureRow(points, points > 100000 ? 10 : 30));
    }
    return curve;
}

}  // namespace bench
