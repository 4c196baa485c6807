#include "failing_memory.h"

#include <cstddef>
#include <cstdlib>
#include <new>

namespace {

constexpr int kUnlimited = -1;

int allocationsLeft = kUnlimited;
bool failsForGood = false;
int refusalCount = 0;

}  // namespace

void* operator new(std::size_t size) {
    if (allocationsLeft == 0) {
        ++refusalCount;
        if (!failsForGood) allocationsLeft = kUnlimited;
        throw std::bad_alloc();
    }
    if (allocationsLeft > 0) --allocationsLeft;
    if (void* memory = std::malloc(size == 0 ? 1 : size)) return memory;
    throw std::bad_alloc();
}

void operator delete(void* memory) noexcept { std::free(memory); }
void operator delete(void* memory, std::size_t) noexcept { std::free(memory); }

namespace workbook {

MemoryShortage::MemoryShortage(int allocations, bool forGood) {
    failsForGood = forGood;
    refusalCount = 0;
    allocationsLeft = allocations;
}

MemoryShortage::~MemoryShortage() { allocationsLeft = kUnlimited; }

int MemoryShortage::refusals() { return refusalCount; }

}  // namespace workbook
