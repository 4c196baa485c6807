// Calls into the guest, from its exports and from the platform, nested as deep as they come.
#pragma once

#include "arm/cpu.h"

#include <cstdint>

namespace device {

extern arm::Cpu cpu;

// Makes the guest's stack and the addresses that stand for the way out. Once, before the rest.
void PrepareGuestCalls();

// Calls guest code with so many words of arguments and returns r0 and r1. `hostFloor`: of the
// host's stack, nothing below belongs to a caller, and so nothing below may be written by the
// guest.
uint64_t CallGuest(uint32_t function, const uint32_t* words, unsigned count, uint32_t hostFloor);

// An address for the guest's import number `index`: a jump there is a call of it.
uint32_t ImportAddress(unsigned index);

}  // namespace device
