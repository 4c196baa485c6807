// Storms of fixed seeds, and the command line for others:
//
//   storms --control grid --seed 7 --steps 20000 [--heap guarded] [--replay FILE] [--record FILE]
#include "storms/storm.h"

#include "device/device_counters.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <filesystem>
#include <fstream>

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

// The interpreted library does one step where the machine's own does some ten.
int StepsHere(int steps) { return device::FindCounters() ? steps / 20 : steps; }

class Storms : public ::testing::TestWithParam<Slice> {};

TEST_P(Storms, BreakNothing) {
    StormPlan plan;
    plan.control = GetParam().control;
    plan.heap = GetParam().heap;
    plan.steps = StepsHere(GetParam().steps);
    EXPECT_TRUE(RunStorm(plan));
}

INSTANTIATE_TEST_SUITE_P(
    Seed1, Storms,
    ::testing::Values(Slice{"header", StormHeap::guarded, 10000},
                      Slice{"grid", StormHeap::guarded, 4000}, Slice{"grid", StormHeap::plain, 4000},
                      Slice{"chart", StormHeap::guarded, 4000},
                      Slice{"chart", StormHeap::plain, 4000},
                      Slice{"legend", StormHeap::guarded, 2000},
                      Slice{"tooltip", StormHeap::guarded, 10000},
                      Slice{"bar", StormHeap::guarded, 6000},
                      Slice{"lists", StormHeap::guarded, 4000},
                      Slice{"all", StormHeap::guarded, 4000}, Slice{"all", StormHeap::plain, 4000}),
    NameOf);

// ---- Sequences that broke something once ----------------------------------------------------------

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

// ---- The command line ------------------------------------------------------------------------------

int Usage() {
    std::fprintf(stderr,
                 "storms --control header|grid|chart|legend|tooltip|bar|lists|all --seed S --steps N "
                 "[--heap guarded|plain] [--replay FILE] [--record FILE]\n");
    return 2;
}

int RunCommandLine(int argc, char** argv) {
    StormPlan plan;
    std::string recorded;
    for (int i = 1; i + 1 < argc; i += 2) {
        const std::string option = argv[i];
        const char* value = argv[i + 1];
        if (option == "--control") {
            plan.control = value;
        } else if (option == "--seed") {
            plan.seed = std::strtoull(value, nullptr, 10);
        } else if (option == "--steps") {
            plan.steps = std::atoi(value);
        } else if (option == "--heap") {
            plan.heap = std::string(value) == "guarded" ? StormHeap::guarded : StormHeap::plain;
        } else if (option == "--replay") {
            plan.replayed = value;
        } else if (option == "--record") {
            recorded = value;
        } else {
            return Usage();
        }
    }
    if (argc % 2 == 0) return Usage();
    const bool isDone = recorded.empty() ? RunStorm(plan) : RecordStorm(plan, recorded);
    return isDone ? EXIT_SUCCESS : Usage();
}

}  // namespace
}  // namespace kortest

int main(int argc, char** argv) {
    ::testing::InitGoogleTest(&argc, argv);
    return argc > 1 ? kortest::RunCommandLine(argc, argv) : RUN_ALL_TESTS();
}
