// Gives the library heap blocks that end, or begin, at a page nobody may touch.
//
// LocalAlloc, LocalReAlloc, LocalFree (with LocalLock, LocalUnlock and LocalSize) and the malloc
// family of the library are replaced through the import spy. An access past that side of a block or
// to a freed block is noted and then let through, so that one run can report several.
#pragma once

#include "support/guarded_memory.h"
#include "support/import_spy.h"

#include <optional>
#include <string>
#include <vector>

namespace kortest {

// One at a time, also where the whole process is guarded (process_guard.cpp); it outlives every
// window of the library made during its life.
//
// Compiled 64-bit code may rely on blocks at multiples of 16 bytes, so there a read of the few
// bytes between a block's end and the next such multiple goes unseen (a write is seen when it is
// freed).
class GuardHeap {
public:
    // Without a side it is the process's own, or the end.
    explicit GuardHeap(ImportSpy& spy, std::optional<GuardedSide> side = {});
    ~GuardHeap();
    GuardHeap(const GuardHeap&) = delete;
    GuardHeap& operator=(const GuardHeap&) = delete;

    std::vector<HeapFault> faults() const;
    std::string report() const;  // one line per fault; empty when there is none
    void clearFaults();          // once they are reported, or were made on purpose

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
    GuardedSide sideBefore_;
    HMODULE moduleBefore_;
    size_t faultsBefore_;
    int blocksBefore_;
};

// Frees a block that the library gave away, whether a guard heap made it or not.
void ReleaseLocal(void* block);

}  // namespace kortest
