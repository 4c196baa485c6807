// How a storm ends when something breaks: with the operations that led there, and status 1.
#pragma once

#include "storms/operation.h"

#include <cstdint>

namespace kortest {

// Where the storm is.
struct Progress {
    const char* control = "";
    uint64_t seed = 0;
    const char* heap = "";
    const Sequence* sequence = nullptr;
    size_t step = 0;  // index of the operation that runs, or ran last
};
extern Progress progress;

// Prints what broke, the last operations, and how to see it again; ends the process.
[[noreturn]] void FailStorm(const char* format, ...) __attribute__((format(gnu_printf, 1, 2)));

// Crashes that nobody else takes care of end in FailStorm as well.
void WatchForCrashes();

// Told of each access violation first; true when it has ended in a report or been mended.
extern bool (*explainAccess)(const void* address, bool isWrite, const void* instruction);

}  // namespace kortest
