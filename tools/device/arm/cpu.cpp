#include "arm/cpu.h"

#include "arm/decode.h"

#include <array>
#include <cstdlib>

namespace arm {
namespace {

constexpr unsigned kAlways = 14;
constexpr unsigned kNever = 15;

constexpr bool Holds(unsigned condition, unsigned nzcv) {
    const bool n = (nzcv & 8) != 0, z = (nzcv & 4) != 0;
    const bool c = (nzcv & 2) != 0, v = (nzcv & 1) != 0;
    bool holds = true;
    switch (condition >> 1) {
    case 0: holds = z; break;
    case 1: holds = c; break;
    case 2: holds = n; break;
    case 3: holds = v; break;
    case 4: holds = c && !z; break;
    case 5: holds = n == v; break;
    case 6: holds = !z && n == v; break;
    default: return true;
    }
    return (condition & 1) ? !holds : holds;
}

// For each condition, a bit mask of the 16 states of the flags in which it holds.
constexpr auto kHolding = [] {
    std::array<uint16_t, 16> table{};
    for (unsigned condition = 0; condition < 16; ++condition) {
        for (unsigned nzcv = 0; nzcv < 16; ++nzcv) {
            if (Holds(condition, nzcv)) table[condition] |= static_cast<uint16_t>(1u << nzcv);
        }
    }
    return table;
}();

inline void Execute(Cpu& cpu) {
    const uint32_t address = cpu.next;
    const uint32_t instruction = *reinterpret_cast<const uint32_t*>(uintptr_t{address});
    cpu.r[kPc] = address + 8;
    cpu.next = address + 4;
    const unsigned condition = instruction >> 28;
    if (condition != kAlways) {
        if (condition == kNever) Refuse(cpu, "an instruction newer than ARMv4");
        if (!(kHolding[condition] >> (cpu.flags >> 28) & 1)) return;
    }
    HandlerOf(instruction)(cpu, instruction);
}

}  // namespace

void Run(Cpu& cpu, uint32_t low, uint32_t size) {
    uint64_t executed = 0;
    while (cpu.next - low < size) {
        Execute(cpu);
        ++executed;
    }
    cpu.executed += executed;
}

void Step(Cpu& cpu) {
    Execute(cpu);
    ++cpu.executed;
}

void Refuse(Cpu& cpu, const char* reason, uint32_t address) {
    cpu.onRefusal(cpu, Refusal{reason, cpu.r[kPc] - 8, address});
    std::abort();
}

}  // namespace arm
