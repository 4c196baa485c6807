// Calls into the guest, from its exports and from the platform, nested to any depth.
#pragma once

#include "arm/cpu.h"

#include <cstdint>

namespace device {

extern arm::Cpu cpu;

// Creates the guest's stack and the addresses that stand for the ways out. Called once, before the
// rest.
void PrepareGuestCalls();

// Calls guest code with `count` words of arguments and returns r0 and r1. `hostFloor` is an address
// in the host's stack: nothing below it belongs to a caller, so the guest may not write there.
uint64_t CallGuest(uint32_t function, const uint32_t* words, unsigned count, uint32_t hostFloor);

// The address of the guest's import number `index`: a jump there is a call of it.
uint32_t ImportAddress(unsigned index);

}  // namespace device
