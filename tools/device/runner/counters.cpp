#include "runner/counters.h"

#include "runner/image.h"
#include "runner/profile.h"

#include <windows.h>

#include <algorithm>

namespace device {
namespace {

Counters alone;  // used when there is no shared memory
Counters* shared = &alone;

// The helpers' address range; empty when it is not known.
uint32_t softFloatBegin;
uint32_t softFloatEnd;

// The stretch of code around an address: all of it helpers, or none.
struct Stretch {
    uint32_t begin, end;
    bool isSoftFloat;
};

Stretch StretchAt(uint32_t address) {
    const uint32_t begin = guest.codeBegin, end = guest.codeBegin + guest.codeSize;
    if (address < softFloatBegin) return {begin, softFloatBegin, false};
    if (address < softFloatEnd) return {softFloatBegin, softFloatEnd, true};
    return {std::max(begin, softFloatEnd), end, false};
}

}  // namespace

Counters& counters() { return *shared; }

void PrepareCounters() {
    wchar_t name[kCountersNameCapacity] = L"";
    CountersName(name);
    const HANDLE mapping = CreateFileMappingW(INVALID_HANDLE_VALUE, nullptr, PAGE_READWRITE, 0,
                                              sizeof(Counters), name);
    void* view = mapping ? MapViewOfFile(mapping, FILE_MAP_ALL_ACCESS, 0, 0, 0) : nullptr;
    if (view) shared = static_cast<Counters*>(view);
}

void FindSoftFloat(const uint8_t* block, uint32_t size) {
    const auto* begin = reinterpret_cast<const uint8_t*>(guest.codeBegin);
    const auto* end = begin + guest.codeSize;
    const auto* found = std::search(begin, end, block, block + size);
    if (found == end) return;
    softFloatBegin = reinterpret_cast<uint32_t>(found);
    softFloatEnd = softFloatBegin + size;
}

void RunCounted(arm::Cpu& cpu) {
    while (guest.isCode(cpu.next)) {
        const Stretch stretch = StretchAt(cpu.next);
        const uint64_t before = cpu.executed;
        const uint32_t size = stretch.end - stretch.begin;
        if (IsProfiling()) {
            RunProfiled(cpu, stretch.begin, size, stretch.isSoftFloat);
        } else {
            arm::Run(cpu, stretch.begin, size);
        }
        const uint64_t executed = cpu.executed - before;
        shared->instructions += executed;
        if (stretch.isSoftFloat) shared->softFloat += executed;
    }
}

}  // namespace device
