#include "support/guard_blocks.h"

#include <algorithm>
#include <cstring>

namespace kortest {
namespace {

constexpr size_t kPage = 4096;
// Of the end of a block. Compiled 64-bit code may rely on blocks at multiples of 16 bytes.
constexpr size_t kAlignment = sizeof(void*) == 4 ? 1 : 16;
constexpr size_t kArena = 64 * 1024 * 1024;
constexpr BYTE kAround = 0xFD;  // bytes of a block's pages that nobody asked for
constexpr BYTE kFresh = 0xCD;

constexpr size_t RoundUp(size_t size, size_t unit) { return (size + unit - 1) / unit * unit; }

}  // namespace

BYTE* GuardedBlocks::reserve(size_t bytes) {
    if (!arena_ || arenaUsed_ + bytes > kArena) {
        arena_ = static_cast<BYTE*>(
            VirtualAlloc(nullptr, std::max(kArena, bytes), MEM_RESERVE, PAGE_NOACCESS));
        arenaUsed_ = 0;
        if (!arena_) return nullptr;
    }
    BYTE* place = arena_ + arenaUsed_;
    arenaUsed_ += bytes;
    return place;
}

GuardedBlock* GuardedBlocks::allocate(size_t size, bool isZeroed, HeapFamily family,
                                      GuardedSide side) {
    if (size > kArena) return nullptr;
    const size_t room = RoundUp(std::max<size_t>(size, 1), kAlignment);
    const size_t pageBytes = RoundUp(room, kPage);
    BYTE* place = reserve(pageBytes + kPage);
    if (!place) return nullptr;
    const bool atEnd = side == GuardedSide::End;
    BYTE* pages = atEnd ? place : place + kPage;
    if (!VirtualAlloc(pages, pageBytes, MEM_COMMIT, PAGE_READWRITE)) return nullptr;

    BYTE* begin = atEnd ? pages + pageBytes - room : pages;
    std::memset(pages, kAround, pageBytes);
    std::memset(begin, isZeroed ? 0 : kFresh, size);
    const GuardedBlock block{count() + 1, pages, begin, size, pageBytes, family, false};
    return &byEnd_.emplace(place + pageBytes + kPage, block).first->second;
}

void GuardedBlocks::decommit(GuardedBlock& block) {
    block.isFreed = true;
    VirtualFree(block.firstPage, block.pageBytes, MEM_DECOMMIT);
}

bool GuardedBlocks::startOver() {
    if (!liveBlocksAfter(0).empty()) return false;
    byEnd_.clear();
    arenaUsed_ = 0;
    return true;
}

GuardedBlock* GuardedBlocks::containing(const void* address) {
    const auto* byte = static_cast<const BYTE*>(address);
    // The first block that ends behind the address.
    auto found = byEnd_.upper_bound(byte);
    if (found == byEnd_.end()) return nullptr;
    const BYTE* place = found->first - found->second.pageBytes - kPage;
    return byte < place ? nullptr : &found->second;
}

GuardedBlock* GuardedBlocks::beginningAt(const void* address) {
    GuardedBlock* block = containing(address);
    return block && block->begin == address ? block : nullptr;
}

long GuardedBlocks::findDamage(const GuardedBlock& block) {
    const auto isChanged = [](BYTE byte) { return byte != kAround; };
    const BYTE* behind = std::find_if(block.slackBegin(), block.slackEnd(), isChanged);
    if (behind != block.slackEnd()) return static_cast<long>(behind - block.begin);
    const BYTE* before = std::find_if(block.firstPage, block.begin, isChanged);
    if (before != block.begin) return static_cast<long>(before - block.begin);
    return 0;
}

std::vector<const GuardedBlock*> GuardedBlocks::liveBlocksAfter(int number) const {
    std::vector<const GuardedBlock*> live;
    for (const auto& entry : byEnd_) {
        const GuardedBlock& block = entry.second;
        if (!block.isFreed && block.number > number) live.push_back(&block);
    }
    return live;
}

}  // namespace kortest
