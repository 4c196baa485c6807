// Memory blocks that are handed to the clipboard.
#pragma once

#include "platform/platform.h"

namespace kor {

// Converts a block of the local heap into the kind that the clipboard takes. Takes over
// `localBlock`, which may be null. Null for null, or when there is no memory.
HANDLE BlockForClipboard(void* localBlock, uint32_t size);

// Frees a block that the clipboard did not take.
void FreeClipboardBlock(HANDLE block);

}  // namespace kor
