// A storm: a long sequence of operations on the controls, drawn from a seed, with everything that
// must hold looked at after each one.
#pragma once

#include "storms/operation.h"

#include <cstdint>
#include <string>

namespace kortest {

enum class StormHeap { guarded, plain };

struct StormPlan {
    std::string control;
    uint64_t seed = 1;
    int steps = 10000;
    StormHeap heap = StormHeap::plain;
    std::string replayed;  // a file with a sequence, instead of the seed's
};

// Runs it in this process, once. Returns when nothing broke; otherwise the process ends. Prints one
// line about what was done. False for a plan that cannot be made out.
bool RunStorm(const StormPlan& plan);

// Writes the plan's sequence to a file, without running it.
bool RecordStorm(const StormPlan& plan, const std::string& path);

}  // namespace kortest
