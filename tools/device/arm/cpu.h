// An ARMv4 processor in user mode, without Thumb: its registers, and the loop that executes
// instructions. Guest addresses are addresses of the process.
//
// Nothing here depends on a platform. What ARMv4 leaves undefined or unpredictable is refused: a
// program that needs it does not run on every such processor.
#pragma once

#include <cstdint>

namespace arm {

constexpr unsigned kSp = 13;
constexpr unsigned kLr = 14;
constexpr unsigned kPc = 15;

constexpr uint32_t kNegative = 0x80000000;
constexpr uint32_t kZero = 0x40000000;
constexpr uint32_t kCarry = 0x20000000;
constexpr uint32_t kOverflow = 0x10000000;
constexpr uint32_t kFlags = 0xF0000000;
constexpr uint32_t kUserMode = 0x10;

struct Cpu;

// Why execution cannot continue.
struct Refusal {
    const char* reason;
    uint32_t instruction;  // address of the instruction
    uint32_t address;      // of the memory access or the jump target, or 0
};

// Called with what is refused. Must not return.
using RefusalHandler = void (*)(Cpu&, const Refusal&);

constexpr unsigned kPageBits = 12;
constexpr uint32_t kPageCount = 1u << (32 - kPageBits);

// What the guest may write to. Its stack is checked exactly, down to the stack pointer. Other
// memory is checked by page: `mayWrite` is asked about a page that is not marked, and may mark it
// to remember the permission.
struct WriteRules {
    uint32_t stackLow = 0;
    uint32_t stackSize = 0;
    const uint8_t* pages = nullptr;  // kPageCount bytes; 1: all of the page may be written
    bool (*mayWrite)(uint32_t address, uint32_t size) = nullptr;
};

struct Cpu {
    uint32_t r[16] = {};           // r[kPc]: the address of the instruction in execution, plus 8
    uint32_t next = 0;             // the address of the instruction after it
    uint32_t flags = 0;            // N Z C V at their bits in the status register, other bits 0
    uint32_t control = kUserMode;  // the rest of the status register, as a program may read it
    uint64_t executed = 0;         // instructions, including those whose condition was false
    WriteRules writes;
    RefusalHandler onRefusal = nullptr;
};

// Executes from cpu.next on while the next instruction lies in the `size` bytes from `low`.
void Run(Cpu& cpu, uint32_t low, uint32_t size);

// Executes the one instruction at cpu.next.
void Step(Cpu& cpu);

[[noreturn]] void Refuse(Cpu& cpu, const char* reason, uint32_t address = 0);

}  // namespace arm
