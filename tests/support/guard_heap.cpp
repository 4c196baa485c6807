#include "support/guard_heap.h"

#include "support/guarded_memory.h"

#include <gtest/gtest.h>

#include <sstream>
#include <utility>

namespace kortest {
namespace {

bool isActive = false;

GuardedMemory& Memory() { return *GuardedMemory::find(); }

ULONG_PTR AsWord(void* pointer) { return reinterpret_cast<ULONG_PTR>(pointer); }
void* AsPointer(ULONG_PTR word) { return reinterpret_cast<void*>(word); }

bool IsOurs(ULONG_PTR pointer) { return Memory().isOurs(AsPointer(pointer)); }

void ReplaceLocalFamily(ImportSpy& spy) {
    spy.watchAll(
        {"LocalAlloc", "LocalReAlloc", "LocalFree", "LocalLock", "LocalUnlock", "LocalSize"});
    const auto replace = [&spy](const char* name, ImportSpy::Handler handler) {
        if (spy.isImported(name)) spy.replace(name, std::move(handler));
    };
    replace("LocalAlloc", [](ULONG_PTR* a) {
        return AsWord(Memory().allocate(a[1], (a[0] & LMEM_ZEROINIT) != 0, HeapFamily::Local));
    });
    replace("LocalReAlloc", [&spy](ULONG_PTR* a) {
        if (!IsOurs(a[0])) return spy.callReal("LocalReAlloc", a);
        return AsWord(Memory().localResize(AsPointer(a[0]), a[1], static_cast<UINT>(a[2])));
    });
    replace("LocalFree", [&spy](ULONG_PTR* a) -> ULONG_PTR {
        if (!a[0] || Memory().release(AsPointer(a[0]), HeapFamily::Local)) return 0;
        return spy.callReal("LocalFree", a);
    });
    replace("LocalLock",
            [&spy](ULONG_PTR* a) { return IsOurs(a[0]) ? a[0] : spy.callReal("LocalLock", a); });
    replace("LocalUnlock", [&spy](ULONG_PTR* a) {
        return IsOurs(a[0]) ? ULONG_PTR{0} : spy.callReal("LocalUnlock", a);
    });
    replace("LocalSize", [&spy](ULONG_PTR* a) {
        return IsOurs(a[0]) ? ULONG_PTR{Memory().localBytes(AsPointer(a[0]))}
                            : spy.callReal("LocalSize", a);
    });
}

void ReplaceMallocFamily(ImportSpy& spy) {
    spy.watchAll({"malloc", "calloc", "realloc", "free"});
    const auto replace = [&spy](const char* name, ImportSpy::Handler handler) {
        if (spy.isImported(name)) spy.replace(name, std::move(handler));
    };
    replace("malloc", [](ULONG_PTR* a) {
        return AsWord(Memory().allocate(a[0], false, HeapFamily::Malloc));
    });
    replace("calloc", [](ULONG_PTR* a) {
        return AsWord(Memory().allocate(a[0] * a[1], true, HeapFamily::Malloc));
    });
    replace("realloc", [&spy](ULONG_PTR* a) {
        if (!a[0]) return AsWord(Memory().allocate(a[1], false, HeapFamily::Malloc));
        if (!IsOurs(a[0])) return spy.callReal("realloc", a);
        return AsWord(Memory().resize(AsPointer(a[0]), a[1], false, HeapFamily::Malloc));
    });
    replace("free", [&spy](ULONG_PTR* a) -> ULONG_PTR {
        if (!a[0] || Memory().release(AsPointer(a[0]), HeapFamily::Malloc)) return 0;
        return spy.callReal("free", a);
    });
}

}  // namespace

GuardHeap::GuardHeap(ImportSpy& spy, std::optional<GuardedSide> side) : spy_(spy) {
    if (isActive) ADD_FAILURE() << "there can be one guard heap at a time";
    isActive = true;
    GuardedMemory& memory = GuardedMemory::get();
    sideBefore_ = std::exchange(memory.side, side.value_or(memory.side));
    moduleBefore_ = std::exchange(memory.module, spy.module());
    faultsBefore_ = memory.faults.size();
    blocksBefore_ = memory.blocks.count();
    ReplaceLocalFamily(spy_);
    ReplaceMallocFamily(spy_);
}

GuardHeap::~GuardHeap() {
    for (const char* name : {"LocalAlloc", "LocalReAlloc", "LocalFree", "LocalLock", "LocalUnlock",
                             "LocalSize", "malloc", "calloc", "realloc", "free"}) {
        if (spy_.isImported(name)) spy_.restore(name);
    }
    // Faults of another library, made to be found, are no concern of the process's own guard.
    if (spy_.module() != LibraryModule()) Memory().faults.resize(faultsBefore_);
    Memory().side = sideBefore_;
    Memory().module = moduleBefore_;
    isActive = false;
}

std::vector<HeapFault> GuardHeap::faults() const {
    const std::vector<HeapFault>& all = Memory().faults;
    return {all.begin() + static_cast<std::ptrdiff_t>(faultsBefore_), all.end()};
}

std::string GuardHeap::report() const { return FaultReport(faults()); }

void GuardHeap::clearFaults() { Memory().faults.resize(faultsBefore_); }

bool GuardHeap::startOver() {
    if (!Memory().blocks.startOver()) return false;
    blocksBefore_ = 0;
    return true;
}

int GuardHeap::live() const {
    return static_cast<int>(Memory().blocks.liveBlocksAfter(blocksBefore_).size());
}

std::string GuardHeap::liveReport() const {
    std::ostringstream text;
    for (const GuardedBlock* block : Memory().blocks.liveBlocksAfter(blocksBefore_)) {
        text << "block " << block->number << " of " << block->size << " bytes\n";
    }
    return text.str();
}

long GuardHeap::localSize(const void* block) const {
    const GuardedBlock* found = Memory().blocks.beginningAt(block);
    if (!found || found->isFreed || found->family != HeapFamily::Local) return -1;
    return static_cast<long>(found->size);
}

void ReleaseLocal(void* block) {
    GuardedMemory* memory = GuardedMemory::find();
    if (memory && memory->release(block, HeapFamily::Local)) return;
    LocalFree(block);
}

}  // namespace kortest
