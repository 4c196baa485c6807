// Ends a process in which the guest did something that it must not do.
#pragma once

#include "arm/cpu.h"

namespace device {

// The exit status of such a process.
constexpr unsigned kFailureStatus = 70;

// Writes "device: " and the formatted text to standard error and ends the process at once.
[[noreturn]] void Fail(const char* format, ...) __attribute__((format(printf, 1, 2)));

// The same for a refused instruction, with the guest's registers.
void FailAtInstruction(arm::Cpu& cpu, const arm::Refusal& refusal);

// Writes the guest's registers, with code addresses also as offsets in the image.
void ReportRegisters(const arm::Cpu& cpu);

}  // namespace device
