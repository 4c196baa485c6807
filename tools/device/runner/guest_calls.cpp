#include "runner/guest_calls.h"

#include "runner/counters.h"
#include "runner/failure.h"
#include "runner/image.h"
#include "runner/imports.h"
#include "runner/write_rules.h"

#include <windows.h>

#include <cstring>

namespace device {

arm::Cpu cpu;

namespace {

constexpr uint32_t kStackSize = 1024 * 1024;
constexpr uint32_t kStackGuard = 64 * 1024;  // without access, below the stack
constexpr uint32_t kStackHeadroom = 256;     // callees are passed words beyond their arguments
constexpr uint32_t kExitsSize = 64 * 1024;
constexpr uint32_t kPoison = 0xDEAD0000;       // plus the register's number
constexpr uint32_t kKeptPattern = 0xCAFE0000;  // the same, for registers that callees must preserve

uint32_t exits;  // one word per import, after one for the return from the guest; no access
DWORD thread;    // the only one that the guest runs on

struct Saved {
    uint32_t r[16];
    uint32_t flags, next;
};

Saved Save() {
    Saved saved{{}, cpu.flags, cpu.next};
    std::memcpy(saved.r, cpu.r, sizeof saved.r);
    return saved;
}

void Restore(const Saved& saved) {
    std::memcpy(cpu.r, saved.r, sizeof saved.r);
    cpu.flags = saved.flags;
    cpu.next = saved.next;
}

// Registers and flags that a call leaves undefined get values that no code can want.
void PoisonAfterCall(bool isWide) {
    for (const unsigned i : {2u, 3u, 12u, arm::kLr}) cpu.r[i] = kPoison + i;
    if (!isWide) cpu.r[1] = kPoison + 1;
    cpu.flags ^= arm::kFlags;
}

void CallImport(unsigned index) {
    const uint32_t back = cpu.r[arm::kLr];
    bool isWide = false;
    const uint64_t result = CallImportedFunction(index, cpu, isWide);
    cpu.r[0] = static_cast<uint32_t>(result);
    cpu.r[1] = static_cast<uint32_t>(result >> 32);
    PoisonAfterCall(isWide);
    cpu.next = back;
}

// Every second call has a stack pointer that is a multiple of 8, the others a multiple of 4 only,
// as on the device.
void SetArguments(const uint32_t* words, unsigned count) {
    static uint32_t skew = 0;
    skew ^= 4;
    uint32_t& sp = cpu.r[arm::kSp];
    sp = (sp & ~7u) - 8 - skew;
    const unsigned onStack = count > 4 ? count - 4 : 0;
    sp -= 4 * onStack;
    for (unsigned i = 0; i < 4; ++i) cpu.r[i] = i < count ? words[i] : kPoison + i;
    std::memcpy(reinterpret_cast<void*>(sp), words + 4, 4 * onStack);
}

void RunToEnd() {
    for (;;) {
        RunCounted(cpu);
        const uint32_t place = cpu.next - exits;
        if (place == 0) return;
        if (place >= kExitsSize) {
            arm::Refuse(cpu, "a jump out of the image", cpu.next);
        }
        CallImport(place / 4 - 1);
    }
}

void CheckKept(uint32_t sp) {
    if (cpu.r[arm::kSp] != sp) {
        ReportRegisters(cpu);
        Fail("the stack pointer came back as %08x, not %08x",
             static_cast<unsigned>(cpu.r[arm::kSp]), static_cast<unsigned>(sp));
    }
    for (unsigned i = 4; i < 12; ++i) {
        if (cpu.r[i] == kKeptPattern + i) continue;
        ReportRegisters(cpu);
        Fail("r%u was not put back", i);
    }
}

}  // namespace

void PrepareGuestCalls() {
    thread = GetCurrentThreadId();
    exits =
        reinterpret_cast<uint32_t>(VirtualAlloc(nullptr, kExitsSize, MEM_RESERVE, PAGE_NOACCESS));
    auto* room = static_cast<uint8_t*>(
        VirtualAlloc(nullptr, kStackGuard + kStackSize, MEM_RESERVE, PAGE_NOACCESS));
    auto* stack =
        room ? VirtualAlloc(room + kStackGuard, kStackSize, MEM_COMMIT, PAGE_READWRITE) : nullptr;
    if (!exits || !stack) Fail("no room for the guest's stack");
    std::memset(stack, kUnusedStack & 0xFF, kStackSize);
    cpu.writes.stackLow = reinterpret_cast<uint32_t>(stack);
    cpu.writes.stackSize = kStackSize;
    cpu.writes.pages = writablePages;
    cpu.writes.mayWrite = MayWrite;
    cpu.onRefusal = FailAtInstruction;
    cpu.r[arm::kSp] = cpu.writes.stackLow + kStackSize - kStackHeadroom;
    counters().stackLow = cpu.writes.stackLow;
    counters().stackSize = kStackSize;
}

uint32_t ImportAddress(unsigned index) {
    const uint32_t offset = 4 * (index + 1);
    if (offset >= kExitsSize) Fail("too many imports");
    return exits + offset;
}

uint64_t CallGuest(uint32_t function, const uint32_t* words, unsigned count, uint32_t hostFloor) {
    if (GetCurrentThreadId() != thread) Fail("a call from another thread");
    const Saved saved = Save();
    const uint32_t outerFloor = SetHostFloor(hostFloor);
    SetArguments(words, count);
    const uint32_t sp = cpu.r[arm::kSp];
    for (unsigned i = 4; i < 12; ++i) cpu.r[i] = kKeptPattern + i;
    cpu.r[12] = kPoison + 12;
    cpu.r[arm::kLr] = exits;
    cpu.r[arm::kPc] = function + 8;
    cpu.next = function;
    RunToEnd();
    CheckKept(sp);
    const uint64_t result = uint64_t{cpu.r[1]} << 32 | cpu.r[0];
    SetHostFloor(outerFloor);
    Restore(saved);
    return result;
}

}  // namespace device
