// The guest's imports and what they are on this side.
#pragma once

#include "arm/cpu.h"

#include <cstdint>
#include <initializer_list>
#include <string>

namespace device {

// Gives each import of the image an address that leads here, and looks up the desktop's function
// for it. An unknown import ends the process.
void BindImports();

// Performs the guest's call of import `index`: arguments from registers and stack, result in r0 and
// r1. `isWide` says whether r1 is part of the result.
uint64_t CallImportedFunction(unsigned index, arm::Cpu& cpu, bool& isWide);

// Calls a desktop function through the table that tests see. Only for those that NeededBy names.
uint32_t CallDesktop(const std::string& name, std::initializer_list<uint32_t> words);

// An address at which the guest can call a function of the host, such as one found by name.
uint32_t GuestAddressOf(uint32_t function);

}  // namespace device
