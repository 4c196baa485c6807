#include "figures.h"

#include <psapi.h>

#include <algorithm>
#include <array>

namespace longrun {

namespace {

std::size_t BusyBytes(HANDLE heap) {
    std::size_t bytes = 0;
    PROCESS_HEAP_ENTRY entry = {};
    HeapLock(heap);
    while (HeapWalk(heap, &entry)) {
        if (entry.wFlags & PROCESS_HEAP_ENTRY_BUSY) bytes += entry.cbData;
    }
    HeapUnlock(heap);
    return bytes;
}

std::size_t HeapBytes() {
    std::array<HANDLE, 64> heaps = {};
    const DWORD count = GetProcessHeaps(static_cast<DWORD>(heaps.size()), heaps.data());
    std::size_t bytes = 0;
    for (DWORD index = 0; index < count && index < heaps.size(); ++index)
        bytes += BusyBytes(heaps[index]);
    return bytes;
}

std::size_t PrivateBytes() {
    PROCESS_MEMORY_COUNTERS_EX counters = {};
    GetProcessMemoryInfo(GetCurrentProcess(), reinterpret_cast<PROCESS_MEMORY_COUNTERS*>(&counters),
                         sizeof counters);
    // Wine fills in only the older member, which means the same.
    return std::max(counters.PrivateUsage, counters.PagefileUsage);
}

// ---- GDI objects ----

// Wine answers 0 to GetGuiResources. Its table of objects is where Windows once had its own, at
// this place of the process's block, and an entry in use has a type.
struct WineGdiEntry {
    ULONGLONG object;
    ULONG owner;
    USHORT unique;
    UCHAR type;
    UCHAR flags;
    ULONGLONG userPointer;
};
constexpr std::size_t kWineEntries = 0x4000;
constexpr std::size_t kTableInProcessBlock = sizeof(void*) == 4 ? 0x94 : 0xF8;

unsigned CountInWinesTable() {
    const FARPROC ownBlock = GetProcAddress(GetModuleHandleW(L"ntdll.dll"), "RtlGetCurrentPeb");
    if (!ownBlock) return 0;
    const BYTE* const block =
        reinterpret_cast<const BYTE*(WINAPI*)()>(reinterpret_cast<void*>(ownBlock))();
    const auto* const entries =
        *reinterpret_cast<const WineGdiEntry* const*>(block + kTableInProcessBlock);
    unsigned count = 0;
    for (std::size_t index = 0; entries && index < kWineEntries; ++index)
        count += entries[index].type != 0;
    return count;
}

unsigned GdiObjects() {
    const DWORD count = GetGuiResources(GetCurrentProcess(), GR_GDIOBJECTS);
    return count ? count : CountInWinesTable();
}

// ---- Windows ----

BOOL CALLBACK CountOne(HWND, LPARAM count) {
    ++*reinterpret_cast<unsigned*>(count);
    return TRUE;
}

BOOL CALLBACK CountWithChildren(HWND window, LPARAM count) {
    EnumChildWindows(window, CountOne, count);
    return CountOne(window, count);
}

unsigned Windows() {
    unsigned count = 0;
    EnumThreadWindows(GetCurrentThreadId(), CountWithChildren, reinterpret_cast<LPARAM>(&count));
    return count;
}

}  // namespace

Figures Measure() { return {HeapBytes(), PrivateBytes(), GdiObjects(), Windows()}; }

bool CanCountGdiObjects() {
    constexpr unsigned kMade = 10;
    std::array<HPEN, kMade> pens = {};
    const unsigned before = GdiObjects();
    for (HPEN& pen : pens) pen = CreatePen(PS_SOLID, 3, RGB(1, 2, 3));
    const unsigned during = GdiObjects();
    for (const HPEN pen : pens) DeleteObject(pen);
    return during == before + kMade && GdiObjects() == before;
}

}  // namespace longrun
