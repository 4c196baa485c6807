// The processor to compare with: a Unicorn machine as an SA-1110, the processor of many Windows CE
// devices.
#pragma once

#include <unicorn/unicorn.h>

#include <array>
#include <cstdint>
#include <functional>
#include <vector>

namespace compare {

// r0 to r15 (the address of the next instruction) and the whole status register.
using Registers = std::array<uint32_t, 17>;

class Reference {
public:
    Reference();
    ~Reference();
    Reference(const Reference&) = delete;
    Reference& operator=(const Reference&) = delete;

    void setMemory(uint32_t address, const void* bytes, size_t size);
    const std::vector<uint8_t>& memory() const { return memory_; }
    Registers registers() const;
    void setRegisters(const Registers& registers);  // but for the program counter

    // Executes from `begin` until `end` is next. Calls `before` ahead of each instruction.
    void run(uint32_t begin, uint32_t end, const std::function<void()>& before);

    // Whether the machine takes the one instruction.
    bool executes(uint32_t instruction);

private:
    static void onInstruction(uc_engine*, uint64_t, uint32_t, void* self);

    uc_engine* machine_ = nullptr;
    std::vector<uint8_t> memory_;  // from kCode on
    std::function<void()> before_;
};

}  // namespace compare
