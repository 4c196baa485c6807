#include "support/guard_blocks.h"

#include <algorithm>
#include <cstring>

namespace kortest {
namespace {

constexpr size_t kPage = 4096;
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

GuardedBlock* GuardedBlocks::allocate(size_t size, bool isZeroed, HeapFamily family) {
    if (size > kArena) return nullptr;
    const size_t room = RoundUp(std::max<size_t>(size, 1), alignment_);
    const size_t pageBytes = RoundUp(room, kPage);
    BYTE* pages = reserve(pageBytes + kPage);
    if (!pages || !VirtualAlloc(pages, pageBytes, MEM_COMMIT, PAGE_READWRITE)) return nullptr;

    BYTE* begin = pages + pageBytes - room;
    std::memset(pages, kAround, pageBytes);
    std::memset(begin, isZeroed ? 0 : kFresh, size);
    const GuardedBlock block{count() + 1, pages, begin, size, pageBytes, family, false};
    return &byGuardPage_.emplace(block.guardPage(), block).first->second;
}

void GuardedBlocks::decommit(GuardedBlock& block) {
    block.isFreed = true;
    VirtualFree(block.firstPage, block.pageBytes, MEM_DECOMMIT);
}

bool GuardedBlocks::startOver() {
    if (!liveBlocksAfter(0).empty()) return false;
    byGuardPage_.clear();
    arenaUsed_ = 0;
    return true;
}

GuardedBlock* GuardedBlocks::containing(const void* address) {
    const auto* byte = static_cast<const BYTE*>(address);
    // The first block whose guard page does not end before the address.
    auto found = byGuardPage_.lower_bound(byte);
    if (found != byGuardPage_.begin()) {
        auto before = std::prev(found);
        if (byte < before->second.guardPage() + kPage) found = before;
    }
    if (found == byGuardPage_.end() || byte < found->second.firstPage) return nullptr;
    return &found->second;
}

GuardedBlock* GuardedBlocks::beginningAt(const void* address) {
    GuardedBlock* block = containing(address);
    return block && block->begin == address ? block : nullptr;
}

long GuardedBlocks::findDamage(const GuardedBlock& block) {
    const auto isChanged = [](BYTE byte) { return byte != kAround; };
    const BYTE* behind = std::find_if(block.slackBegin(), block.guardPage(), isChanged);
    if (behind != block.guardPage()) return static_cast<long>(behind - block.begin);
    const BYTE* before = std::find_if(block.firstPage, block.begin, isChanged);
    if (before != block.begin) return static_cast<long>(before - block.begin);
    return 0;
}

std::vector<const GuardedBlock*> GuardedBlocks::liveBlocksAfter(int number) const {
    std::vector<const GuardedBlock*> live;
    for (const auto& entry : byGuardPage_) {
        const GuardedBlock& block = entry.second;
        if (!block.isFreed && block.number > number) live.push_back(&block);
    }
    return live;
}

}  // namespace kortest
