// Calls from here to functions whose argument count nobody knows, and the ways into the guest.
#pragma once

#include <cstdint>

namespace device {

// The longest argument list of a platform function has twelve words.
constexpr unsigned kHostWords = 16;

// Calls a function of the host, stdcall or cdecl, with that many words on the stack, the first one
// lowest, and puts the stack pointer back. Words beyond the function's own arguments do no harm.
extern "C" uint64_t CallHost(uint32_t function, const uint32_t* words);

// The same for a function whose result is a floating-point number.
extern "C" double CallHostForDouble(uint32_t function, const uint32_t* words);

// Where host code lands that calls a guest's procedure, with the procedure's address in eax: by the
// number of stdcall words; the last for cdecl.
extern "C" void EnterWith2Words();
extern "C" void EnterWith3Words();
extern "C" void EnterWith4Words();
extern "C" void EnterCdecl();

}  // namespace device
