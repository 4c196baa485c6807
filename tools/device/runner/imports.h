// What the guest's imports are on this side.
#pragma once

#include "arm/cpu.h"

#include <cstdint>
#include <initializer_list>
#include <string>

namespace device {

// Gives each import of the image an address that leads here, and notes the desktop's function for
// it. One that is not known ends the process.
void BindImports();

// Makes the guest's call of import `index`: arguments from registers and stack, result in r0 and
// r1. `isWide` says whether r1 means anything.
uint64_t CallImportedFunction(unsigned index, arm::Cpu& cpu, bool& isWide);

// Calls a function of the desktop through the table that tests see. Only those that an own function
// has asked for.
uint32_t CallDesktop(const std::string& name, std::initializer_list<uint32_t> words);

// An address at which the guest can call a function of the host, such as one found by name.
uint32_t GuestAddressOf(uint32_t function);

}  // namespace device
