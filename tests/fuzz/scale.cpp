// The mapping of values to pixels, whatever range, zoom and size: monotone and bounded; ticks that
// are numbers, few, and in view.
#include "fuzz_chart.h"

#include "graph/data/axes.h"
#include "graph/scale/ticks.h"
#include "numbers/truncate.h"

namespace korfuzz {
namespace {

// A pixel is the centre's, in an image, and at most that far from it.
constexpr int kMostPixel = kor::kPixelLimit + 40000;

void CheckMapping(const kor::GraphRecord& graph, std::vector<double> values) {
    std::sort(values.begin(), values.end());
    for (size_t i = 0; i < values.size(); ++i) {
        const int x = kor::xPixel(graph, values[i]);
        const int y = kor::yPixel(graph, values[i]);
        EXPECT_THAT(std::abs(x) <= kMostPixel && std::abs(y) <= kMostPixel);
        if (i == 0) continue;
        EXPECT_THAT(kor::xPixel(graph, values[i - 1]) <= x);
        EXPECT_THAT(kor::yPixel(graph, values[i - 1]) >= y);
    }
}

// Whole numbers answer as the doubles do, or not at all.
void CheckQuickPixels(double centre, double unitsPerPixel, const std::vector<double>& values) {
    const kor::PixelScale scale = kor::MakePixelScale(centre, unitsPerPixel);
    for (const double value : values) {
        if (!std::isfinite(value)) continue;
        const int quick = kor::QuickPixels(scale, value);
        if (quick == kor::kUnknownPixels) continue;
        EXPECT_THAT(quick == kor::TruncateToInt((value - centre) / unitsPerPixel));
    }
}

void CheckTicks(const kor::GraphRecord& graph) {
    constexpr int kMostDrawn = 200002;
    const int right = graph.rcPlot.right;
    const int bottom = graph.rcPlot.bottom;
    int drawn = 0;
    EXPECT_THAT(graph.xTickStep > 0 && std::isfinite(graph.xTickStep));
    EXPECT_THAT(graph.yTickStep > 0 && std::isfinite(graph.yTickStep));
    for (kor::TickWalk tick(kor::XAxis(graph), graph.xTickStep, 0, right); tick.Next();) {
        EXPECT_THAT(std::isfinite(tick.value()) && tick.pixel() >= 0 && tick.pixel() <= right);
        EXPECT_THAT(++drawn < kMostDrawn);
    }
    drawn = 0;
    for (kor::TickWalk tick(kor::YAxis(graph), graph.yTickStep, 0, bottom); tick.Next();) {
        EXPECT_THAT(std::isfinite(tick.value()) && tick.pixel() >= 0 && tick.pixel() <= bottom);
        EXPECT_THAT(++drawn < kMostDrawn);
    }
}

// Any step between any values: multiples that can be counted.
void CheckTickRange(Input& input) {
    constexpr double kMost = 100000.0;
    const double a = AnyDouble(input);
    const double b = AnyDouble(input);
    const kor::TickRange range = kor::TicksBetween(a, b, std::fabs(AnyDouble(input)));
    EXPECT_THAT(std::isfinite(range.first) && std::isfinite(range.last));
    EXPECT_THAT(range.last - range.first <= kMost);
    EXPECT_THAT(range.first + 1 > range.first && range.last + 1 > range.last);
}

}  // namespace
}  // namespace korfuzz

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
    using namespace korfuzz;
    Input input(data, size);
    Chart chart;
    chart.resize(input);
    chart.record.chartType = input.ConsumeIntegralInRange(0, 4);
    if (input.ConsumeBool()) chart.add(AnyValues(input, 50));
    chart.show(input);
    if (input.ConsumeBool()) {
        kor::MoveXCentre(chart.record, FiniteDouble(input));
        kor::MoveYCentre(chart.record, FiniteDouble(input));
    }
    std::vector<double> values;
    while (input.remaining_bytes() > 0 && values.size() < 30) {
        const double value = AnyDouble(input);
        if (!std::isnan(value)) values.push_back(value);
    }
    const kor::GraphRecord& graph = chart.record;
    // An infinite end of a range or a centre moved out of all numbers leaves no order to keep.
    if (std::isfinite(graph.xCentre) && std::isfinite(graph.yCentre)) CheckMapping(graph, values);
    CheckQuickPixels(graph.xCentre, graph.xUnitsPerPixel, values);
    CheckQuickPixels(graph.yCentre, graph.yUnitsPerPixel, values);
    CheckTicks(graph);
    CheckTickRange(input);
    return 0;
}
