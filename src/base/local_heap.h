// Arrays and texts on the platform's local heap.
#pragma once

#include "platform/platform.h"

#include <type_traits>

namespace kor {

// Whether the bytes of so many values can be counted.
template <typename Value>
constexpr bool HasCountableBytes(SIZE_T count) {
    return count <= SIZE_MAX / sizeof(Value);
}

// A zero-filled array of `count` values, or null. Freed with LocalFree.
template <typename Value>
Value* AllocateLocal(uint32_t count) {
    static_assert(std::is_trivially_copyable_v<Value>);
    if (!HasCountableBytes<Value>(count)) return nullptr;
    return static_cast<Value*>(
        LocalAlloc(LMEM_ZEROINIT, static_cast<SIZE_T>(count) * sizeof(Value)));
}

// The array with room for `count` values, moved if it must be, or null with `array` left as it was.
// What lies past the old end is not zeroed.
template <typename Value>
Value* ReallocateLocal(Value* array, uint32_t count) {
    static_assert(std::is_trivially_copyable_v<Value>);
    if (!HasCountableBytes<Value>(count)) return nullptr;
    return static_cast<Value*>(
        LocalReAlloc(array, static_cast<SIZE_T>(count) * sizeof(Value), LMEM_MOVEABLE));
}

}  // namespace kor
