#include "faulty_library.h"

#include <stdlib.h>

/* Volatile, so that the compiler keeps accesses that make no sense. */
typedef volatile unsigned char Byte;

__declspec(dllexport) void FaultyWrite(size_t size, ptrdiff_t offset)
{
    Byte *block = (Byte *)LocalAlloc(LMEM_FIXED | LMEM_ZEROINIT, size);
    block[offset] = 1;
    LocalFree((HLOCAL)block);
}

__declspec(dllexport) int FaultyRead(size_t size, ptrdiff_t offset)
{
    Byte *block = (Byte *)LocalAlloc(LMEM_FIXED | LMEM_ZEROINIT, size);
    int value = block[offset];
    LocalFree((HLOCAL)block);
    return value;
}

__declspec(dllexport) void FaultyUseAfterFree(void)
{
    Byte *block = (Byte *)LocalAlloc(LMEM_FIXED, 40);
    LocalFree((HLOCAL)block);
    block[12] = 1;
}

__declspec(dllexport) void FaultyDoubleFree(void)
{
    HLOCAL block = LocalAlloc(LMEM_FIXED, 8);
    LocalFree(block);
    LocalFree(block);
}

__declspec(dllexport) void FaultyWrongFamily(void)
{
    /* The compiler must not see where the block comes from: it would refuse this. */
    void *(*volatile allocate)(size_t) = malloc;
    LocalFree((HLOCAL)allocate(8));
}

__declspec(dllexport) void *FaultyLeak(size_t size)
{
    return (void *)LocalAlloc(LMEM_FIXED, size);
}

__declspec(dllexport) int FaultyGrow(size_t size, UINT flags)
{
    int sum = 0;
    int i;
    Byte *grown;
    Byte *block = (Byte *)LocalAlloc(LMEM_FIXED, 10);
    for (i = 0; i < 10; ++i) block[i] = (unsigned char)(i + 1);
    grown = (Byte *)LocalReAlloc((HLOCAL)block, size, flags);
    if (!grown) {
        LocalFree((HLOCAL)block);
        return -1;
    }
    for (i = 0; i < (int)size; ++i) sum += grown[i];
    LocalFree((HLOCAL)grown);
    return sum;
}

__declspec(dllexport) int FaultyMalloc(void)
{
    int sum;
    Byte *other = (Byte *)calloc(2, 3);
    Byte *block = (Byte *)malloc(5);
    if (!other || !block) return -1;
    block[4] = 7;
    block = (Byte *)realloc((void *)block, 6);
    if (!block) return -1;
    sum = block[4] + other[5];
    free((void *)block);
    free((void *)other);
    return sum;
}

__declspec(dllexport) void FaultyHandles(int keep)
{
    HPEN pen = CreatePen(PS_SOLID, 1, 0);
    HBRUSH brush = CreateSolidBrush(0);
    HDC window = GetDC(0);
    HDC memory = CreateCompatibleDC(window);
    if (!(keep & FAULTY_KEEP_MEMORY_DC)) DeleteDC(memory);
    if (!(keep & FAULTY_KEEP_WINDOW_DC)) ReleaseDC(0, window);
    DeleteObject(brush);
    if (!(keep & FAULTY_KEEP_PEN)) DeleteObject(pen);
}

__declspec(dllexport) BOOL FaultyBlit(HDC to, int x, int y, HDC from)
{
    return BitBlt(to, x, y, 3, 4, from, 5, 6, SRCCOPY);
}
