// What the runner has counted, where other programs can read it too: shared memory named
// "Local\korcontrols-device-" and the process number in decimal. Beginning with the layout below.
#pragma once

#include "arm/cpu.h"

#include <cstdint>

namespace device {

struct Counters {
    uint64_t instructions;  // of the guest, in calls that have returned
    uint64_t softFloat;     // those of them in the helpers of arithmetic without a coprocessor
    uint64_t importCalls;   // calls of the platform
    uint64_t callbacks;     // calls by the platform
    uint64_t exportCalls;   // calls by the program
    uint32_t stackLow, stackSize;  // the guest's stack in the process
};

Counters& counters();

// Finds the shared memory, and in the image the block of arithmetic helpers: the bytes of the file
// that lies beside the image, if there is one.
void PrepareCounters();
void FindSoftFloat(const uint8_t* block, uint32_t size);

// Executes until the guest leaves its code.
void RunCounted(arm::Cpu& cpu);

}  // namespace device
