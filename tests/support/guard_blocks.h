// Blocks of memory that end, or begin, at a page without access, and what is known about each.
#pragma once

#include <windows.h>

#include <map>
#include <string>
#include <vector>

namespace kortest {

enum class HeapFamily { Local, Malloc };

// Where a block lies in its pages: reads and writes past that side of it are faults at once.
enum class GuardedSide { End, Begin };

struct GuardedBlock {
    int number;        // in order of allocation, from 1
    BYTE* firstPage;   // the block's pages begin here
    BYTE* begin;       // what the caller got
    size_t size;       // bytes asked for
    size_t pageBytes;  // committed, without the guard pages around them
    HeapFamily family;
    bool isFreed;

    // Behind the asked-for bytes and still accessible.
    BYTE* slackBegin() const { return begin + size; }
    BYTE* slackEnd() const { return firstPage + pageBytes; }
};

// Never gives an address out twice, so that a late access to a freed block is seen.
class GuardedBlocks {
public:
    // nullptr when the address space is used up. Fresh bytes are 0 or 0xCD.
    GuardedBlock* allocate(size_t size, bool isZeroed, HeapFamily family, GuardedSide side);

    // Takes the block's pages away; its description stays.
    void decommit(GuardedBlock& block);

    // Forgets every block, so that addresses come again. False, and nothing done, while one lives.
    bool startOver();

    // The block, freed or not, whose pages (its guard page included) contain the address; or
    // nullptr.
    GuardedBlock* containing(const void* address);

    // The block, freed or not, that begins at the address; or nullptr.
    GuardedBlock* beginningAt(const void* address);

    // Offset of the first byte around the block that is no longer as allocate left it; 0 when all
    // are. (Offset 0 itself belongs to the block.)
    static long findDamage(const GuardedBlock& block);

    int count() const { return static_cast<int>(byEnd_.size()); }  // freed ones as well

    // Blocks not freed whose number is above `number`.
    std::vector<const GuardedBlock*> liveBlocksAfter(int number) const;

private:
    BYTE* reserve(size_t bytes);

    BYTE* arena_ = nullptr;
    size_t arenaUsed_ = 0;
    std::map<const BYTE*, GuardedBlock> byEnd_;  // by the first byte behind pages and guard page
};

}  // namespace kortest
