// Texts on the local heap.
#pragma once

#include "base/local_heap.h"
#include "base/runtime.h"

namespace kor {

// A copy of a text, freed with LocalFree; null for a null or empty text, or when there is no
// memory.
inline wchar_t* CopyText(const wchar_t* text) {
    if (!text || !*text) return nullptr;
    const size_t length = wcslen(text);
    auto* copy = AllocateLocal<wchar_t>(static_cast<uint32_t>(length) + 1);
    if (copy) memcpy(copy, text, length * sizeof(wchar_t));
    return copy;
}

// Frees a block and sets the pointer to null.
template <typename Value>
void FreeLocal(Value*& block) {
    if (block) LocalFree(block);
    block = nullptr;
}

}  // namespace kor
