// The desktop's clipboard takes movable blocks of the global heap only.
#include "platform/clipboard.h"

#include "platform/runtime.h"

namespace kor {

HANDLE BlockForClipboard(void* localBlock, uint32_t size) {
    if (!localBlock) return nullptr;
    HGLOBAL block = GlobalAlloc(GMEM_MOVEABLE, size);
    if (void* bytes = block ? GlobalLock(block) : nullptr) {
        memcpy(bytes, localBlock, size);
        GlobalUnlock(block);
    }
    LocalFree(localBlock);
    return block;
}

void FreeClipboardBlock(HANDLE block) { GlobalFree(block); }

void FinishDrawing() { GdiFlush(); }

}  // namespace kor
