// Fields of an instruction, the barrel shifter, checked memory accesses and jumps.
#pragma once

#include "arm/cpu.h"

#include <cstdint>

namespace arm {

constexpr bool BitOf(uint32_t instruction, unsigned bit) { return (instruction >> bit & 1) != 0; }

// The four register fields, from the highest bits to the lowest.
constexpr unsigned FieldN(uint32_t instruction) { return instruction >> 16 & 15; }
constexpr unsigned FieldD(uint32_t instruction) { return instruction >> 12 & 15; }
constexpr unsigned FieldS(uint32_t instruction) { return instruction >> 8 & 15; }
constexpr unsigned FieldM(uint32_t instruction) { return instruction & 15; }

constexpr const char* kUndefined = "an instruction that ARMv4 does not have";
constexpr const char* kUnpredictable = "an instruction with an unpredictable result";

// ---- The shifter --------------------------------------------------------------------------------

struct Shifted {
    uint32_t value;
    uint32_t carry;  // kCarry or 0
};

constexpr uint32_t CarryIf(uint32_t bit) { return bit ? kCarry : 0; }

constexpr uint32_t RotateRight(uint32_t value, unsigned by) {
    by &= 31;
    return by ? value >> by | value << (32 - by) : value;
}

enum ShiftKind : unsigned { kLsl, kLsr, kAsr, kRor };

// By 1 to 255 bits.
constexpr Shifted Shift(uint32_t value, unsigned kind, unsigned by) {
    switch (kind) {
    case kLsl:
        if (by < 32) return {value << by, CarryIf(value >> (32 - by) & 1)};
        return {0, CarryIf(by == 32 ? value & 1 : 0)};
    case kLsr:
        if (by < 32) return {value >> by, CarryIf(value >> (by - 1) & 1)};
        return {0, CarryIf(by == 32 ? value >> 31 : 0)};
    case kAsr: {
        const auto number = static_cast<int32_t>(value);
        if (by < 32) return {static_cast<uint32_t>(number >> by), CarryIf(value >> (by - 1) & 1)};
        return {static_cast<uint32_t>(number >> 31), CarryIf(value >> 31)};
    }
    default: {
        const uint32_t rotated = RotateRight(value, by);
        return {rotated, CarryIf(rotated >> 31)};
    }
    }
}

// A register shifted by an immediate. An immediate of 0 means no shift to the left, a shift of 32
// to the right, or a rotation by one through the carry.
inline Shifted ShiftByImmediate(const Cpu& cpu, uint32_t instruction) {
    const uint32_t value = cpu.r[FieldM(instruction)];
    const unsigned kind = instruction >> 5 & 3;
    const unsigned by = instruction >> 7 & 31;
    if (by) return Shift(value, kind, by);
    if (kind == kLsl) return {value, cpu.flags & kCarry};
    if (kind == kRor) {
        return {value >> 1 | (cpu.flags & kCarry ? 0x80000000 : 0), CarryIf(value & 1)};
    }
    return Shift(value, kind, 32);
}

// A register shifted by the lowest byte of another.
inline Shifted ShiftByRegister(const Cpu& cpu, uint32_t instruction) {
    const uint32_t value = cpu.r[FieldM(instruction)];
    const unsigned by = cpu.r[FieldS(instruction)] & 255;
    if (!by) return {value, cpu.flags & kCarry};
    return Shift(value, instruction >> 5 & 3, by);
}

// An 8-bit immediate, rotated right by an even number of bits.
inline Shifted RotatedImmediate(const Cpu& cpu, uint32_t instruction) {
    const unsigned by = (instruction >> 8 & 15) * 2;
    const uint32_t value = RotateRight(instruction & 255, by);
    return {value, by ? CarryIf(value >> 31) : cpu.flags & kCarry};
}

// ---- Memory -------------------------------------------------------------------------------------

template <typename Value>
Value Load(Cpu& cpu, uint32_t address) {
    if (address % sizeof(Value)) Refuse(cpu, "a misaligned read", address);
    return *reinterpret_cast<const volatile Value*>(uintptr_t{address});
}

inline void CheckWrite(Cpu& cpu, uint32_t address, uint32_t size) {
    const WriteRules& rules = cpu.writes;
    if (address - rules.stackLow < rules.stackSize) {
        if (address < cpu.r[kSp]) Refuse(cpu, "a write below the stack pointer", address);
        return;
    }
    if (rules.pages[address >> kPageBits]) return;
    if (!rules.mayWrite(address, size)) {
        Refuse(cpu, "a write to memory that is not the guest's", address);
    }
}

template <typename Value>
void Store(Cpu& cpu, uint32_t address, uint32_t value) {
    if (address % sizeof(Value)) Refuse(cpu, "a misaligned write", address);
    CheckWrite(cpu, address, sizeof(Value));
    *reinterpret_cast<volatile Value*>(uintptr_t{address}) = static_cast<Value>(value);
}

// ---- Jumps --------------------------------------------------------------------------------------

inline void JumpTo(Cpu& cpu, uint32_t target) {
    if (target & 3) Refuse(cpu, "a jump to a misaligned address", target);
    cpu.next = target;
}

}  // namespace arm
