// Arrays and texts on the platform's local heap.
#pragma once

#include "platform/platform.h"

#include <type_traits>

namespace kor {

// Whether the size of `count` values in bytes fits into SIZE_T.
template <typename Value>
constexpr bool HasCountableBytes(SIZE_T count) {
    return count <= SIZE_MAX / sizeof(Value);
}

// A zero-filled array of `count` values, freed with LocalFree; null when there is no memory.
template <typename Value>
Value* AllocateLocal(uint32_t count) {
    static_assert(std::is_trivially_copyable_v<Value>);
    if (!HasCountableBytes<Value>(count)) return nullptr;
    return static_cast<Value*>(
        LocalAlloc(LMEM_ZEROINIT, static_cast<SIZE_T>(count) * sizeof(Value)));
}

// Resizes an array to `count` values and may move it. Null when there is no memory; `array` is
// unchanged then. Values past the old end are not zeroed.
template <typename Value>
Value* ReallocateLocal(Value* array, uint32_t count) {
    static_assert(std::is_trivially_copyable_v<Value>);
    if (!HasCountableBytes<Value>(count)) return nullptr;
    return static_cast<Value*>(
        LocalReAlloc(array, static_cast<SIZE_T>(count) * sizeof(Value), LMEM_MOVEABLE));
}

}  // namespace kor
