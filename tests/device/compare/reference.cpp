#include "reference.h"

#include "program.h"

#include <cstdio>
#include <cstdlib>
#include <cstring>

namespace compare {
namespace {

constexpr std::array<int, 17> kIds = {
    UC_ARM_REG_R0,  UC_ARM_REG_R1,  UC_ARM_REG_R2,  UC_ARM_REG_R3,  UC_ARM_REG_R4,  UC_ARM_REG_R5,
    UC_ARM_REG_R6,  UC_ARM_REG_R7,  UC_ARM_REG_R8,  UC_ARM_REG_R9,  UC_ARM_REG_R10, UC_ARM_REG_R11,
    UC_ARM_REG_R12, UC_ARM_REG_R13, UC_ARM_REG_R14, UC_ARM_REG_R15, UC_ARM_REG_CPSR};

void Check(uc_err error, const char* what) {
    if (error == UC_ERR_OK) return;
    std::fprintf(stderr, "reference: %s: %s\n", what, uc_strerror(error));
    std::exit(2);
}

}  // namespace

Reference::Reference() : memory_(kCodeSize + kDataSize) {
    Check(uc_open(UC_ARCH_ARM, UC_MODE_ARM, &machine_), "open");
    Check(uc_ctl_set_cpu_model(machine_, UC_CPU_ARM_SA1110), "model");
    Check(uc_mem_map_ptr(machine_, kCode, memory_.size(), UC_PROT_ALL, memory_.data()), "memory");
    uc_hook hook = 0;
    Check(uc_hook_add(machine_, &hook, UC_HOOK_CODE, reinterpret_cast<void*>(onInstruction), this,
                      kCode, kCode + kCodeSize - 1),
          "hook");
}

Reference::~Reference() { uc_close(machine_); }

void Reference::setMemory(uint32_t address, const void* bytes, size_t size) {
    Check(uc_mem_write(machine_, address, bytes, size), "write");
    Check(uc_ctl_remove_cache(machine_, uint64_t{address}, uint64_t{address} + size), "cache");
}

Registers Reference::registers() const {
    Registers values{};
    std::array<void*, 17> places{};
    for (size_t i = 0; i < places.size(); ++i) places[i] = &values[i];
    auto ids = kIds;
    Check(uc_reg_read_batch(machine_, ids.data(), places.data(), 17), "registers");
    return values;
}

void Reference::setRegisters(const Registers& registers) {
    for (size_t i = 0; i < kIds.size(); ++i) {
        if (i != 15) Check(uc_reg_write(machine_, kIds[i], &registers[i]), "register");
    }
}

void Reference::onInstruction(uc_engine*, uint64_t, uint32_t, void* self) {
    static_cast<Reference*>(self)->before_();
}

void Reference::run(uint32_t begin, uint32_t end, const std::function<void()>& before) {
    before_ = before;
    Check(uc_emu_start(machine_, begin, end, 0, 0), "run");
}

bool Reference::executes(uint32_t instruction) {
    const uint32_t words[2] = {instruction, 0xE1A00000};
    setMemory(kCode, words, sizeof words);
    before_ = [] {};
    return uc_emu_start(machine_, kCode, kCode + 4, 0, 1) == UC_ERR_OK;
}

}  // namespace compare
