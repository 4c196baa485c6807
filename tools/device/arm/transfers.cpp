// Loads and stores of one register: words, bytes, halfwords, signed bytes; and the swap.
#include "arm/decode.h"
#include "arm/operands.h"

#include <cstddef>
#include <utility>

namespace arm {
namespace {

// Bits 24 to 20 of a transfer.
struct Mode {
    bool isBefore;  // the offset is applied before the access, else after it
    bool isUp;
    bool isByte;  // in halfword transfers: the offset is an immediate
    bool writesBack;
    bool isLoad;
};

constexpr Mode ModeOf(unsigned bits) {
    return {(bits & 16) != 0, (bits & 8) != 0, (bits & 4) != 0, (bits & 2) != 0, (bits & 1) != 0};
}

constexpr bool ChangesBase(Mode mode) { return !mode.isBefore || mode.writesBack; }

// Returns the address to access, and updates the base register.
template <unsigned bits>
uint32_t AddressAndBase(Cpu& cpu, uint32_t instruction, uint32_t offset) {
    constexpr Mode mode = ModeOf(bits);
    const unsigned n = FieldN(instruction);
    if (ChangesBase(mode) && (n == kPc || n == FieldD(instruction))) Refuse(cpu, kUnpredictable);
    const uint32_t base = cpu.r[n];
    const uint32_t moved = mode.isUp ? base + offset : base - offset;
    if (ChangesBase(mode)) cpu.r[n] = moved;
    return mode.isBefore ? moved : base;
}

template <unsigned bits>
uint32_t RegisterOffset(Cpu& cpu, uint32_t instruction) {
    const unsigned m = FieldM(instruction);
    if (m == kPc || (ChangesBase(ModeOf(bits)) && m == FieldN(instruction))) {
        Refuse(cpu, kUnpredictable);
    }
    return cpu.r[m];
}

// Bit 5 of `bits`: the offset is a shifted register.
template <unsigned bits>
void Transfer(Cpu& cpu, uint32_t instruction) {
    constexpr Mode mode = ModeOf(bits & 31);
    uint32_t offset = instruction & 0xFFF;
    if (bits & 32) {
        RegisterOffset<bits & 31>(cpu, instruction);
        offset = ShiftByImmediate(cpu, instruction).value;
    }
    const uint32_t address = AddressAndBase<bits & 31>(cpu, instruction, offset);
    const unsigned d = FieldD(instruction);
    if (mode.isByte) {
        if (d == kPc) Refuse(cpu, kUnpredictable);
        if (mode.isLoad) {
            cpu.r[d] = Load<uint8_t>(cpu, address);
        } else {
            Store<uint8_t>(cpu, address, cpu.r[d]);
        }
    } else if (mode.isLoad) {
        const auto value = Load<uint32_t>(cpu, address);
        if (d == kPc) return JumpTo(cpu, value);
        cpu.r[d] = value;
    } else {
        Store<uint32_t>(cpu, address, cpu.r[d]);
    }
}

enum HalfwordKind : unsigned { kHalfword = 1, kSignedByte = 2, kSignedHalfword = 3 };

template <unsigned kind>
uint32_t LoadExtended(Cpu& cpu, uint32_t address) {
    if (kind == kHalfword) return Load<uint16_t>(cpu, address);
    const int32_t value =
        kind == kSignedByte ? int32_t{Load<int8_t>(cpu, address)} : Load<int16_t>(cpu, address);
    return static_cast<uint32_t>(value);
}

template <unsigned bits, unsigned kind>
void TransferHalfword(Cpu& cpu, uint32_t instruction) {
    constexpr Mode mode = ModeOf(bits);
    const bool hasStrayBits = !mode.isByte && FieldS(instruction) != 0;
    if (FieldD(instruction) == kPc || (!mode.isBefore && mode.writesBack) || hasStrayBits) {
        Refuse(cpu, kUnpredictable);
    }
    const uint32_t offset = mode.isByte ? (instruction >> 4 & 0xF0) | (instruction & 15)
                                        : RegisterOffset<bits>(cpu, instruction);
    const uint32_t address = AddressAndBase<bits>(cpu, instruction, offset);
    if (mode.isLoad) {
        cpu.r[FieldD(instruction)] = LoadExtended<kind>(cpu, address);
    } else {
        Store<uint16_t>(cpu, address, cpu.r[FieldD(instruction)]);
    }
}

template <typename Value>
void Swap(Cpu& cpu, uint32_t instruction) {
    const unsigned n = FieldN(instruction), d = FieldD(instruction), m = FieldM(instruction);
    if (n == kPc || d == kPc || m == kPc || n == d || n == m || FieldS(instruction) != 0) {
        Refuse(cpu, kUnpredictable);
    }
    const uint32_t address = cpu.r[n];
    const auto value = Load<Value>(cpu, address);
    Store<Value>(cpu, address, cpu.r[m]);
    cpu.r[d] = value;
}

template <std::size_t... places>
constexpr auto MakeTransfers(std::index_sequence<places...>) {
    return std::array<Handler, 64>{Transfer<places>...};
}

template <unsigned kind, std::size_t... places>
constexpr auto MakeHalfwords(std::index_sequence<places...>) {
    return std::array<Handler, 32>{TransferHalfword<places, kind>...};
}

constexpr auto kTransfers = MakeTransfers(std::make_index_sequence<64>());
constexpr auto kHalfwords = MakeHalfwords<kHalfword>(std::make_index_sequence<32>());
constexpr auto kSignedBytes = MakeHalfwords<kSignedByte>(std::make_index_sequence<32>());
constexpr auto kSignedHalfwords = MakeHalfwords<kSignedHalfword>(std::make_index_sequence<32>());

}  // namespace

Handler TransferHandler(unsigned high, unsigned low) {
    const bool hasRegister = (high & 0x20) != 0;
    if (hasRegister && (low & 1)) return nullptr;
    return kTransfers[high & 63];
}

// Signed stores do not exist: their encodings hold the loads and stores of register pairs, which
// are newer.
Handler HalfwordHandler(unsigned high, unsigned low) {
    const unsigned kind = low >> 1 & 3;
    if (kind == kHalfword) return kHalfwords[high & 31];
    if (!(high & 1)) return nullptr;
    return kind == kSignedByte ? kSignedBytes[high & 31] : kSignedHalfwords[high & 31];
}

Handler SwapHandler(unsigned high) {
    if (high == 0x10) return Swap<uint32_t>;
    return high == 0x14 ? Swap<uint8_t> : nullptr;
}

}  // namespace arm
