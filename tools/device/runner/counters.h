// Counting, and the execution that is counted.
#pragma once

#include "arm/cpu.h"
#include "device_counters.h"

namespace device {

Counters& counters();

// Creates the shared memory.
void PrepareCounters();

// Looks for the block of arithmetic helpers in the image.
void FindSoftFloat(const uint8_t* block, uint32_t size);

// Executes until the guest leaves its code.
void RunCounted(arm::Cpu& cpu);

}  // namespace device
