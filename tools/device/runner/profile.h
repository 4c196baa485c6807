// Counts how often each of the guest's instructions executes, and writes the counts to the file
// that the environment names, if it names one. See docs/device-runner.md.
#pragma once

#include "arm/cpu.h"

namespace device {

// Prepares the profile if the environment names a file for it. Called once the image is loaded.
void PrepareProfile();

// Whether instructions are to be executed by RunProfiled instead of arm::Run.
bool IsProfiling();

// Like arm::Run, but counts per address; a stretch of helpers is counted for its caller as well.
void RunProfiled(arm::Cpu& cpu, uint32_t low, uint32_t size, bool isSoftFloat);

// Writes the file if there is to be one.
void WriteProfile();

}  // namespace device
