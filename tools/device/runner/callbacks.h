// Guest procedures that the platform calls: window, dialog and timer procedures, callbacks of
// property sheets, enumerations and hooks.
//
// The host holds the guest's own addresses. Nothing there is executable for the host, so its call
// faults, and the fault becomes a call of the guest. That needs the number of words which the
// procedure takes off the stack; so each procedure must have been announced.
#pragma once

#include <cstdint>

namespace device {

enum class Procedure : uint8_t { Words2, Words3, Words4, Cdecl };

// Remembers a guest's procedure; an address that is not guest code is none. To announce one twice
// as different kinds ends the process.
void Announce(uint32_t address, Procedure procedure);

// Makes faults at guest code calls of it, and faults of the guest's own accesses failures.
void CatchCallbacks();

}  // namespace device
