#include "arm/decode.h"

#include "arm/operands.h"

namespace arm {
namespace {

void Undefined(Cpu& cpu, uint32_t) { Refuse(cpu, kUndefined); }

// Comparisons that set no flags do not exist: their encodings hold the status register's
// instructions.
bool IsStatus(unsigned high) { return (high & 0x19) == 0x10; }

Handler HandlerAmongOperations(unsigned high, unsigned low) {
    if (low == 9) {
        if (high < 0x10) return MultiplyHandler(high);
        return SwapHandler(high);
    }
    if ((low & 9) == 9) return HalfwordHandler(high, low);
    if (IsStatus(high)) return StatusHandler(high, low);
    return DataProcessingHandler(high, low);
}

Handler FindHandler(unsigned high, unsigned low) {
    switch (high >> 5) {
    case 0: return HandlerAmongOperations(high, low);
    case 1: return IsStatus(high) ? StatusHandler(high, low) : DataProcessingHandler(high, low);
    case 2:
    case 3: return TransferHandler(high, low);
    case 4: return BlockTransferHandler(high);
    case 5: return BranchHandler(high);
    default: return nullptr;  // coprocessor instructions and software interrupts
    }
}

}  // namespace

const std::array<Handler, kHandlerCount> handlers = [] {
    std::array<Handler, kHandlerCount> table{};
    for (unsigned index = 0; index < kHandlerCount; ++index) {
        const Handler found = FindHandler(index >> 4, index & 15);
        table[index] = found ? found : Undefined;
    }
    return table;
}();

}  // namespace arm
