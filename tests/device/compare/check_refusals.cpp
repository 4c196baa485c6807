// check_refusals: what the interpreter must not execute, one instruction at a time. What is newer
// than ARMv4 is refused by the reference as well.
#include "arm/cpu.h"
#include "program.h"
#include "reference.h"

#include <sys/mman.h>

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>
#include <vector>

namespace compare {
namespace {

struct Case {
    const char* text;
    uint32_t instruction;
};

// Registers as they are for each case: r0 is kData, r1 kData + 1, r2 kData + 2, r3 4; r13 is the
// stack's middle, r4 a place below it, r5 a place outside what may be written.
constexpr Case kNewer[] = {
    {"bx lr (4T)", 0xE12FFF1E},
    {"blx r1 (5)", 0xE12FFF31},
    {"clz r0, r0 (5)", 0xE16F0F10},
    {"bkpt (5)", 0xE1200070},
    {"ldrd r6, [r0] (5E)", 0xE1C060D0},
    {"strd r6, [r0] (5E)", 0xE1C060F0},
    {"pld [r0] (5E)", 0xF5D0F000},
    {"qadd r0, r1, r2 (5E)", 0xE1020051},
    {"smulbb r0, r1, r2 (5E)", 0xE1600281},
    {"rev r0, r0 (6)", 0xE6BF0F30},
    {"sxtb r0, r0 (6)", 0xE6AF0070},
    {"movw r0, #1 (7)", 0xE3000001},
    {"ldrex r6, [r0] (6)", 0xE1906F9F},
    {"fadds (VFP)", 0xEE300A00},
    {"blx +8 (5)", 0xFA000000},
};

constexpr Case kUnpredictable[] = {
    {"mul r6, r6, r7", 0xE0060796},
    {"mul r15, r6, r7", 0xE00F0796},
    {"umull r6, r6, r7, r8", 0xE0866897},
    {"smull r6, r7, r6, r8", 0xE0C76896},
    {"add r6, pc, r7, lsl r8", 0xE08F6817},
    {"mov pc, r7, lsl r8", 0xE1A0F817},
    {"movs pc, lr", 0xE1B0F00E},
    {"ldr r0, [r0], #4", 0xE4900004},
    {"str r0, [r0, #4]!", 0xE5A00004},
    {"ldr r6, [pc, #4]!", 0xE5BF6004},
    {"ldr r6, [r0, pc]", 0xE790600F},
    {"ldrb pc, [r0]", 0xE5D0F000},
    {"ldrh pc, [r0]", 0xE1D0F0B0},
    {"ldmia r0!, {r0, r6}", 0xE8B00041},
    {"stmia r6!, {r5, r6}", 0xE8A60060},
    {"ldmia r0, {}", 0xE8900000},
    {"ldmia r0, {r6}^", 0xE8D00040},
    {"swp r0, r6, [r0]", 0xE1000096},
};

constexpr Case kAccesses[] = {
    {"ldr r6, [r1]", 0xE5916000},
    {"ldr r6, [r2]", 0xE5926000},
    {"str r6, [r2]", 0xE5826000},
    {"ldrh r6, [r1]", 0xE1D160B0},
    {"strh r6, [r1]", 0xE1C160B0},
    {"ldrsh r6, [r1]", 0xE1D160F0},
    {"ldmia r2, {r6, r7}", 0xE89200C0},
    {"swp r6, r7, [r2]", 0xE1026097},
    {"mov pc, r1", 0xE1A0F001},
    {"str r6, [r4]", 0xE5846000},
    {"strb r6, [sp, #-1]", 0xE54D6001},
    {"stmdb sp, {r6}", 0xE90D0040},
    {"str r6, [r5]", 0xE5856000},
    {"swi 0", 0xEF000000},
    {"msr cpsr_c, r6", 0xE121F006},
    {"mrs r6, spsr", 0xE14F6000},
    {"mcr p15", 0xEE070F15},
};

// Neighbours of the above that are to be executed.
constexpr Case kPermitted[] = {
    {"ldr r6, [r0]", 0xE5906000},       {"strh r6, [r2]", 0xE1C260B0},
    {"strb r6, [r1]", 0xE5C16000},      {"str r6, [sp]", 0xE58D6000},
    {"str r6, [sp, #-4]!", 0xE52D6004}, {"stmdb sp!, {r6, r7}", 0xE92D00C0},
    {"ldr r6, [sp, #-4]", 0xE51D6004},  {"stmia r6!, {r6, r7}", 0xE8A600C0},
    {"mul r6, r7, r6", 0xE0060697},     {"mov pc, r0", 0xE1A0F000},
    {"msr cpsr_f, r6", 0xE128F006},
};

std::vector<uint8_t> pages(arm::kPageCount, 0);

void OnRefusal(arm::Cpu&, const arm::Refusal& refusal) { throw std::string(refusal.reason); }

bool MayWrite(uint32_t address, uint32_t size) {
    return address - kData < kDataSize && address - kData + size <= kDataSize;
}

// Why the interpreter refuses it, or "".
std::string RefusalOf(uint32_t instruction) {
    arm::Cpu cpu;
    cpu.writes = {kData + 0x2000, 0x1000, pages.data(), MayWrite};
    cpu.onRefusal = OnRefusal;
    const uint32_t start[] = {kData, kData + 1, kData + 2, 4, kData + 0x2700, kCode, kData, 0};
    std::memcpy(cpu.r, start, sizeof start);
    cpu.r[arm::kSp] = kData + 0x2800;
    std::memcpy(reinterpret_cast<void*>(uintptr_t{kCode}), &instruction, 4);
    cpu.next = kCode;
    try {
        arm::Step(cpu);
        return "";
    } catch (const std::string& reason) {
        return reason;
    }
}

int failures = 0;

void Expect(bool isRight, const Case& tried, const std::string& seen) {
    if (isRight) return;
    ++failures;
    std::printf("%s (%08x): %s\n", tried.text, tried.instruction, seen.c_str());
}

}  // namespace
}  // namespace compare

int main() {
    using namespace compare;
    mmap(reinterpret_cast<void*>(uintptr_t{kCode}), kCodeSize + kDataSize, PROT_READ | PROT_WRITE,
         MAP_PRIVATE | MAP_ANONYMOUS | MAP_FIXED_NOREPLACE, -1, 0);
    Reference reference;
    int refused = 0;
    for (const Case& tried : kNewer) {
        Expect(!RefusalOf(tried.instruction).empty(), tried, "executed");
        Expect(!reference.executes(tried.instruction), tried, "executed by the reference");
        ++refused;
    }
    for (const Case& tried : kUnpredictable) {
        Expect(!RefusalOf(tried.instruction).empty(), tried, "executed");
        ++refused;
    }
    for (const Case& tried : kAccesses) {
        Expect(!RefusalOf(tried.instruction).empty(), tried, "executed");
        ++refused;
    }
    for (const Case& tried : kPermitted) {
        const std::string reason = RefusalOf(tried.instruction);
        Expect(reason.empty(), tried, "refused: " + reason);
    }
    std::printf("%d instructions to refuse, %d failures\n", refused, failures);
    return failures ? 1 : 0;
}
