// Which function executes an instruction.
#pragma once

#include "arm/cpu.h"

#include <array>

namespace arm {

using Handler = void (*)(Cpu&, uint32_t instruction);

// Bits 27 to 20 and 7 to 4 distinguish all kinds of instructions.
constexpr unsigned kHandlerCount = 4096;

constexpr unsigned HandlerIndex(uint32_t instruction) {
    return (instruction >> 16 & 0xFF0) | (instruction >> 4 & 0xF);
}

extern const std::array<Handler, kHandlerCount> handlers;

inline Handler HandlerOf(uint32_t instruction) { return handlers[HandlerIndex(instruction)]; }

// The handlers of each kind; `high` is bits 27 to 20, `low` bits 7 to 4 of the instruction. Null
// for combinations that do not exist.
Handler DataProcessingHandler(unsigned high, unsigned low);
Handler MultiplyHandler(unsigned high);
Handler SwapHandler(unsigned high);
Handler StatusHandler(unsigned high, unsigned low);
Handler TransferHandler(unsigned high, unsigned low);
Handler HalfwordHandler(unsigned high, unsigned low);
Handler BlockTransferHandler(unsigned high);
Handler BranchHandler(unsigned high);

}  // namespace arm
