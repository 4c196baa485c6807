// Sizes and positions of columns and rows: pure calculations, without a window or a DC.
//
// Both axes work alike: all columns (rows) have the default size except those in a short table of
// overrides, sorted by index. Sizes are stored in units and converted to pixels at each lookup.
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

// Size of one column or row in pixels.
int SizeOf(const GridAxis& axis, int index, uint32_t zoom);

// Sum of the sizes from `first` up to, not including, `end`, in pixels; 0 when the range is empty.
int SizeOfRange(const GridAxis& axis, int first, int end, uint32_t zoom);

// Pixels from one index to a later one, approximately; used only to choose how much to redraw after
// a resize.
// Compatibility: the deltas of the overrides are added unscaled, so it is exact at 100 % only;
// pinned by GridDistance.AddsDeltasUnscaled.
int RoughDistance(const GridAxis& axis, int first, int index, uint32_t zoom);

// Converts pixels to units, truncated to 16 bits.
uint16_t UnitsFromPixels(uint16_t pixels, uint32_t zoom);

// The same, clamped to the cell area: a value above `area` becomes `area` less 10, never below 0.
// Compatibility: units are compared with pixels; pinned by GridSizes.LimitComparesUnitsWithPixels.
uint16_t UnitsWithinArea(uint16_t pixels, uint32_t zoom, int area);

// Number of columns or rows from `first` on that fill `extent` pixels, a partly visible last one
// included. At most 255, and none at or past `limit`.
int CountVisible(const GridAxis& axis, int first, int limit, int extent, uint32_t zoom);

// The index at a pixel position; index `first` begins at `origin`.
// Compatibility: a single index past the visible ones is found, beyond that the result is 0; pinned
// by GridIndex.GoesOnePastTheVisibleOnesAndIsZeroBeyond.
int IndexAt(const GridAxis& axis, int first, int visibleCount, int origin, int position,
            uint32_t zoom);

// The visible part of a selected range, in pixels from the first visible column or row.
struct VisibleSpan {
    bool touches;
    int offset;
    int length;
};

// Both ends of the selected range are inclusive.
// Compatibility: the end of the visible range counts as visible; pinned by
// GridSelectedSpan.CountsTheEndOfTheVisibleRangeAsInside.
VisibleSpan SelectedSpan(const GridAxis& axis, int selectedFirst, int selectedLast, int first,
                         int visibleCount, uint32_t zoom);

// Width in pixels of the row header that shows the numbers up to `lastNumber`.
int RowHeaderWidthFor(int lastNumber);

}  // namespace kor
