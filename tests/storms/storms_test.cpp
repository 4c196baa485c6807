// Storms of fixed seeds on the DLL, and sequences that broke something once.
#include "storms/storm.h"

#include "device/device_counters.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <filesystem>
#include <sstream>

namespace kortest {
namespace {

struct Slice {
    const char* control;
    StormHeap heap;
    int steps;
};

std::ostream& operator<<(std::ostream& stream, const Slice& slice) {
    return stream << slice.control << (slice.heap == StormHeap::guarded ? "Guarded" : "Plain");
}

std::string NameOf(const ::testing::TestParamInfo<Slice>& info) {
    std::ostringstream name;
    name << info.param;
    return name.str();
}

// The interpreted library takes longer for a step, and its tests are many.
int StepsHere(int steps) { return device::FindCounters() ? steps / 4 : steps; }

class Storms : public ::testing::TestWithParam<Slice> {};

TEST_P(Storms, BreakNothing) {
    StormPlan plan;
    plan.control = GetParam().control;
    plan.heap = GetParam().heap;
    plan.steps = StepsHere(GetParam().steps);
    EXPECT_TRUE(RunStorm(plan));
}

INSTANTIATE_TEST_SUITE_P(Seed1, Storms,
                         ::testing::Values(Slice{"header", StormHeap::guarded, 10000},
                                           Slice{"grid", StormHeap::guarded, 4000},
                                           Slice{"grid", StormHeap::plain, 4000},
                                           Slice{"chart", StormHeap::guarded, 4000},
                                           Slice{"chart", StormHeap::plain, 4000},
                                           Slice{"legend", StormHeap::guarded, 2000},
                                           Slice{"tooltip", StormHeap::guarded, 10000},
                                           Slice{"bar", StormHeap::guarded, 6000},
                                           Slice{"lists", StormHeap::guarded, 4000},
                                           Slice{"all", StormHeap::guarded, 4000},
                                           Slice{"all", StormHeap::plain, 4000}),
                         NameOf);

// ---- Sequences that broke something once
// ----------------------------------------------------------

// "grid_drag_after_capture.txt" is a storm on the grid.
std::vector<std::string> SequenceFiles() {
    std::vector<std::string> names;
    for (const auto& entry : std::filesystem::directory_iterator(KORTEST_SEQUENCES)) {
        if (entry.path().extension() == ".txt") names.push_back(entry.path().stem().string());
    }
    std::sort(names.begin(), names.end());
    return names;
}

class StormSequences : public ::testing::TestWithParam<std::string> {};

TEST_P(StormSequences, BreakNothingAnyMore) {
    StormPlan plan;
    plan.control = GetParam().substr(0, GetParam().find('_'));
    plan.heap = StormHeap::guarded;
    plan.replayed = std::string(KORTEST_SEQUENCES) + "/" + GetParam() + ".txt";
    EXPECT_TRUE(RunStorm(plan));
}

INSTANTIATE_TEST_SUITE_P(Files, StormSequences, ::testing::ValuesIn(SequenceFiles()),
                         [](const auto& each) { return each.param; });

}  // namespace
}  // namespace kortest
