// The zoom of the grid and of its header strips: one level for the whole process. The grid writes
// it, the strips only read it, and neither has to know the other for that.
#pragma once

#include <cstdint>

namespace kor {

// Quarters: 4 is 100 %, never 0.
extern uint32_t zoomLevel;

constexpr uint32_t kZoomWhole = 4;

// From here on letters may be larger than a window. Nobody reads them, but it must not take
// seconds.
constexpr uint32_t kZoomHuge = 100 * kZoomWhole;

// Pixels of a size in units (pixels at 100 %); cut to 16 bits.
constexpr uint16_t PixelsFromUnits(uint32_t units, uint32_t zoom) {
    return static_cast<uint16_t>((units * zoom) >> 2);
}

// Height of a column header: a default row's. An absurd zoom stops at what a window can have.
constexpr int HeaderHeightAt(uint32_t zoom) {
    constexpr uint32_t kTallest = 0x7FFF;
    return static_cast<int>(zoom < kTallest / 4 ? 4 * zoom : kTallest);
}

// Height of a font at a zoom: scaled, and always a character height (negative), which is what makes
// the letters and not their line keep the proportion.
int ZoomedFontHeight(int height, uint32_t zoom);

}  // namespace kor
