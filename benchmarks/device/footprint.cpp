// device_footprint: what the device's library takes, counted by the stand-in that interprets it. A
// line for each figure, its fields separated by tabs, which tools/footprint.py makes tables of:
//
//   creation     name; heap bytes and GDI objects while it lives; what is left of both
//   interaction  name; points or 0; instructions; those in the arithmetic helpers; calls of the
//                platform; "alike" when all runs were
//   stack        the deepest use in bytes
//   speed        million instructions interpreted in a second of processor time; all instructions
//                of the process
//
//   device_footprint --quick    charts of up to 1,000 points only
#include "interactions.h"
#include "measure.h"
#include "stage.h"

#include <korcontrols/graph.h>

#include <cstdio>
#include <cstring>

namespace {

using namespace footprint;

constexpr int kRuns = 3;
constexpr int kPoints[] = {10, 100, 1000, 10000};
constexpr int kMostPointsWhenQuick = 1000;

Cost RunOnce(const Interaction& interaction) {
    OpenHost();
    interaction.prepare();
    const Cost cost = CostOf(interaction.act);
    CloseHost();
    return cost;
}

// Prints the cheapest of several runs, each with windows of its own.
void Measure(const Interaction& interaction, int points) {
    Cost cheapest = RunOnce(interaction);
    bool alike = true;
    for (int run = 1; run < kRuns; ++run) {
        const Cost cost = RunOnce(interaction);
        alike = alike && cost == cheapest;
        if (cost.instructions < cheapest.instructions) cheapest = cost;
    }
    std::printf("interaction\t%s\t%d\t%llu\t%llu\t%llu\t%s\n", interaction.name.c_str(), points,
                static_cast<unsigned long long>(cheapest.instructions),
                static_cast<unsigned long long>(cheapest.softFloat),
                static_cast<unsigned long long>(cheapest.platformCalls), alike ? "alike" : "vary");
    std::fflush(stdout);
}

// The first time something of a kind is made, what is kept for the process is made as well; it is
// left then, and counted.
void Measure(const Creation& creation) {
    OpenHost();
    const device::Counters before = Counts();
    creation.create();
    Settle();
    const device::Counters alive = Counts();
    CloseHost();
    const auto change = [](uint32_t now, uint32_t then) { return static_cast<int>(now - then); };
    std::printf("creation\t%s\t%d\t%d\t%d\t%d\n", creation.name.c_str(),
                change(alive.heapBytes, before.heapBytes),
                change(alive.gdiObjects, before.gdiObjects),
                change(Counts().heapBytes, before.heapBytes),
                change(Counts().gdiObjects, before.gdiObjects));
}

double ProcessorSeconds() {
    FILETIME created{}, ended{}, system{}, user{};
    GetThreadTimes(GetCurrentThread(), &created, &ended, &system, &user);
    return (static_cast<double>(system.dwLowDateTime) + static_cast<double>(user.dwLowDateTime)) /
           1e7;
}

// While a long series is added and drawn, with few calls of the platform.
void MeasureSpeed() {
    constexpr int kManyPoints = 50000;
    OpenHost();
    const HWND chart = CreateChart(KORGRAPH_LINE);
    const double start = ProcessorSeconds();
    const Cost cost = CostOf([=] {
        AddSeries(chart, kManyPoints);
        KorGraph_Redraw(chart);
    });
    const double seconds = ProcessorSeconds() - start;
    CloseHost();
    std::printf("speed\t%.0f\t%llu\n", static_cast<double>(cost.instructions) / 1e6 / seconds,
                static_cast<unsigned long long>(Counts().instructions));
}

}  // namespace

int main(int argumentCount, char** arguments) {
    const bool quick = argumentCount > 1 && !std::strcmp(arguments[1], "--quick");
    for (const Creation& creation : Creations()) Measure(creation);
    for (const Interaction& interaction : PlainInteractions()) Measure(interaction, 0);
    for (const int points : kPoints) {
        if (quick && points > kMostPointsWhenQuick) break;
        for (const Interaction& one : ChartInteractions(points)) Measure(one, points);
    }
    std::printf("stack\t%u\n", static_cast<unsigned>(device::DeepestStack(Counts())));
    MeasureSpeed();
    return 0;
}
