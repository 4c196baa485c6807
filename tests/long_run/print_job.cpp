// Stands for the companion with the functions of a print job: pages are counted, and given back.
#include <windows.h>

namespace {

int pages = 0;

// The bitmap that a memory DC begins with.
HGDIOBJ FirstBitmap() {
    const HDC dc = CreateCompatibleDC(nullptr);
    const HGDIOBJ bitmap = GetCurrentObject(dc, OBJ_BITMAP);
    DeleteDC(dc);
    return bitmap;
}

}  // namespace

extern "C" {

int WINAPI KorStartDoc(HDC, const DOCINFOW*) { return 1; }
int WINAPI KorStartPage(HDC) { return 1; }
int WINAPI KorEndPage(HDC) { return ++pages; }
int WINAPI KorEndDoc(HDC dc) { return DeleteObject(SelectObject(dc, FirstBitmap())) ? 1 : 0; }
int WINAPI PrintedPages() { return pages; }
}
