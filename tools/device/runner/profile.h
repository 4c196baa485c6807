// Where the guest's instructions go, written to a file when the process asks for it. See
// docs/device-runner.md.
#pragma once

#include "arm/cpu.h"

namespace device {

// Prepares the profile if the environment names a file for it; once the image is loaded.
void PrepareProfile();

// Whether instructions are to be executed by RunProfiled instead of arm::Run.
bool IsProfiling();

// As arm::Run, counting per address; a stretch of helpers is counted for its caller as well.
void RunProfiled(arm::Cpu& cpu, uint32_t low, uint32_t size, bool isSoftFloat);

// Writes the file, if there is to be one.
void WriteProfile();

}  // namespace device
