// Guards the library's heap from a test program's start to its end, whatever its tests do, where
// the environment says so: KORCONTROLS_GUARD=end or begin is the side of each block at which a page
// lies that nobody may touch. A test with a fault fails and shows the report.
//
// The library's import table is changed before any import spy looks at it, so that a spy, and a
// guard heap of a test's own, calls these functions as if they were the platform's. In a program
// that is linked with the library's objects, it is the program's own table and its local heap.
//
// It also says where the library ended the program when it was compiled to trap on undefined
// behaviour.
#include "support/guarded_memory.h"
#include "support/import_spy.h"
#include "support/import_table.h"

#include <gtest/gtest.h>

#include <cstdio>
#include <cstdlib>
#include <cstring>

namespace kortest {
namespace {

GuardedMemory& Memory() { return *GuardedMemory::find(); }

// The platform's own, read before any table is changed.
const auto realLocalReAlloc = &LocalReAlloc;
const auto realLocalFree = &LocalFree;
const auto realLocalLock = &LocalLock;
const auto realLocalUnlock = &LocalUnlock;
const auto realLocalSize = &LocalSize;

// What ours are freed or asked with; blocks made before the guard, or by others, go on to the
// platform.
HLOCAL WINAPI GuardedLocalAlloc(UINT flags, SIZE_T size) {
    return Memory().allocate(size, (flags & LMEM_ZEROINIT) != 0, HeapFamily::Local);
}

HLOCAL WINAPI GuardedLocalReAlloc(HLOCAL block, SIZE_T size, UINT flags) {
    if (!Memory().isOurs(block)) return realLocalReAlloc(block, size, flags);
    return Memory().localResize(block, size, flags);
}

HLOCAL WINAPI GuardedLocalFree(HLOCAL block) {
    if (!block || Memory().release(block, HeapFamily::Local)) return nullptr;
    return realLocalFree(block);
}

LPVOID WINAPI GuardedLocalLock(HLOCAL block) {
    return Memory().isOurs(block) ? block : realLocalLock(block);
}

BOOL WINAPI GuardedLocalUnlock(HLOCAL block) {
    return Memory().isOurs(block) ? FALSE : realLocalUnlock(block);
}

SIZE_T WINAPI GuardedLocalSize(HLOCAL block) {
    return Memory().isOurs(block) ? Memory().localBytes(block) : realLocalSize(block);
}

void* GuardedMalloc(size_t size) { return Memory().allocate(size, false, HeapFamily::Malloc); }

void* GuardedCalloc(size_t count, size_t size) {
    return Memory().allocate(count * size, true, HeapFamily::Malloc);
}

void* GuardedRealloc(void* block, size_t size) {
    if (!block) return GuardedMalloc(size);
    if (!Memory().isOurs(block)) return std::realloc(block, size);
    return Memory().resize(block, size, false, HeapFamily::Malloc);
}

void GuardedFree(void* block) {
    if (block && !Memory().release(block, HeapFamily::Malloc)) std::free(block);
}

template <typename Function>
void Lead(HMODULE module, const char* name, Function* function) {
    if (ULONG_PTR* slot = FindImportSlot(module, name)) {
        WriteImportSlot(slot, reinterpret_cast<ULONG_PTR>(function));
    }
}

void LeadLocalFamily(HMODULE module) {
    Lead(module, "LocalAlloc", GuardedLocalAlloc);
    Lead(module, "LocalReAlloc", GuardedLocalReAlloc);
    Lead(module, "LocalFree", GuardedLocalFree);
    Lead(module, "LocalLock", GuardedLocalLock);
    Lead(module, "LocalUnlock", GuardedLocalUnlock);
    Lead(module, "LocalSize", GuardedLocalSize);
}

void LeadMallocFamily(HMODULE module) {
    Lead(module, "malloc", GuardedMalloc);
    Lead(module, "calloc", GuardedCalloc);
    Lead(module, "realloc", GuardedRealloc);
    Lead(module, "free", GuardedFree);
}

// Fails the test that has just ended, its fixture included, for the faults noted since it began.
class FaultListener : public ::testing::EmptyTestEventListener {
    void OnTestStart(const ::testing::TestInfo&) override { before_ = Memory().faults.size(); }

    void OnTestEnd(const ::testing::TestInfo&) override {
        const auto& all = Memory().faults;
        const std::vector<HeapFault> faults(all.begin() + static_cast<std::ptrdiff_t>(before_),
                                            all.end());
        if (!faults.empty()) ADD_FAILURE() << "the heap's guard:\n" << FaultReport(faults);
    }

    size_t before_ = 0;
};

[[noreturn]] void Refuse(const char* value) {
    std::fprintf(stderr, "KORCONTROLS_GUARD is \"%s\", neither \"end\" nor \"begin\"\n", value);
    std::exit(EXIT_FAILURE);
}

GuardedSide SideNamed(const char* name) {
    if (!std::strcmp(name, "end")) return GuardedSide::End;
    if (!std::strcmp(name, "begin")) return GuardedSide::Begin;
    Refuse(name);
}

// The module that has the library's code.
HMODULE ModuleUnderTest() { return LibraryModule() ? LibraryModule() : GetModuleHandleW(nullptr); }

LONG CALLBACK OnIllegalInstruction(EXCEPTION_POINTERS* exception) {
    const EXCEPTION_RECORD& record = *exception->ExceptionRecord;
    if (record.ExceptionCode == EXCEPTION_ILLEGAL_INSTRUCTION) {
        auto* place = static_cast<BYTE*>(record.ExceptionAddress);
        auto* base = reinterpret_cast<BYTE*>(ModuleUnderTest());
        std::fprintf(stderr, "trapped at base + 0x%zx\n", static_cast<size_t>(place - base));
        std::fflush(stderr);
    }
    return EXCEPTION_CONTINUE_SEARCH;
}

struct ProcessGuard {
    ProcessGuard() {
        AddVectoredExceptionHandler(0, OnIllegalInstruction);
        if (const char* side = std::getenv("KORCONTROLS_GUARD")) guard(SideNamed(side));
    }

    static void guard(GuardedSide side) {
        GuardedMemory& memory = GuardedMemory::get();
        memory.side = side;
        memory.module = ModuleUnderTest();
        LeadLocalFamily(memory.module);
        // A program's own table has the tests' allocations as well.
        if (memory.module == LibraryModule()) LeadMallocFamily(memory.module);
        ::testing::UnitTest::GetInstance()->listeners().Append(new FaultListener);
    }
};

const ProcessGuard processGuard;

}  // namespace
}  // namespace kortest
