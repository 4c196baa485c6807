// Calls from here to functions with an unknown number of arguments, and the entries into the guest.
#pragma once

#include <cstdint>

namespace device {

// The longest argument list of a platform function has twelve words.
constexpr unsigned kHostWords = 16;

// Calls a host function, stdcall or cdecl, with kHostWords words on the stack, the first one
// lowest, and restores the stack pointer. Words beyond the function's own arguments do no harm.
extern "C" uint64_t CallHost(uint32_t function, const uint32_t* words);

// The same for a function whose result is a double.
extern "C" double CallHostForDouble(uint32_t function, const uint32_t* words);

// Entered when host code calls a guest procedure, with the procedure's address in eax. There is one
// entry for each number of stdcall words; the last is for cdecl.
extern "C" void EnterWith2Words();
extern "C" void EnterWith3Words();
extern "C" void EnterWith4Words();
extern "C" void EnterCdecl();

}  // namespace device
