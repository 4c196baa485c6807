// The zoom of the grid and of its header strips: one level for the whole process. The grid writes
// it and the strips only read it, so neither needs to know the other.
#pragma once

#include <cstdint>

namespace kor {

// In quarters: 4 is 100 %. Never 0.
extern uint32_t zoomLevel;

constexpr uint32_t kZoomWhole = 4;

// From here on letters may be larger than a window. They are unreadable, but drawing them must not
// take seconds.
constexpr uint32_t kZoomHuge = 100 * kZoomWhole;

// Converts units (pixels at 100 %) to pixels, truncated to 16 bits.
constexpr uint16_t PixelsFromUnits(uint32_t units, uint32_t zoom) {
    return static_cast<uint16_t>((units * zoom) >> 2);
}

// Height of a column header in pixels: that of a default row, clamped to what a window can have.
constexpr int HeaderHeightAt(uint32_t zoom) {
    constexpr uint32_t kTallest = 0x7FFF;
    return static_cast<int>(zoom < kTallest / 4 ? 4 * zoom : kTallest);
}

// Height of a font at a zoom. It is always a character height (negative), so that the letters and
// not their line stay in proportion.
int ZoomedFontHeight(int height, uint32_t zoom);

}  // namespace kor
