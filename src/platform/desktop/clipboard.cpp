// The desktop's clipboard takes movable blocks of the global heap only.
#include "platform/clipboard.h"

#include "base/runtime.h"

namespace kor {

namespace {

HGLOBAL CopyToGlobalHeap(const void* source, uint32_t size) {
    HGLOBAL block = GlobalAlloc(GMEM_MOVEABLE, size);
    if (!block) return nullptr;
    void* bytes = GlobalLock(block);
    if (!bytes) {
        GlobalFree(block);
        return nullptr;
    }
    memcpy(bytes, source, size);
    GlobalUnlock(block);
    return block;
}

}  // namespace

HANDLE BlockForClipboard(void* localBlock, uint32_t size) {
    if (!localBlock) return nullptr;
    HGLOBAL block = CopyToGlobalHeap(localBlock, size);
    LocalFree(localBlock);
    return block;
}

void FreeClipboardBlock(HANDLE block) { GlobalFree(block); }

}  // namespace kor
