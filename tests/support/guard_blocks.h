// Blocks of memory that end at a page without access, and what is known about each.
#pragma once

#include <windows.h>

#include <map>
#include <string>
#include <vector>

namespace kortest {

enum class HeapFamily { Local, Malloc };

struct GuardedBlock {
    int number;        // in order of allocation, from 1
    BYTE* firstPage;   // the block's pages begin here
    BYTE* begin;       // what the caller got
    size_t size;       // bytes asked for
    size_t pageBytes;  // committed, without the guard page behind them
    HeapFamily family;
    bool isFreed;

    // Behind the asked-for bytes and still accessible, because of the alignment.
    BYTE* slackBegin() const { return begin + size; }
    BYTE* guardPage() const { return firstPage + pageBytes; }
};

// Never gives an address out twice, so that a late access to a freed block is seen.
class GuardedBlocks {
public:
    explicit GuardedBlocks(size_t alignment) : alignment_(alignment) {}

    // nullptr when the address space is used up. Fresh bytes are 0 or 0xCD.
    GuardedBlock* allocate(size_t size, bool isZeroed, HeapFamily family);

    // Takes the block's pages away; its description stays.
    void decommit(GuardedBlock& block);

    // Forgets every block, so that addresses come again. False, and nothing done, while one lives.
    bool startOver();

    // The block, freed or not, whose pages (guard page included) contain the address; or nullptr.
    GuardedBlock* containing(const void* address);

    // The block, freed or not, that begins at the address; or nullptr.
    GuardedBlock* beginningAt(const void* address);

    // Offset of the first byte around the block that is no longer as allocate left it; 0 when all
    // are. (Offset 0 itself belongs to the block.)
    static long findDamage(const GuardedBlock& block);

    int count() const { return static_cast<int>(byGuardPage_.size()); }  // freed ones as well

    // Blocks not freed whose number is above `number`.
    std::vector<const GuardedBlock*> liveBlocksAfter(int number) const;

private:
    BYTE* reserve(size_t bytes);

    size_t alignment_;
    BYTE* arena_ = nullptr;
    size_t arenaUsed_ = 0;
    std::map<const BYTE*, GuardedBlock> byGuardPage_;
};

}  // namespace kortest
