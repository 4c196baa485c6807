// The command line of a storm:
//
//   storms --control grid --seed 7 --steps 20000 [--heap guarded] [--replay FILE] [--record FILE]
#include "storms/storm.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <cstdlib>

namespace kortest {
namespace {

int Usage() {
    std::fprintf(
        stderr,
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
