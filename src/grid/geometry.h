// Sizes and positions of columns and rows: numbers only, no window and no DC.
//
// Both axes work alike: all columns (rows) have a default size but those in a short table of
// overrides, sorted by index. Sizes are kept in units and become pixels at each lookup.
#pragma once

#include <cstdint>

namespace kor {

// A column or row that was resized.
struct SizeOverride {
    uint16_t index;
    uint16_t size;  // units
    int32_t delta;  // size less the default, in units
};

static_assert(sizeof(SizeOverride) == 8);

// One axis as the calculations see it. Does not own the table.
struct GridAxis {
    const SizeOverride* overrides;  // null: none
    uint32_t overrideCount;
    int defaultSize;  // units
};

// Pixels of one column or row at a zoom.
int SizeOf(const GridAxis& axis, int index, uint32_t zoom);

// Pixels of all from `first` up to, not including, `end`; 0 when the range is empty.
int SizeOfRange(const GridAxis& axis, int first, int end, uint32_t zoom);

// Pixels from one index to a later one. The overrides' deltas are added unscaled, so it is exact at
// 100 % only; it chooses how much to redraw after a resize, and nothing else.
int RoughDistance(const GridAxis& axis, int first, int index, uint32_t zoom);

// What a size in pixels becomes in units, cut to 16 bits.
uint16_t UnitsFromPixels(uint16_t pixels, uint32_t zoom);

// The same, cut to the cell area: a value above `area` becomes the area
// less 10. (Units are compared with pixels here; it has always been so.) Never below 0.
uint16_t UnitsWithinArea(uint16_t pixels, uint32_t zoom, int area);

// How many columns or rows from `first` on it takes to fill `extent` pixels, the partly visible
// last one included: at most 255, none at or past `limit`.
int CountVisible(const GridAxis& axis, int first, int limit, int extent, uint32_t zoom);

// Which index lies at a pixel position, the first one beginning at `origin`. Past the last visible
// one a single further one is recognised; beyond that the answer is 0.
int IndexAt(const GridAxis& axis, int first, int visibleCount, int origin, int position,
            uint32_t zoom);

// The visible columns or rows that a selected range touches, as pixels from the first visible one.
struct VisibleSpan {
    bool touches;
    int offset;
    int length;
};

// Both ends of the selection and of the visible range count as inside.
VisibleSpan SelectedSpan(const GridAxis& axis, int selectedFirst, int selectedLast, int first,
                         int visibleCount, uint32_t zoom);

// Width of the row header that shows the numbers up to `lastNumber`.
int RowHeaderWidthFor(int lastNumber);

}  // namespace kor
