/* A DLL that makes the mistakes which the test support must notice. */
#ifndef FAULTY_LIBRARY_H
#define FAULTY_LIBRARY_H

#include <windows.h>

#ifdef __cplusplus
extern "C" {
#endif

/* Writes, or reads, `offset` bytes from the begin of a LocalAlloc block, then frees it. */
void FaultyWrite(size_t size, ptrdiff_t offset);
int FaultyRead(size_t size, ptrdiff_t offset);

void FaultyUseAfterFree(void);
void FaultyDoubleFree(void);
void FaultyWrongFamily(void);

/* Never freed. */
void* FaultyLeak(size_t size);

/* Resizes a block of 10 bytes, which count from 1; the result is their sum, -1 without memory. */
int FaultyGrow(size_t size, UINT flags);

int FaultyMalloc(void); /* malloc, realloc, calloc and free as they should be used */

/* Makes a pen, a brush and two DCs and gives back what the flags say. */
#define FAULTY_KEEP_PEN 1
#define FAULTY_KEEP_WINDOW_DC 2
#define FAULTY_KEEP_MEMORY_DC 4
void FaultyHandles(int keep);

/* Nine arguments on their way through the import table. */
BOOL FaultyBlit(HDC to, int x, int y, HDC from);

#ifdef __cplusplus
}
#endif

#endif
