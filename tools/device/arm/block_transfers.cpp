// Block transfers: loads and stores of several registers.
#include "arm/decode.h"
#include "arm/operands.h"

#include <bit>

namespace arm {
namespace {

// Address of the lowest word that is transferred: the lowest register always has the lowest
// address.
constexpr uint32_t LowestAddress(uint32_t base, uint32_t bytes, bool isUp, bool isBefore) {
    if (isUp) return isBefore ? base + 4 : base;
    return isBefore ? base - bytes : base - bytes + 4;
}

// A base register that is in the list and is written back: its value is predictable only when it is
// the first one that is stored.
constexpr bool IsPredictable(uint32_t list, unsigned n, bool isLoad, bool writesBack) {
    if (!list || n == kPc) return false;
    if (!writesBack || !(list >> n & 1)) return true;
    return !isLoad && !(list & ((1u << n) - 1));
}

void LoadList(Cpu& cpu, uint32_t list, uint32_t address) {
    for (unsigned i = 0; i < kPc; ++i) {
        if (!(list >> i & 1)) continue;
        cpu.r[i] = Load<uint32_t>(cpu, address);
        address += 4;
    }
    if (list >> kPc & 1) JumpTo(cpu, Load<uint32_t>(cpu, address));
}

void StoreList(Cpu& cpu, uint32_t list, uint32_t address, unsigned n, uint32_t base) {
    for (unsigned i = 0; i <= kPc; ++i) {
        if (!(list >> i & 1)) continue;
        Store<uint32_t>(cpu, address, i == n ? base : cpu.r[i]);
        address += 4;
    }
}

template <bool isBefore, bool isUp, bool writesBack, bool isLoad>
void TransferBlock(Cpu& cpu, uint32_t instruction) {
    const unsigned n = FieldN(instruction);
    const uint32_t list = instruction & 0xFFFF;
    if (!IsPredictable(list, n, isLoad, writesBack)) Refuse(cpu, kUnpredictable);
    const auto bytes = static_cast<uint32_t>(4 * std::popcount(list));
    const uint32_t base = cpu.r[n];
    const uint32_t lowest = LowestAddress(base, bytes, isUp, isBefore);
    if (writesBack) cpu.r[n] = isUp ? base + bytes : base - bytes;
    if (isLoad) {
        LoadList(cpu, list, lowest);
    } else {
        StoreList(cpu, list, lowest, n, base);
    }
}

template <bool isBefore, bool isUp>
Handler Choose(bool writesBack, bool isLoad) {
    if (writesBack) {
        return isLoad ? TransferBlock<isBefore, isUp, true, true>
                      : TransferBlock<isBefore, isUp, true, false>;
    }
    return isLoad ? TransferBlock<isBefore, isUp, false, true>
                  : TransferBlock<isBefore, isUp, false, false>;
}

}  // namespace

Handler BlockTransferHandler(unsigned high) {
    if (high & 4) return nullptr;  // transfers another mode's registers
    const bool writesBack = (high & 2) != 0, isLoad = (high & 1) != 0;
    if (high & 16) {
        return high & 8 ? Choose<true, true>(writesBack, isLoad)
                        : Choose<true, false>(writesBack, isLoad);
    }
    return high & 8 ? Choose<false, true>(writesBack, isLoad)
                    : Choose<false, false>(writesBack, isLoad);
}

}  // namespace arm
