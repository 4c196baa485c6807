// The clipboard of Windows CE takes blocks of the local heap.
#include "platform/clipboard.h"

namespace kor {

HANDLE BlockForClipboard(void* localBlock, uint32_t) { return localBlock; }

void FreeClipboardBlock(HANDLE block) { LocalFree(block); }

}  // namespace kor
