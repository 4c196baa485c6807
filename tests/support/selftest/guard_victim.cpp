// Does to the library's heap what the guard of a whole process must find. process_guard_test.cpp
// runs each of these tests in a process of its own.
#include <korcontrols/korcontrols.h>

#include "support/import_spy.h"
#include "support/import_table.h"

#include <gtest/gtest.h>

#include <windows.h>

namespace kortest {
namespace {

constexpr int kSize = 16;

// The library's own way to a function.
template <typename Function>
Function* ByTheLibrary(const char* name, Function*) {
    return reinterpret_cast<Function*>(*FindImportSlot(LibraryModule(), name));
}

class Victim : public ::testing::Test {
protected:
    // The program has to need the library.
    Victim() { EXPECT_GT(KORCONTROLS_Version(), 0); }

    static void write(int offset) { block()[offset] = 1; }

    static volatile BYTE* block() {
        static auto* made = static_cast<volatile BYTE*>(
            ByTheLibrary("LocalAlloc", LocalAlloc)(LMEM_ZEROINIT, kSize));
        return made;
    }

    static void free() { ByTheLibrary("LocalFree", LocalFree)(const_cast<BYTE*>(block())); }
};

TEST_F(Victim, LeavesItAlone) {
    write(0);
    write(kSize - 1);
    free();
}

TEST_F(Victim, WritesBehindABlock) { write(kSize); }

TEST_F(Victim, GetsABlockInsideAPage) {
    EXPECT_NE((reinterpret_cast<ULONG_PTR>(block()) + kSize) % 4096, 0u);
}

TEST_F(Victim, WritesBeforeABlock) { write(-1); }

TEST_F(Victim, WritesToAFreedBlock) {
    write(0);
    free();
    write(0);
}

// A test's own spy, and what it replaces, come before the guard.
TEST_F(Victim, WritesBehindABlockThatASpySaw) {
    ImportSpy spy;
    spy.watch("LocalAlloc");
    write(kSize);
    EXPECT_EQ(spy.count("LocalAlloc"), 1);
}

// The fault comes when the test's body has ended.
class LateVictim : public Victim {
protected:
    ~LateVictim() override { write(kSize); }
};

TEST_F(LateVictim, WritesBehindABlock) {}

TEST_F(Victim, Traps) { __builtin_trap(); }

}  // namespace
}  // namespace kortest
