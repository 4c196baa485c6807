// A chart's data by any sequence of messages, against a plain model; and what lies under a pixel.
#include "fuzz_chart.h"

#include "graph/hit_test.h"

#include <memory>

namespace korfuzz {
namespace {

struct ModelSeries {
    std::vector<double> values;
    // A single value that changes leaves the extremes, and more, to what the chart has always made
    // of it.
    bool isFresh;
};
using Model = std::vector<ModelSeries>;

bool AreSame(double a, double b) { return a == b || (std::isnan(a) && std::isnan(b)); }

void CheckSeries(const kor::GraphSeries& series, const ModelSeries& model) {
    const std::vector<double>& values = model.values;
    EXPECT_THAT(series.pointCount == static_cast<int>(values.size()));
    double least = std::numeric_limits<double>::infinity();
    double most = -least;
    for (size_t i = 0; i < values.size(); ++i) {
        EXPECT_THAT(AreSame(series.values[i], values[i]));
        if (!std::isfinite(values[i])) continue;
        least = std::min(least, values[i]);
        most = std::max(most, values[i]);
    }
    const bool any = least <= most;
    EXPECT_THAT(!model.isFresh || series.minValue == (any ? least : 0));
    EXPECT_THAT(!model.isFresh || series.maxValue == (any ? most : 0));
    EXPECT_THAT(std::isfinite(series.minValue) && std::isfinite(series.maxValue));
    EXPECT_THAT(series.minIndex >= 0 && series.minIndex < series.pointCount);
    EXPECT_THAT(series.maxIndex >= 0 && series.maxIndex < series.pointCount);
}

// The text ends within its room; the block ends there too.
void CheckHit(Input& input, const kor::GraphRecord& graph) {
    const auto text = std::make_unique<wchar_t[]>(kor::kTipTextCapacity);
    std::fill_n(text.get(), kor::kTipTextCapacity, L'?');
    const int hit = kor::HitTestGraphValue(graph, input.ConsumeIntegralInRange(-10, 400),
                                           input.ConsumeIntegralInRange(-10, 400), text.get());
    EXPECT_THAT(std::find(text.get(), text.get() + kor::kTipTextCapacity, L'\0') !=
                text.get() + kor::kTipTextCapacity);
    EXPECT_THAT(hit == (text[0] != L'\0' ? 1 : 0));
}

void Step(Input& input, Chart& chart, Model& model) {
    const int index = input.ConsumeIntegralInRange(-1, 4);
    const bool exists = index >= 0 && index < static_cast<int>(model.size());
    switch (input.ConsumeIntegralInRange(0, 5)) {
    case 0: {
        if (model.size() == 4) return;
        const std::vector<double> values = AnyValues(input, 60);
        chart.add(values, input.ConsumeBool() ? L"name" : nullptr);
        model.push_back({values, true});
        break;
    }
    case 1: {
        const int point = input.ConsumeIntegralInRange(-1, 60);
        const double value = AnyDouble(input);
        kor::SetSeriesValue(chart.record, {index, point, value});
        if (!exists) break;
        ModelSeries& changed = model[static_cast<size_t>(index)];
        if (point < 0 || point >= static_cast<int>(changed.values.size())) break;
        changed.values[static_cast<size_t>(point)] = value;
        changed.isFresh = false;
        break;
    }
    case 2: {
        const std::vector<double> values = AnyValues(input, 60);
        kor::ReplaceSeriesValues(chart.record,
                                 {static_cast<LONG>(values.size()), nullptr, values.data(), index});
        if (!exists) break;
        ModelSeries& old = model[static_cast<size_t>(index)];
        const size_t count = old.values.size();
        old = {values, true};
        old.values.resize(count, 0.0);
        break;
    }
    case 3:
        kor::RemoveAllSeries(chart.record);
        model.clear();
        break;
    case 4: chart.show(input); break;
    default: CheckHit(input, chart.record); break;
    }
}

}  // namespace
}  // namespace korfuzz

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
    using namespace korfuzz;
    Input input(data, size);
    Chart chart;
    Model model;
    chart.resize(input);
    chart.record.chartType = input.ConsumeIntegralInRange(0, 4);
    if (input.ConsumeBool()) chart.record.options |= KORGRAPH_LIVE;
    while (input.remaining_bytes() > 0) {
        Step(input, chart, model);
        EXPECT_THAT(chart.record.seriesCount == static_cast<int>(model.size()));
        for (size_t i = 0; i < model.size(); ++i) CheckSeries(*chart.record.series[i], model[i]);
    }
    return 0;
}
