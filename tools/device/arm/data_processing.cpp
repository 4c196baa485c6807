// The sixteen data-processing operations: logic, addition, comparison, moves.
#include "arm/decode.h"
#include "arm/operands.h"

#include <cstddef>
#include <utility>

namespace arm {
namespace {

enum Operation : unsigned {
    kAnd,
    kEor,
    kSub,
    kRsb,
    kAdd,
    kAdc,
    kSbc,
    kRsc,
    kTst,
    kTeq,
    kCmp,
    kCmn,
    kOrr,
    kMov,
    kBic,
    kMvn
};

enum class Operand { Immediate, ShiftedByImmediate, ShiftedByRegister };

constexpr bool IsComparison(unsigned operation) { return operation >= kTst && operation <= kCmn; }

constexpr bool IsLogic(unsigned operation) {
    return operation <= kEor || operation == kTst || operation == kTeq || operation >= kOrr;
}

constexpr bool HasNoFirstOperand(unsigned operation) {
    return operation == kMov || operation == kMvn;
}

template <Operand operand>
Shifted SecondOperand(const Cpu& cpu, uint32_t instruction) {
    if constexpr (operand == Operand::Immediate) return RotatedImmediate(cpu, instruction);
    if constexpr (operand == Operand::ShiftedByRegister) return ShiftByRegister(cpu, instruction);
    if ((instruction & 0xFF0) == 0) {
        return {cpu.r[FieldM(instruction)], cpu.flags & kCarry};
    }
    return ShiftByImmediate(cpu, instruction);
}

constexpr uint32_t SignAndZero(uint32_t value) { return (value & kNegative) | (value ? 0 : kZero); }

struct Sum {
    uint32_t value;
    uint32_t flags;
};

// Subtraction is addition of the complement: the carry then means "no borrow".
constexpr Sum AddWithCarry(uint32_t a, uint32_t b, uint32_t carry) {
    const uint64_t wide = uint64_t{a} + b + carry;
    const auto value = static_cast<uint32_t>(wide);
    const uint32_t overflow = (~(a ^ b) & (a ^ value)) >> 31 ? kOverflow : 0;
    return {value, SignAndZero(value) | CarryIf(static_cast<uint32_t>(wide >> 32)) | overflow};
}

template <unsigned operation>
Sum Arithmetic(const Cpu& cpu, uint32_t a, uint32_t b) {
    const uint32_t carry = cpu.flags >> 29 & 1;
    switch (operation) {
    case kSub:
    case kCmp: return AddWithCarry(a, ~b, 1);
    case kRsb: return AddWithCarry(b, ~a, 1);
    case kAdc: return AddWithCarry(a, b, carry);
    case kSbc: return AddWithCarry(a, ~b, carry);
    case kRsc: return AddWithCarry(b, ~a, carry);
    default: return AddWithCarry(a, b, 0);
    }
}

template <unsigned operation>
uint32_t Logic(uint32_t a, uint32_t b) {
    switch (operation) {
    case kAnd:
    case kTst: return a & b;
    case kEor:
    case kTeq: return a ^ b;
    case kOrr: return a | b;
    case kBic: return a & ~b;
    case kMvn: return ~b;
    default: return b;
    }
}

template <unsigned operation>
Sum Result(const Cpu& cpu, uint32_t a, Shifted b) {
    if constexpr (IsLogic(operation)) {
        const uint32_t value = Logic<operation>(a, b.value);
        return {value, SignAndZero(value) | b.carry | (cpu.flags & kOverflow)};
    } else {
        return Arithmetic<operation>(cpu, a, b.value);
    }
}

template <unsigned operation, bool setsFlags, Operand operand>
void Process(Cpu& cpu, uint32_t instruction) {
    const unsigned d = FieldD(instruction);
    const unsigned n = FieldN(instruction);
    if constexpr (operand == Operand::ShiftedByRegister) {
        if (d == kPc || n == kPc || FieldS(instruction) == kPc || FieldM(instruction) == kPc) {
            Refuse(cpu, kUnpredictable);
        }
    }
    if (IsComparison(operation) ? d != 0 : HasNoFirstOperand(operation) && n != 0) {
        Refuse(cpu, kUnpredictable);
    }
    const Shifted second = SecondOperand<operand>(cpu, instruction);
    const Sum result = Result<operation>(cpu, cpu.r[n], second);
    if constexpr (!IsComparison(operation)) {
        if (d == kPc) {
            if (setsFlags) Refuse(cpu, kUnpredictable);  // returns from an exception
            JumpTo(cpu, result.value);
            return;
        }
        cpu.r[d] = result.value;
    }
    if constexpr (setsFlags) cpu.flags = result.flags;
}

using Row = std::array<Handler, 32>;  // by operation and flag bit

template <Operand operand, std::size_t... places>
constexpr Row MakeRow(std::index_sequence<places...>) {
    return {Process<places / 2, places % 2 != 0, operand>...};
}

template <Operand operand>
constexpr Row kRow = MakeRow<operand>(std::make_index_sequence<32>());

}  // namespace

Handler DataProcessingHandler(unsigned high, unsigned low) {
    const unsigned place = high & 31;
    if (high & 0x20) return kRow<Operand::Immediate>[place];
    if (low & 1) return kRow<Operand::ShiftedByRegister>[place];
    return kRow<Operand::ShiftedByImmediate>[place];
}

}  // namespace arm
