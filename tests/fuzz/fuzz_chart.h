// A chart's record without a window.
#pragma once

#include "fuzz_input.h"

#include "graph/data/axes.h"
#include "graph/data/record.h"
#include "graph/data/series.h"

namespace korfuzz {

struct Chart {
    Chart() : record(*kor::CreateGraphRecord()) {
        record.hwnd = GetDesktopWindow();  // scaling waits for a window
    }
    ~Chart() { kor::FreeRecord(&record); }
    Chart(const Chart&) = delete;
    Chart& operator=(const Chart&) = delete;

    // Sides from none to those of a printed page.
    void resize(Input& input) {
        const int most = input.ConsumeBool() ? 300 : 20000;
        record.rcPlot = {0, 0, input.ConsumeIntegralInRange(0, most),
                         input.ConsumeIntegralInRange(0, most)};
        kor::RescaleX(record);
        kor::RescaleY(record);
    }

    void add(const std::vector<double>& values, const wchar_t* name = nullptr) {
        const GraphSeriesData data = {static_cast<LONG>(values.size()), name, values.data(), 0};
        EXPECT_THAT(kor::AddSeries(record, data));
    }

    void show(Input& input) {
        if (input.ConsumeBool()) {
            kor::SetRange(record, KORGRAPH_X, AnyDouble(input), AnyDouble(input));
        }
        if (input.ConsumeBool()) {
            kor::SetRange(record, KORGRAPH_Y, AnyDouble(input), AnyDouble(input));
        }
        if (input.ConsumeBool()) {
            kor::SetZoomFactor(record, input.PickValueInArray({0.25, 0.5, 1.0, 2.0}));
        }
    }

    kor::GraphRecord& record;
};

}  // namespace korfuzz
