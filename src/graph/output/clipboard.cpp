#include "graph/output/clipboard.h"

#include "base/gdi_scopes.h"
#include "base/local_heap.h"
#include "base/runtime.h"
#include "base/windows_helpers.h"
#include "graph/data/palette.h"
#include "graph/drawing/image.h"
#include "platform/clipboard.h"

namespace kor {

namespace {

constexpr int kBitsPerPixel = 8;
constexpr uint32_t kColourCount = 19;

// One block, without gaps: header, colour table, rows from the bottom up.
struct PackedDibHead {
    BITMAPINFOHEADER header;
    RGBQUAD colours[kColourCount];
};
static_assert(sizeof(BITMAPINFOHEADER) == 40 && sizeof(PackedDibHead) == 116);

// Bytes of the rows, each padded to a multiple of 4.
constexpr uint32_t ImageBytes(int width, int height) {
    const auto bits = static_cast<uint32_t>(width) * kBitsPerPixel;
    return ((bits + 31) >> 5) * 4 * static_cast<uint32_t>(height);
}
static_assert(ImageBytes(104, 52) == 104 * 52 && ImageBytes(0, 0) == 0);

BITMAPINFOHEADER DibHeader(int width, int height) {
    BITMAPINFOHEADER header = {};
    header.biSize = sizeof header;
    header.biWidth = width;
    header.biHeight = height;
    header.biPlanes = 1;
    header.biBitCount = kBitsPerPixel;
    header.biCompression = BI_RGB;
    header.biClrUsed = kColourCount;
    header.biClrImportant = kColourCount;
    return header;
}

RGBQUAD DibColour(COLORREF colour) {
    return {GetBValue(colour), GetGValue(colour), GetRValue(colour), 0};
}

// Copies the image in the colours of the table; the platform picks the nearest ones. If no DIB
// section can be created the pixels stay zero.
void ReadImage(HDC image, const BITMAPINFO& info, void* destination, uint32_t bytes) {
    void* bits = nullptr;
    LocalGdiObject<HBITMAP> section(
        CreateDIBSection(image, &info, DIB_RGB_COLORS, &bits, nullptr, 0));
    if (!section.get() || !bits) return;
    MemoryDC copy(image);
    if (!copy.get()) return;
    SelectScope selection(copy.get(), section.get());
    BitBlt(copy.get(), 0, 0, info.bmiHeader.biWidth, info.bmiHeader.biHeight, image, 0, 0, SRCCOPY);
    FinishDrawing();
    memcpy(destination, bits, bytes);
}

// A packed bitmap on the local heap, or null.
uint8_t* MakePackedDib(HDC image, int width, int height, uint32_t size) {
    auto* dib = AllocateLocal<uint8_t>(size);
    if (!dib) {
        SetLastError(ERROR_OUTOFMEMORY);
        return nullptr;
    }
    auto* head = reinterpret_cast<PackedDibHead*>(dib);
    head->header = DibHeader(width, height);
    for (uint32_t i = 0; i < kColourCount; ++i) {
        head->colours[i] = DibColour(PaletteEntry(static_cast<int>(i)));
    }
    ReadImage(image, *reinterpret_cast<BITMAPINFO*>(dib), dib + sizeof *head,
              size - static_cast<uint32_t>(sizeof *head));
    return dib;
}

// A null block only empties the clipboard. If another program has it open, nothing changes.
void PutOnClipboard(HANDLE block) {
    HANDLE taken = nullptr;
    if (OpenClipboard(nullptr)) {
        EmptyClipboard();
        taken = SetClipboardData(CF_DIB, block);
        CloseClipboard();
    }
    if (block && !taken) FreeClipboardBlock(block);
}

}  // namespace

void CopyGraphToClipboard(const GraphRecord& graph) {
    const RECT client = ClientRectOf(graph.hwnd);
    const int width = RoundedUpTo4(client.right);
    const int height = RoundedUpTo4(client.bottom);
    const auto size = static_cast<uint32_t>(sizeof(PackedDibHead)) + ImageBytes(width, height);
    PutOnClipboard(BlockForClipboard(MakePackedDib(graph.hdcMem, width, height, size), size));
}

}  // namespace kor
