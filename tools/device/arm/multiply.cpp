// Multiplications.
#include "arm/decode.h"
#include "arm/operands.h"

namespace arm {
namespace {

// The carry and overflow flags are unchanged; ARMv4 does not say what becomes of the carry.
void SetSignAndZero(Cpu& cpu, bool isNegative, bool isZero) {
    cpu.flags =
        (cpu.flags & (kCarry | kOverflow)) | (isNegative ? kNegative : 0) | (isZero ? kZero : 0);
}

template <bool accumulates, bool setsFlags>
void Multiply(Cpu& cpu, uint32_t instruction) {
    const unsigned d = FieldN(instruction), n = FieldD(instruction);
    const unsigned s = FieldS(instruction), m = FieldM(instruction);
    if (d == m || d == kPc || m == kPc || s == kPc || (accumulates ? n == kPc : n != 0)) {
        Refuse(cpu, kUnpredictable);
    }
    uint32_t value = cpu.r[m] * cpu.r[s];
    if (accumulates) value += cpu.r[n];
    cpu.r[d] = value;
    if (setsFlags) SetSignAndZero(cpu, (value & kNegative) != 0, value == 0);
}

template <bool isSigned, bool accumulates, bool setsFlags>
void MultiplyLong(Cpu& cpu, uint32_t instruction) {
    const unsigned high = FieldN(instruction), low = FieldD(instruction);
    const unsigned s = FieldS(instruction), m = FieldM(instruction);
    if (high == low || high == m || low == m || high == kPc || low == kPc || m == kPc || s == kPc) {
        Refuse(cpu, kUnpredictable);
    }
    uint64_t value = 0;
    if (isSigned) {
        value = static_cast<uint64_t>(int64_t{static_cast<int32_t>(cpu.r[m])} *
                                      static_cast<int32_t>(cpu.r[s]));
    } else {
        value = uint64_t{cpu.r[m]} * cpu.r[s];
    }
    if (accumulates) value += uint64_t{cpu.r[high]} << 32 | cpu.r[low];
    cpu.r[low] = static_cast<uint32_t>(value);
    cpu.r[high] = static_cast<uint32_t>(value >> 32);
    if (setsFlags) SetSignAndZero(cpu, (value >> 63) != 0, value == 0);
}

constexpr Handler kShort[] = {Multiply<false, false>, Multiply<false, true>, Multiply<true, false>,
                              Multiply<true, true>};

constexpr Handler kLong[] = {
    MultiplyLong<false, false, false>, MultiplyLong<false, false, true>,
    MultiplyLong<false, true, false>,  MultiplyLong<false, true, true>,
    MultiplyLong<true, false, false>,  MultiplyLong<true, false, true>,
    MultiplyLong<true, true, false>,   MultiplyLong<true, true, true>,
};

}  // namespace

Handler MultiplyHandler(unsigned high) {
    if (high < 4) return kShort[high];
    return high >= 8 ? kLong[high - 8] : nullptr;
}

}  // namespace arm
