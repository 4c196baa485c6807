// A heap for the library: each block ends at a page without access. Pages that a block leaves lose
// their access as well, and are used again only when many others have been left after them.
#include "storms/failure.h"
#include "storms/library.h"

#include <algorithm>
#include <cstring>
#include <deque>
#include <map>
#include <sstream>
#include <string>
#include <unordered_map>

namespace kortest {
namespace {

constexpr size_t kPage = 4096;
constexpr size_t kArena = sizeof(void*) == 4 ? 512u << 20 : 2048u << 20;
constexpr size_t kAlignment = sizeof(void*) == 4 ? 1 : 16;
constexpr size_t kDelay = 200;  // blocks of a size that are left before the first is used again
constexpr BYTE kAround = 0xFD;
constexpr BYTE kFresh = 0xCD;

enum class Family { local, malloc };

struct Block {
    BYTE* pages;
    BYTE* begin;
    size_t size;
    size_t pageBytes;
    Family family;
    bool isLive;
    int number;
    size_t step;  // of the storm, that made it
};

BYTE* arena = nullptr;
size_t arenaUsed = 0;
bool isActive = false;
int made = 0;
int live = 0;
// By number of the page in the arena: the block that has it, or had it last.
std::unordered_map<size_t, Block> blocks;
std::map<size_t, std::deque<BYTE*>> left;

size_t RoundUp(size_t size, size_t unit) { return (size + unit - 1) / unit * unit; }

size_t PageNumber(const void* address) {
    return static_cast<size_t>(static_cast<const BYTE*>(address) - arena) / kPage;
}

bool IsInArena(const void* address) {
    const auto* byte = static_cast<const BYTE*>(address);
    return arena && byte >= arena && byte < arena + kArena;
}

// The block whose pages, or the page without access behind them, have the address.
Block* Find(const void* address) {
    if (!IsInArena(address)) return nullptr;
    size_t page = PageNumber(address);
    for (;;) {
        const auto found = blocks.find(page);
        if (found != blocks.end()) return &found->second;
        if (page == 0) return nullptr;
        --page;
    }
}

[[noreturn]] void FailHeap(const char* kind, const Block* block, const void* address) {
    if (!block) FailStorm("heap: %s, no block known", kind);
    FailStorm("heap: %s: block %d of %u bytes made in step %u, offset %ld", kind, block->number,
              static_cast<unsigned>(block->size), static_cast<unsigned>(block->step),
              static_cast<long>(static_cast<const BYTE*>(address) - block->begin));
}

bool ExplainAccess(const void* address, bool isWrite, const void* instruction) {
    if (!IsInArena(address)) return false;
    const Block* block = Find(address);
    HMODULE module = nullptr;
    GetModuleHandleExA(GET_MODULE_HANDLE_EX_FLAG_FROM_ADDRESS |
                           GET_MODULE_HANDLE_EX_FLAG_UNCHANGED_REFCOUNT,
                       static_cast<LPCSTR>(instruction), &module);
    std::ostringstream kind;
    kind << (block && block->isLive ? "overrun" : "use after free")
         << (isWrite ? ", write" : ", read")
         << (module == StormModule() ? ", instruction at library + 0x" : ", instruction at 0x")
         << std::hex
         << reinterpret_cast<ULONG_PTR>(instruction) -
                (module == StormModule() ? reinterpret_cast<ULONG_PTR>(module) : 0);
    FailHeap(kind.str().c_str(), block, address);
}

BYTE* TakePages(size_t pageBytes) {
    std::deque<BYTE*>& former = left[pageBytes];
    if (former.size() > kDelay) {
        BYTE* pages = former.front();
        former.pop_front();
        DWORD protection = 0;
        VirtualProtect(pages, pageBytes, PAGE_READWRITE, &protection);
        return pages;
    }
    if (arenaUsed + pageBytes + kPage > kArena) return nullptr;
    BYTE* pages = arena + arenaUsed;
    if (!VirtualAlloc(pages, pageBytes, MEM_COMMIT, PAGE_READWRITE)) return nullptr;
    arenaUsed += pageBytes + kPage;
    return pages;
}

void* Allocate(size_t size, bool isZeroed, Family family) {
    if (size > kArena / 4) return nullptr;
    const size_t room = RoundUp(std::max<size_t>(size, 1), kAlignment);
    const size_t pageBytes = RoundUp(room, kPage);
    BYTE* pages = TakePages(pageBytes);
    if (!pages) return nullptr;
    BYTE* begin = pages + pageBytes - room;
    std::memset(pages, kAround, static_cast<size_t>(begin - pages));
    std::memset(begin + size, kAround, room - size);
    std::memset(begin, isZeroed ? 0 : kFresh, size);
    blocks[PageNumber(pages)] = {pages,  begin, size,   pageBytes,
                                 family, true,  ++made, progress.step};
    ++live;
    return begin;
}

const BYTE* FindDamage(const Block& block) {
    const auto isChanged = [](BYTE byte) { return byte != kAround; };
    const BYTE* front = std::find_if(block.pages, block.begin, isChanged);
    if (front != block.begin) return front;
    const BYTE* end = block.pages + block.pageBytes;
    const BYTE* behind = std::find_if(block.begin + block.size, const_cast<BYTE*>(end), isChanged);
    return behind == end ? nullptr : behind;
}

// False for a block that is none of ours.
bool Release(void* pointer, Family family) {
    if (!IsInArena(pointer)) return false;
    Block* block = Find(pointer);
    if (!block || block->begin != pointer) FailHeap("free inside a block", block, pointer);
    if (!block->isLive) FailHeap("freed twice", block, pointer);
    if (block->family != family) FailHeap("freed by the other family", block, pointer);
    if (const BYTE* damage = FindDamage(*block)) FailHeap("written around", block, damage);
    block->isLive = false;
    --live;
    DWORD protection = 0;
    VirtualProtect(block->pages, block->pageBytes, PAGE_NOACCESS, &protection);
    left[block->pageBytes].push_back(block->pages);
    return true;
}

// Always moves the block, as a busy heap might.
void* Resize(void* pointer, size_t size, bool isZeroed, Family family) {
    const Block* old = Find(pointer);
    if (!old || old->begin != pointer || !old->isLive) FailHeap("resized", old, pointer);
    const size_t kept = std::min(old->size, size);
    void* fresh = Allocate(size, isZeroed, family);
    if (!fresh) return nullptr;
    std::memcpy(fresh, pointer, kept);
    Release(pointer, family);
    return fresh;
}

// ---- What stands in the library's import table
// ---------------------------------------------------

decltype(&LocalAlloc) realLocalAlloc;
decltype(&LocalReAlloc) realLocalReAlloc;
decltype(&LocalFree) realLocalFree;
decltype(&realloc) realRealloc;
decltype(&free) realFree;

HLOCAL WINAPI GuardedLocalAlloc(UINT flags, SIZE_T size) {
    return Allocate(size, (flags & LMEM_ZEROINIT) != 0, Family::local);
}

HLOCAL WINAPI GuardedLocalReAlloc(HLOCAL block, SIZE_T size, UINT flags) {
    if (!IsInArena(block)) return realLocalReAlloc(block, size, flags);
    const Block* old = Find(block);
    // Without LMEM_MOVEABLE a block may only be resized in place, which a full heap refuses.
    if (!(flags & LMEM_MOVEABLE) && old && size > old->size) return nullptr;
    return Resize(block, size, (flags & LMEM_ZEROINIT) != 0, Family::local);
}

HLOCAL WINAPI GuardedLocalFree(HLOCAL block) {
    if (!block || Release(block, Family::local)) return nullptr;
    return realLocalFree(block);
}

void* __cdecl GuardedMalloc(size_t size) { return Allocate(size, false, Family::malloc); }

void* __cdecl GuardedCalloc(size_t count, size_t size) {
    return Allocate(count * size, true, Family::malloc);
}

void* __cdecl GuardedRealloc(void* block, size_t size) {
    if (!block) return Allocate(size, false, Family::malloc);
    if (!IsInArena(block)) return realRealloc(block, size);
    return Resize(block, size, false, Family::malloc);
}

void __cdecl GuardedFree(void* block) {
    if (!block || Release(block, Family::malloc)) return;
    realFree(block);
}

template <typename Function>
Function Replace(const char* name, Function function) {
    return reinterpret_cast<Function>(ReplaceImport(name, reinterpret_cast<void*>(function)));
}

}  // namespace

void GuardLibraryHeap() {
    if (!HasOwnImports()) FailStorm("the heap of this program cannot be guarded");
    arena = static_cast<BYTE*>(VirtualAlloc(nullptr, kArena, MEM_RESERVE, PAGE_NOACCESS));
    if (!arena) FailStorm("no room for the guarded heap");
    explainAccess = ExplainAccess;
    isActive = true;
    realLocalAlloc = Replace("LocalAlloc", &GuardedLocalAlloc);
    realLocalReAlloc = Replace("LocalReAlloc", &GuardedLocalReAlloc);
    realLocalFree = Replace("LocalFree", &GuardedLocalFree);
    Replace("malloc", &GuardedMalloc);
    Replace("calloc", &GuardedCalloc);
    realRealloc = Replace("realloc", &GuardedRealloc);
    realFree = Replace("free", &GuardedFree);
}

int LiveBlocks() { return isActive ? live : -1; }

int BlocksMade() { return made; }

const char* DescribeLiveBlocks(int madeBefore) {
    static std::string text;
    text.clear();
    for (const auto& [page, block] : blocks) {
        if (!block.isLive || block.number <= madeBefore || text.size() > 500) continue;
        text += "block " + std::to_string(block.number) + " of " + std::to_string(block.size) +
                " bytes made in step " + std::to_string(block.step) + "; ";
    }
    return text.c_str();
}

void ReleaseLibraryBlock(void* block) {
    if (block && !Release(block, Family::local)) LocalFree(block);
}

}  // namespace kortest
