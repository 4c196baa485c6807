// The process's guarded blocks and what went wrong with them: what the guard heap of a test and the
// guard of a whole process have in common.
#pragma once

#include "support/guard_blocks.h"

#include <string>
#include <vector>

namespace kortest {

struct HeapFault {
    std::string kind;  // "overrun", "use after free", "double free", ...
    int block;         // number of the block in order of allocation, from 1; 0: no known block
    size_t blockSize;  // bytes asked for
    long offset;       // of the access, from the block's begin
    bool isWrite;
    ULONG_PTR codeOffset;  // of the instruction from the module's base; 0 when seen later
};

// One line per fault; empty when there is none.
std::string FaultReport(const std::vector<HeapFault>& faults);

// There is one in a process and it never ends: a block may be read, and the exception handler must
// know it, when whoever guarded it is gone.
class GuardedMemory {
public:
    // The first call makes it.
    static GuardedMemory& get();

    // The one there is, or nullptr.
    static GuardedMemory* find();

    void* allocate(size_t size, bool isZeroed, HeapFamily family);

    // False for a pointer that is none of its own.
    bool release(void* pointer, HeapFamily family);

    // Always moves the block, as a busy heap might; nullptr when it cannot be had.
    void* resize(void* pointer, size_t size, bool isZeroed, HeapFamily family);

    // As LocalReAlloc does: without LMEM_MOVEABLE a fixed block may only be resized in place, which
    // a full heap refuses.
    void* localResize(void* pointer, size_t size, UINT flags);

    size_t localBytes(const void* pointer);  // 0 for a block that was freed

    bool isOurs(const void* pointer) { return blocks.containing(pointer) != nullptr; }

    GuardedBlocks blocks;
    std::vector<HeapFault> faults;
    GuardedSide side = GuardedSide::End;  // of blocks to come
    HMODULE module = nullptr;             // whose instructions are told by their offset

private:
    GuardedMemory();
    static LONG CALLBACK onAccessViolation(EXCEPTION_POINTERS* exception);
    void note(const char* kind, const GuardedBlock* block, long offset, bool isWrite,
              ULONG_PTR codeOffset = 0);
};

}  // namespace kortest
