// Blocks of memory that change hands over the clipboard.
#pragma once

#include "platform/platform.h"

namespace kor {

// A block of the local heap, or null, as the kind of block that the clipboard takes. The given one
// is used up; the result is null for null, or when there is no memory.
HANDLE BlockForClipboard(void* localBlock, uint32_t size);

// Frees a block that the clipboard did not take.
void FreeClipboardBlock(HANDLE block);

}  // namespace kor
