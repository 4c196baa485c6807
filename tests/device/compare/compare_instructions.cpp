// compare_instructions [COUNT [SEED]]: executes random programs on the interpreter and on the
// reference, and compares all registers and flags before each instruction, and the memory after
// each program. Goes on until COUNT instructions have been compared (default: ten million).
#include "arm/cpu.h"
#include "program.h"
#include "reference.h"

#include <sys/mman.h>

#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <vector>

namespace compare {
namespace {

constexpr unsigned kGroups = 120;         // of a program
constexpr unsigned kRunsPerProgram = 25;  // each with other registers and other data
constexpr uint64_t kReportedDifferences = 10;

std::vector<uint8_t> allPages(arm::kPageCount, 1);

// The interpreter's own copy of the memory, at the guest's addresses.
uint8_t* MapMemory() {
    void* place =
        mmap(reinterpret_cast<void*>(uintptr_t{kCode}), kCodeSize + kDataSize,
             PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS | MAP_FIXED_NOREPLACE, -1, 0);
    if (place != reinterpret_cast<void*>(uintptr_t{kCode})) {
        std::perror("compare_instructions: mmap");
        std::exit(2);
    }
    return static_cast<uint8_t*>(place);
}

void OnRefusal(arm::Cpu& cpu, const arm::Refusal& refusal) {
    const auto word = *reinterpret_cast<uint32_t*>(uintptr_t{refusal.instruction});
    std::printf("refused at +%x: %s (instruction %08x, address %08x, sp %08x)\n",
                refusal.instruction - kProgram, refusal.reason, word, refusal.address, cpu.r[13]);
    std::exit(1);
}

class Comparison {
public:
    Comparison() : memory_(MapMemory()) {
        cpu_.writes.pages = allPages.data();
        cpu_.onRefusal = OnRefusal;
        cpu_.control = reference_.registers()[16] & ~arm::kFlags;
    }

    uint64_t compared() const { return compared_; }
    uint64_t differing() const { return differing_; }

    void program(Random& random) {
        const std::vector<uint32_t> words = RandomProgram(random, kGroups);
        std::memcpy(memory_ + (kProgram - kCode), words.data(), words.size() * 4);
        reference_.setMemory(kProgram, words.data(), words.size() * 4);
        end_ = kProgram + static_cast<uint32_t>(words.size() - 1) * 4;
        for (unsigned i = 0; i < kRunsPerProgram; ++i) run(random);
    }

private:
    void run(Random& random) {
        setState(random);
        reference_.run(kProgram, end_, [this] { step(); });
        compareRegisters();
        if (std::memcmp(memory_, reference_.memory().data(), kCodeSize + kDataSize) != 0) {
            differ("memory after a program");
        }
    }

    void setState(Random& random) {
        for (uint32_t i = 0; i < kDataSize; ++i)
            memory_[kCodeSize + i] = static_cast<uint8_t>(random());
        reference_.setMemory(kData, memory_ + kCodeSize, kDataSize);
        Registers start{};
        for (unsigned i = 0; i < 15; ++i) cpu_.r[i] = start[i] = RandomValue(random);
        cpu_.r[kBaseRegister] = start[kBaseRegister] = kMiddle;
        cpu_.flags = static_cast<uint32_t>(random()) & arm::kFlags;
        start[16] = cpu_.flags | cpu_.control;
        reference_.setRegisters(start);
        cpu_.next = kProgram;
        previous_ = 0;
    }

    // The reference is about to execute an instruction: so is the interpreter, in the same state?
    void step() {
        compareRegisters();
        previous_ = cpu_.next;
        arm::Step(cpu_);
        ++compared_;
    }

    void compareRegisters() {
        const Registers wanted = reference_.registers();
        bool isSame = cpu_.next == wanted[15] && (cpu_.flags | cpu_.control) == wanted[16];
        for (unsigned i = 0; i < 15; ++i) isSame = isSame && cpu_.r[i] == wanted[i];
        if (isSame) return;
        differ("registers");
        if (differing_ <= kReportedDifferences) print(wanted);
        for (unsigned i = 0; i < 15; ++i) cpu_.r[i] = wanted[i];
        cpu_.next = wanted[15];
        cpu_.flags = wanted[16] & arm::kFlags;
    }

    void differ(const char* what) {
        if (++differing_ > kReportedDifferences) return;
        const uint32_t word = previous_ ? *reinterpret_cast<uint32_t*>(uintptr_t{previous_}) : 0;
        std::printf("%s differ after %08x at +%x\n", what, word, previous_ - kProgram);
    }

    void print(const Registers& wanted) const {
        for (unsigned i = 0; i < 15; ++i) {
            if (cpu_.r[i] != wanted[i]) {
                std::printf("  r%u is %08x, not %08x\n", i, cpu_.r[i], wanted[i]);
            }
        }
        std::printf("  next %08x, wanted %08x; status %08x, wanted %08x\n", cpu_.next, wanted[15],
                    cpu_.flags | cpu_.control, wanted[16]);
    }

    uint8_t* memory_;
    Reference reference_;
    arm::Cpu cpu_;
    uint32_t end_ = 0;
    uint32_t previous_ = 0;  // address of the instruction that was executed last
    uint64_t compared_ = 0;
    uint64_t differing_ = 0;
};

}  // namespace
}  // namespace compare

int main(int argc, char** argv) {
    const uint64_t count = argc > 1 ? std::strtoull(argv[1], nullptr, 10) : 10'000'000;
    compare::Random random(argc > 2 ? static_cast<unsigned>(std::atoi(argv[2])) : 1);
    compare::Comparison comparison;
    while (comparison.compared() < count) comparison.program(random);
    std::printf("%llu instructions compared, %llu differing\n",
                static_cast<unsigned long long>(comparison.compared()),
                static_cast<unsigned long long>(comparison.differing()));
    return comparison.differing() ? 1 : 0;
}
