#include "graph/data/palette.h"

#include <iterator>

namespace kor {

namespace {

constexpr int kSeriesColours = 19;
constexpr int kFirstColour = 2;

// Compatibility: entry 20, one past the 20 colours, is black, and the eighteenth series takes it
// (GraphPalette.EighteenthSeriesTakesEntry20).
constexpr COLORREF kColours[] = {
    0x000000, 0xFFFFFF, 0x0000FF, 0x00FF00, 0xFF0000, 0x00FFFF, 0xFF00FF, 0xFFFF00,
    0x000080, 0x008000, 0x800000, 0x008080, 0x800080, 0x808000, 0x8080FF, 0x80FF80,
    0xFF8080, 0x808080, 0xC0C0C0, 0x000000, 0x000000};  // entry 20: black, see the comment above

constexpr COLORREF kGreys[] = {0x000000, 0xFFFFFF, 0x808080, 0xC0C0C0, 0x000000, 0x808080,
                               0xC0C0C0, 0x000000, 0x808080, 0xC0C0C0, 0x000000, 0x808080,
                               0xC0C0C0, 0x000000, 0x808080, 0xC0C0C0, 0x000000, 0x808080,
                               0xC0C0C0, 0x000000, 0x000000};

static_assert(std::size(kColours) == std::size(kGreys));

constinit const COLORREF* palette = kColours;

}  // namespace

void ChoosePalette(HDC dc) {
    constexpr int kFewBits = 5;
    palette = GetDeviceCaps(dc, BITSPIXEL) < kFewBits ? kGreys : kColours;
}

COLORREF PaletteEntry(int index) {
    return index >= 0 && index < static_cast<int>(std::size(kColours)) ? palette[index] : 0;
}

COLORREF SliceColour(int slice) {
    return slice < 0 ? 0 : PaletteEntry(slice % kSliceColours + kFirstColour);
}

COLORREF ColourOfSeriesNumber(int count) {
    return PaletteEntry(count % kSeriesColours + kFirstColour);
}

}  // namespace kor
