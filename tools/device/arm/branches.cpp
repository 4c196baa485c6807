// Branches, and the two instructions on the status register.
#include "arm/decode.h"
#include "arm/operands.h"

namespace arm {
namespace {

template <bool links>
void Branch(Cpu& cpu, uint32_t instruction) {
    if (links) cpu.r[kLr] = cpu.r[kPc] - 4;
    const auto offset = static_cast<int32_t>(instruction << 8) >> 6;
    cpu.next = cpu.r[kPc] + static_cast<uint32_t>(offset);
}

void ReadStatus(Cpu& cpu, uint32_t instruction) {
    const unsigned d = FieldD(instruction);
    if ((instruction & 0x000F0FFF) != 0x000F0000 || d == kPc) Refuse(cpu, kUnpredictable);
    cpu.r[d] = cpu.flags | cpu.control;
}

// A program may change only the flags.
void WriteStatus(Cpu& cpu, uint32_t instruction, uint32_t value) {
    if ((instruction & 0x000FF000) != 0x0008F000) {
        Refuse(cpu, "a change of the processor's mode or state");
    }
    cpu.flags = value & kFlags;
}

void WriteStatusRegister(Cpu& cpu, uint32_t instruction) {
    if ((instruction & 0xF00) != 0 || FieldM(instruction) == kPc) Refuse(cpu, kUnpredictable);
    WriteStatus(cpu, instruction, cpu.r[FieldM(instruction)]);
}

void WriteStatusImmediate(Cpu& cpu, uint32_t instruction) {
    WriteStatus(cpu, instruction, RotatedImmediate(cpu, instruction).value);
}

}  // namespace

Handler BranchHandler(unsigned high) { return high & 16 ? Branch<true> : Branch<false>; }

// The saved status register belongs to modes that a program is never in.
Handler StatusHandler(unsigned high, unsigned low) {
    if (high == 0x32) return WriteStatusImmediate;
    if (low != 0) return nullptr;
    if (high == 0x10) return ReadStatus;
    return high == 0x12 ? WriteStatusRegister : nullptr;
}

}  // namespace arm
