// Guest procedures that the platform calls: window, dialog and timer procedures, callbacks of
// property sheets, enumerations and hooks.
//
// The host holds the guest's own addresses. Nothing there is executable for the host, so its call
// faults, and the fault handler calls the guest instead. It must know how many words the procedure
// pops off the stack; so each procedure must have been announced.
#pragma once

#include <cstdint>

namespace device {

enum class Procedure : uint8_t { Words2, Words3, Words4, Cdecl };

// Remembers a guest procedure; an address outside the guest's code is ignored. Announcing one twice
// with different kinds ends the process.
void Announce(uint32_t address, Procedure procedure);

// Installs the handler that turns faults at guest code into calls of it, and faults of the guest's
// own accesses into failures.
void CatchCallbacks();

}  // namespace device
