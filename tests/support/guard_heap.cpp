#include "support/guard_heap.h"

#include "support/guard_blocks.h"

#include <gtest/gtest.h>

#include <algorithm>
#include <cstring>
#include <sstream>

namespace kortest {
namespace {

// Blocks and faults outlive the GuardHeap object: the library may still read a block then, and the
// exception handler must know it.
struct HeapState {
    GuardedBlocks blocks;
    std::vector<HeapFault> faults;
    HMODULE module;
    bool isActive;
    int blocksBefore;  // those belong to an earlier GuardHeap
};

HeapState* state = nullptr;

void NoteFault(const char* kind, const GuardedBlock* block, long offset, bool isWrite,
               ULONG_PTR codeOffset = 0) {
    state->faults.push_back(
        {kind, block ? block->number : 0, block ? block->size : 0, offset, isWrite, codeOffset});
}

// Reports an access to a guard page or a freed block, then maps the page so that the access
// succeeds.
LONG CALLBACK OnAccessViolation(EXCEPTION_POINTERS* exception) {
    const EXCEPTION_RECORD& record = *exception->ExceptionRecord;
    if (record.ExceptionCode != EXCEPTION_ACCESS_VIOLATION) return EXCEPTION_CONTINUE_SEARCH;
    auto* address = reinterpret_cast<BYTE*>(record.ExceptionInformation[1]);
    const GuardedBlock* block = state->blocks.containing(address);
    if (!block) return EXCEPTION_CONTINUE_SEARCH;

    const bool isWrite = record.ExceptionInformation[0] == 1;
    const auto instruction = reinterpret_cast<ULONG_PTR>(record.ExceptionAddress);
    NoteFault(block->isFreed ? "use after free" : "overrun", block,
              static_cast<long>(address - block->begin), isWrite,
              instruction - reinterpret_cast<ULONG_PTR>(state->module));
    VirtualAlloc(address, 1, MEM_COMMIT, PAGE_READWRITE);
    return EXCEPTION_CONTINUE_EXECUTION;
}

void* Allocate(size_t size, bool isZeroed, HeapFamily family) {
    GuardedBlock* block = state->blocks.allocate(size, isZeroed, family);
    return block ? block->begin : nullptr;
}

// False for a pointer that is none of ours.
bool Release(void* pointer, HeapFamily family) {
    GuardedBlock* block = state->blocks.containing(pointer);
    if (!block) return false;
    if (block->begin != pointer) {
        NoteFault("free inside a block", block,
                  static_cast<long>(static_cast<BYTE*>(pointer) - block->begin), true);
        return true;
    }
    if (block->isFreed) {
        NoteFault("double free", block, 0, true);
        return true;
    }
    if (block->family != family) NoteFault("freed by the other family", block, 0, true);
    if (const long offset = GuardedBlocks::findDamage(*block)) {
        NoteFault(offset < 0 ? "underrun, seen when freed" : "overrun, seen when freed", block,
                  offset, true);
    }
    state->blocks.decommit(*block);
    return true;
}

// Always moves the block, as a busy heap might.
void* Resize(void* pointer, size_t size, bool isZeroed, HeapFamily family) {
    const GuardedBlock* old = state->blocks.beginningAt(pointer);
    if (!old || old->isFreed) {
        NoteFault("resized without being allocated", old, 0, true);
        return nullptr;
    }
    const size_t kept = std::min(old->size, size);
    void* fresh = Allocate(size, isZeroed, family);
    if (!fresh) return nullptr;
    std::memcpy(fresh, pointer, kept);
    Release(pointer, family);
    return fresh;
}

bool IsOurs(ULONG_PTR pointer) {
    return state->blocks.containing(reinterpret_cast<void*>(pointer)) != nullptr;
}

ULONG_PTR AsWord(void* pointer) { return reinterpret_cast<ULONG_PTR>(pointer); }
void* AsPointer(ULONG_PTR word) { return reinterpret_cast<void*>(word); }

// Without LMEM_MOVEABLE a fixed block may only be resized in place, which a full heap refuses.
ULONG_PTR LocalResize(void* pointer, size_t size, UINT flags) {
    const GuardedBlock* block = state->blocks.beginningAt(pointer);
    if (!(flags & LMEM_MOVEABLE) && block && size > block->size) return 0;
    return AsWord(Resize(pointer, size, (flags & LMEM_ZEROINIT) != 0, HeapFamily::Local));
}

ULONG_PTR LocalBytes(void* pointer) {
    const GuardedBlock* block = state->blocks.beginningAt(pointer);
    return block && !block->isFreed ? block->size : 0;
}

void ReplaceLocalFamily(ImportSpy& spy) {
    spy.watchAll(
        {"LocalAlloc", "LocalReAlloc", "LocalFree", "LocalLock", "LocalUnlock", "LocalSize"});
    const auto replace = [&spy](const char* name, ImportSpy::Handler handler) {
        if (spy.isImported(name)) spy.replace(name, std::move(handler));
    };
    replace("LocalAlloc", [](ULONG_PTR* a) {
        return AsWord(Allocate(a[1], (a[0] & LMEM_ZEROINIT) != 0, HeapFamily::Local));
    });
    replace("LocalReAlloc", [&spy](ULONG_PTR* a) {
        if (!IsOurs(a[0])) return spy.callReal("LocalReAlloc", a);
        return LocalResize(AsPointer(a[0]), a[1], static_cast<UINT>(a[2]));
    });
    replace("LocalFree", [&spy](ULONG_PTR* a) -> ULONG_PTR {
        if (!a[0] || Release(AsPointer(a[0]), HeapFamily::Local)) return 0;
        return spy.callReal("LocalFree", a);
    });
    replace("LocalLock",
            [&spy](ULONG_PTR* a) { return IsOurs(a[0]) ? a[0] : spy.callReal("LocalLock", a); });
    replace("LocalUnlock", [&spy](ULONG_PTR* a) {
        return IsOurs(a[0]) ? ULONG_PTR{0} : spy.callReal("LocalUnlock", a);
    });
    replace("LocalSize", [&spy](ULONG_PTR* a) {
        return IsOurs(a[0]) ? LocalBytes(AsPointer(a[0])) : spy.callReal("LocalSize", a);
    });
}

void ReplaceMallocFamily(ImportSpy& spy) {
    spy.watchAll({"malloc", "calloc", "realloc", "free"});
    const auto replace = [&spy](const char* name, ImportSpy::Handler handler) {
        if (spy.isImported(name)) spy.replace(name, std::move(handler));
    };
    replace("malloc",
            [](ULONG_PTR* a) { return AsWord(Allocate(a[0], false, HeapFamily::Malloc)); });
    replace("calloc",
            [](ULONG_PTR* a) { return AsWord(Allocate(a[0] * a[1], true, HeapFamily::Malloc)); });
    replace("realloc", [&spy](ULONG_PTR* a) {
        if (!a[0]) return AsWord(Allocate(a[1], false, HeapFamily::Malloc));
        if (!IsOurs(a[0])) return spy.callReal("realloc", a);
        return AsWord(Resize(AsPointer(a[0]), a[1], false, HeapFamily::Malloc));
    });
    replace("free", [&spy](ULONG_PTR* a) -> ULONG_PTR {
        if (!a[0] || Release(AsPointer(a[0]), HeapFamily::Malloc)) return 0;
        return spy.callReal("free", a);
    });
}

}  // namespace

GuardHeap::GuardHeap(ImportSpy& spy, size_t alignment) : spy_(spy) {
    if (state && state->isActive) ADD_FAILURE() << "there can be one guard heap at a time";
    if (!state) {
        state = new HeapState{GuardedBlocks(alignment), {}, nullptr, false, 0};
        AddVectoredExceptionHandler(1, OnAccessViolation);
    }
    state->module = spy.module();
    state->faults.clear();
    state->blocksBefore = state->blocks.count();
    state->isActive = true;
    ReplaceLocalFamily(spy_);
    ReplaceMallocFamily(spy_);
}

GuardHeap::~GuardHeap() {
    for (const char* name : {"LocalAlloc", "LocalReAlloc", "LocalFree", "LocalLock", "LocalUnlock",
                             "LocalSize", "malloc", "calloc", "realloc", "free"}) {
        if (spy_.isImported(name)) spy_.restore(name);
    }
    state->isActive = false;
}

const std::vector<HeapFault>& GuardHeap::faults() const { return state->faults; }

void GuardHeap::clearFaults() { state->faults.clear(); }

std::string GuardHeap::report() const {
    std::ostringstream text;
    for (const HeapFault& fault : state->faults) {
        text << fault.kind << ": block " << fault.block << " of " << fault.blockSize << " bytes, "
             << (fault.isWrite ? "write" : "read") << " at offset " << fault.offset;
        if (fault.codeOffset) text << ", instruction at base + 0x" << std::hex << fault.codeOffset;
        text << std::dec << '\n';
    }
    return text.str();
}

bool GuardHeap::startOver() {
    if (!state->blocks.startOver()) return false;
    state->blocksBefore = 0;
    return true;
}

int GuardHeap::live() const {
    return static_cast<int>(state->blocks.liveBlocksAfter(state->blocksBefore).size());
}

std::string GuardHeap::liveReport() const {
    std::ostringstream text;
    for (const GuardedBlock* block : state->blocks.liveBlocksAfter(state->blocksBefore)) {
        text << "block " << block->number << " of " << block->size << " bytes\n";
    }
    return text.str();
}

long GuardHeap::localSize(const void* block) const {
    const GuardedBlock* found = state->blocks.beginningAt(block);
    if (!found || found->isFreed || found->family != HeapFamily::Local) return -1;
    return static_cast<long>(found->size);
}

void ReleaseLocal(void* block) {
    if (state && Release(block, HeapFamily::Local)) return;
    LocalFree(block);
}

}  // namespace kortest
