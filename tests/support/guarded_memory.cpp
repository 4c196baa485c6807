#include "support/guarded_memory.h"

#include <algorithm>
#include <cstring>
#include <sstream>

namespace kortest {
namespace {

GuardedMemory* memory = nullptr;

}  // namespace

std::string FaultReport(const std::vector<HeapFault>& faults) {
    std::ostringstream text;
    for (const HeapFault& fault : faults) {
        text << fault.kind << ": block " << fault.block << " of " << fault.blockSize << " bytes, "
             << (fault.isWrite ? "write" : "read") << " at offset " << fault.offset;
        if (fault.codeOffset) text << ", instruction at base + 0x" << std::hex << fault.codeOffset;
        text << std::dec << '\n';
    }
    return text.str();
}

GuardedMemory& GuardedMemory::get() {
    if (!memory) memory = new GuardedMemory;
    return *memory;
}

GuardedMemory* GuardedMemory::find() { return memory; }

GuardedMemory::GuardedMemory() { AddVectoredExceptionHandler(1, onAccessViolation); }

// Reports an access to a guard page or a freed block, then maps the page so that the access
// succeeds.
LONG CALLBACK GuardedMemory::onAccessViolation(EXCEPTION_POINTERS* exception) {
    const EXCEPTION_RECORD& record = *exception->ExceptionRecord;
    if (record.ExceptionCode != EXCEPTION_ACCESS_VIOLATION) return EXCEPTION_CONTINUE_SEARCH;
    auto* address = reinterpret_cast<BYTE*>(record.ExceptionInformation[1]);
    const GuardedBlock* block = memory->blocks.containing(address);
    if (!block) return EXCEPTION_CONTINUE_SEARCH;

    const bool isWrite = record.ExceptionInformation[0] == 1;
    const long offset = static_cast<long>(address - block->begin);
    const auto instruction = reinterpret_cast<ULONG_PTR>(record.ExceptionAddress);
    const char* kind = block->isFreed ? "use after free" : offset < 0 ? "underrun" : "overrun";
    memory->note(kind, block, offset, isWrite,
                 instruction - reinterpret_cast<ULONG_PTR>(memory->module));
    VirtualAlloc(address, 1, MEM_COMMIT, PAGE_READWRITE);
    return EXCEPTION_CONTINUE_EXECUTION;
}

void GuardedMemory::note(const char* kind, const GuardedBlock* block, long offset, bool isWrite,
                         ULONG_PTR codeOffset) {
    faults.push_back(
        {kind, block ? block->number : 0, block ? block->size : 0, offset, isWrite, codeOffset});
}

void* GuardedMemory::allocate(size_t size, bool isZeroed, HeapFamily family) {
    GuardedBlock* block = blocks.allocate(size, isZeroed, family, side);
    return block ? block->begin : nullptr;
}

bool GuardedMemory::release(void* pointer, HeapFamily family) {
    GuardedBlock* block = blocks.containing(pointer);
    if (!block) return false;
    if (block->begin != pointer) {
        note("free inside a block", block,
             static_cast<long>(static_cast<BYTE*>(pointer) - block->begin), true);
        return true;
    }
    if (block->isFreed) {
        note("double free", block, 0, true);
        return true;
    }
    if (block->family != family) note("freed by the other family", block, 0, true);
    if (const long offset = GuardedBlocks::findDamage(*block)) {
        note(offset < 0 ? "underrun, seen when freed" : "overrun, seen when freed", block, offset,
             true);
    }
    blocks.decommit(*block);
    return true;
}

void* GuardedMemory::resize(void* pointer, size_t size, bool isZeroed, HeapFamily family) {
    const GuardedBlock* old = blocks.beginningAt(pointer);
    if (!old || old->isFreed) {
        note("resized without being allocated", old, 0, true);
        return nullptr;
    }
    const size_t kept = std::min(old->size, size);
    void* fresh = allocate(size, isZeroed, family);
    if (!fresh) return nullptr;
    std::memcpy(fresh, pointer, kept);
    release(pointer, family);
    return fresh;
}

void* GuardedMemory::localResize(void* pointer, size_t size, UINT flags) {
    const GuardedBlock* block = blocks.beginningAt(pointer);
    if (!(flags & LMEM_MOVEABLE) && block && size > block->size) return nullptr;
    return resize(pointer, size, (flags & LMEM_ZEROINIT) != 0, HeapFamily::Local);
}

size_t GuardedMemory::localBytes(const void* pointer) {
    const GuardedBlock* block = blocks.beginningAt(pointer);
    return block && !block->isFreed ? block->size : 0;
}

}  // namespace kortest
