#include "runner/write_rules.h"

#include <windows.h>

namespace device {

uint8_t writablePages[arm::kPageCount];

namespace {

constexpr DWORD kWritable =
    PAGE_READWRITE | PAGE_WRITECOPY | PAGE_EXECUTE_READWRITE | PAGE_EXECUTE_WRITECOPY;

uint32_t hostFloor;

// The host's stack, from the lowest address it may grow to up to its base.
struct Range {
    uint32_t low, high;
};

Range FindHostStack() {
    MEMORY_BASIC_INFORMATION memory{};
    VirtualQuery(&memory, &memory, sizeof memory);
    uint32_t base = 0;
    asm("movl %%fs:4, %0" : "=r"(base));  // NT_TIB.StackBase
    return {reinterpret_cast<uint32_t>(memory.AllocationBase), base};
}

bool IsHostStack(uint32_t address) {
    static const Range stack = FindHostStack();
    return address >= stack.low && address < stack.high;
}

bool IsOfProgram(const MEMORY_BASIC_INFORMATION& memory) {
    return memory.AllocationBase == reinterpret_cast<void*>(GetModuleHandleW(nullptr));
}

}  // namespace

bool MayWrite(uint32_t address, uint32_t) {
    if (IsHostStack(address)) return address >= hostFloor;
    MEMORY_BASIC_INFORMATION memory{};
    const DWORD error = GetLastError();
    const bool isKnown =
        VirtualQuery(reinterpret_cast<void*>(address), &memory, sizeof memory) == sizeof memory;
    SetLastError(error);
    if (!isKnown || memory.State != MEM_COMMIT) return true;  // the access itself would fault
    if (!(memory.Protect & kWritable)) return false;
    if (memory.Type == MEM_IMAGE && !IsOfProgram(memory)) return false;
    writablePages[address >> arm::kPageBits] = 1;
    return true;
}

uint32_t SetHostFloor(uint32_t floor) {
    const uint32_t before = hostFloor;
    hostFloor = floor;
    return before;
}

}  // namespace device
