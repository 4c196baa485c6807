// Counters of the stand-in for the device's library in this process, for benchmarks and tests. They
// are in shared memory, so that the library's exports stay as they are.
#pragma once

#include <windows.h>

#include <cstdint>
#include <cwchar>

namespace device {

struct Counters {
    uint64_t instructions;  // of the guest, including those whose condition was false
    uint64_t softFloat;     // of these, in the helpers for arithmetic that the processor lacks
    uint64_t importCalls;   // calls of the platform by the guest
    uint64_t callbacks;     // calls of the guest by the platform
    uint64_t exportCalls;   // calls of the guest by the program
    uint32_t heapBytes;     // of blocks that the guest has allocated and not freed
    uint32_t gdiObjects;    // including DCs and image lists, created and not released
    uint32_t stackLow;      // the guest's stack in this process; unused words hold kUnusedStack
    uint32_t stackSize;
};

constexpr uint32_t kUnusedStack = 0xA5A5A5A5;

constexpr size_t kCountersNameCapacity = 48;

inline void CountersName(wchar_t (&name)[kCountersNameCapacity]) {
    _snwprintf(name, kCountersNameCapacity, L"Local\\korcontrols-device-%lu",
               GetCurrentProcessId());
}

// Null when the library is not the device's.
inline const Counters* FindCounters() {
    wchar_t name[kCountersNameCapacity] = L"";
    CountersName(name);
    const HANDLE mapping = OpenFileMappingW(FILE_MAP_READ, FALSE, name);
    if (!mapping) return nullptr;
    const void* view = MapViewOfFile(mapping, FILE_MAP_READ, 0, 0, 0);
    CloseHandle(mapping);
    return static_cast<const Counters*>(view);
}

// Bytes of the guest's stack that have ever been in use.
inline uint32_t DeepestStack(const Counters& counters) {
    const auto* stack = reinterpret_cast<const uint32_t*>(uintptr_t{counters.stackLow});
    uint32_t unused = 0;
    while (unused < counters.stackSize / 4 && stack[unused] == kUnusedStack) ++unused;
    return counters.stackSize - 4 * unused;
}

}  // namespace device
