// What the guest may write to outside its own stack.
#pragma once

#include "arm/cpu.h"

#include <cstdint>

namespace device {

// Pages that are known to be writable as a whole.
extern uint8_t writablePages[arm::kPageCount];

// For pages that are not. True for private and shared memory that the process can write, for the
// test program's own data, and for the host's stack from the floor on. False for other modules,
// the runner's own data among them, and for what cannot be written at all.
bool MayWrite(uint32_t address, uint32_t size);

// Sets the floor of the host's stack and returns the previous one.
uint32_t SetHostFloor(uint32_t floor);

}  // namespace device
