// device_speed: adds a long series to a chart and redraws it, and prints how many instructions of
// the device's library that took and how fast they were executed. Without the device's library it
// prints the time alone.
#include "device_counters.h"

#include <korcontrols/graph.h>

#include <cstdio>
#include <vector>

namespace {

constexpr int kPoints = 50000;
constexpr int kRounds = 10;
constexpr int kMessages = 20000;
constexpr int kWidth = 320;
constexpr int kHeight = 240;

// Of processor time, so that other programs' load does not count.
double Seconds() {
    FILETIME created{}, ended{}, system{}, user{};
    GetThreadTimes(GetCurrentThread(), &created, &ended, &system, &user);
    return (static_cast<double>(system.dwLowDateTime) + static_cast<double>(user.dwLowDateTime)) /
           1e7;
}

std::vector<double> Noise() {
    std::vector<double> values(kPoints);
    unsigned seed = 1;
    for (double& value : values) {
        seed = seed * 1664525u + 1013904223u;
        value = (seed >> 8) / 16777216.0 * 100 - 20;
    }
    return values;
}

HWND CreateChart() {
    const HINSTANCE instance = GetModuleHandleW(nullptr);
    RegisterGraphControl(instance);
    const HWND host = CreateWindowW(L"STATIC", L"", WS_POPUP | WS_VISIBLE, 0, 0, kWidth, kHeight,
                                    nullptr, nullptr, instance, nullptr);
    return CreateWindowW(KORGRAPH_CLASS, L"", WS_CHILD | WS_VISIBLE, 0, 0, kWidth, kHeight, host,
                         nullptr, instance, nullptr);
}

// Of a message that the chart passes on to the system.
void MeasureCalls(HWND chart) {
    const double start = Seconds();
    for (int i = 0; i < kMessages; ++i) SendMessageW(chart, WM_NULL, 0, 0);
    std::printf("a message takes %.1f microseconds\n", (Seconds() - start) / kMessages * 1e6);
}

}  // namespace

int main() {
    const std::vector<double> values = Noise();
    const HWND chart = CreateChart();
    if (!chart) return 1;
    const double start = Seconds();
    const device::Counters* counters = device::FindCounters();
    const device::Counters before = counters ? *counters : device::Counters{};
    const GraphSeriesData data = {kPoints, nullptr, values.data(), 0};
    KorGraph_AddSeries(chart, &data);
    for (int i = 0; i < kRounds; ++i) {
        KorGraph_Redraw(chart);
        UpdateWindow(chart);
    }
    const double seconds = Seconds() - start;
    std::printf("%d redraws of %d points: %.3f s\n", kRounds, kPoints, seconds);
    if (counters) {
        const double executed = static_cast<double>(counters->instructions - before.instructions);
        const double helpers = static_cast<double>(counters->softFloat - before.softFloat);
        std::printf("%.1f million instructions, %.1f million in a second\n", executed / 1e6,
                    executed / 1e6 / seconds);
        std::printf("in the arithmetic helpers: %.1f %%\n", 100 * helpers / executed);
        std::printf("%llu calls of the platform, %llu by it; stack used: %u bytes\n",
                    static_cast<unsigned long long>(counters->importCalls - before.importCalls),
                    static_cast<unsigned long long>(counters->callbacks - before.callbacks),
                    static_cast<unsigned>(device::DeepestStack(*counters)));
    }
    MeasureCalls(chart);
    DestroyWindow(chart);
    return 0;
}
