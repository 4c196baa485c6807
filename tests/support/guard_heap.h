// Gives the library heap blocks that end at a page nobody may touch.
//
// LocalAlloc, LocalReAlloc, LocalFree (with LocalLock, LocalUnlock and LocalSize) and the malloc
// family of the library are replaced through the import spy. An access past a block's end or to a
// freed block is noted and then let through, so that one run can report several.
#pragma once

#include "support/import_spy.h"

#include <string>
#include <vector>

namespace kortest {

struct HeapFault {
    std::string kind;  // "overrun", "use after free", "double free", ...
    int block;         // number of the block in order of allocation, from 1; 0: no known block
    size_t blockSize;  // bytes asked for
    long offset;       // of the access, from the block's begin
    bool isWrite;
    ULONG_PTR codeOffset;  // of the instruction from the library's base; 0 when seen later
};

// One at a time; it outlives every window of the library made during its life.
//
// Compiled 64-bit code may rely on blocks at multiples of 16 bytes, so there a read of the few
// bytes between a block's end and the next such multiple goes unseen (a write is seen when it is
// freed).
class GuardHeap {
public:
    explicit GuardHeap(ImportSpy& spy, size_t alignment = sizeof(void*) == 4 ? 1 : 16);
    ~GuardHeap();
    GuardHeap(const GuardHeap&) = delete;
    GuardHeap& operator=(const GuardHeap&) = delete;

    const std::vector<HeapFault>& faults() const;
    std::string report() const;  // one line per fault; empty when there is none
    void clearFaults();

    // Between two lives of a library that has freed everything: what one left behind is not seen in
    // the next any more, but the address space lasts for any number of them. False while a block
    // lives.
    bool startOver();

    int live() const;                // blocks handed out and not freed
    std::string liveReport() const;  // their numbers and sizes

    // Size in bytes of the live LocalAlloc block that begins at `block`, or -1.
    long localSize(const void* block) const;

private:
    ImportSpy& spy_;
};

// Frees a block that the library gave away, whether a guard heap made it or not.
void ReleaseLocal(void* block);

}  // namespace kortest
