#include "grid/geometry.h"

#include <algorithm>

#include "zoom/zoom.h"

namespace kor {

namespace {

constexpr int kAreaMargin = 10;
constexpr int kCountLimit = 255;  // the visible counts are 8 bits wide

// The first entry whose index is not below the wanted one.
const SizeOverride* LowerBound(const GridAxis& axis, int index) {
    if (!axis.overrides) return nullptr;
    return std::lower_bound(
        axis.overrides, axis.overrides + axis.overrideCount, index,
        [](const SizeOverride& entry, int wanted) { return entry.index < wanted; });
}

const SizeOverride* EndOf(const GridAxis& axis) {
    return axis.overrides ? axis.overrides + axis.overrideCount : nullptr;
}

uint16_t DefaultPixels(const GridAxis& axis, uint32_t zoom) {
    return PixelsFromUnits(static_cast<uint32_t>(axis.defaultSize), zoom);
}

}  // namespace

int SizeOf(const GridAxis& axis, int index, uint32_t zoom) {
    const SizeOverride* entry = LowerBound(axis, index);
    const bool overridden = entry != EndOf(axis) && entry->index == index;
    return overridden ? PixelsFromUnits(entry->size, zoom) : DefaultPixels(axis, zoom);
}

int SizeOfRange(const GridAxis& axis, int first, int end, uint32_t zoom) {
    if (end <= first) return 0;
    const int defaultPixels = DefaultPixels(axis, zoom);
    int sum = (end - first) * defaultPixels;
    const SizeOverride* entry = LowerBound(axis, first);
    for (; entry != EndOf(axis) && entry->index < end; ++entry) {
        sum += PixelsFromUnits(entry->size, zoom) - defaultPixels;
    }
    return sum;
}

int RoughDistance(const GridAxis& axis, int first, int index, uint32_t zoom) {
    const auto indexes = static_cast<uint32_t>(index - first);
    uint32_t distance = zoom * static_cast<uint32_t>(axis.defaultSize / 4) * indexes;
    for (const SizeOverride* entry = LowerBound(axis, first);
         entry != EndOf(axis) && entry->index < index; ++entry) {
        distance += static_cast<uint32_t>(entry->delta);
    }
    return static_cast<int>(distance);
}

uint16_t UnitsFromPixels(uint16_t pixels, uint32_t zoom) {
    return static_cast<uint16_t>(static_cast<uint32_t>(pixels * 4.0 / zoom));
}

uint16_t UnitsWithinArea(uint16_t pixels, uint32_t zoom, int area) {
    const uint16_t units = UnitsFromPixels(pixels, zoom);
    if (units <= area) return units;
    return static_cast<uint16_t>(std::max(area - kAreaMargin, 0));
}

int CountVisible(const GridAxis& axis, int first, int limit, int extent, uint32_t zoom) {
    int count = 0;
    for (int sum = 0; sum < extent && first + count < limit && count < kCountLimit; ++count) {
        sum += SizeOf(axis, first + count, zoom);
    }
    return count;
}

int IndexAt(const GridAxis& axis, int first, int visibleCount, int origin, int position,
            uint32_t zoom) {
    int edge = origin;
    if (position <= edge + SizeOf(axis, first, zoom)) return first;
    for (int i = 0; i < visibleCount; ++i) {
        edge += SizeOf(axis, first + i, zoom);
        if (position <= edge + SizeOf(axis, first + i + 1, zoom)) return first + i + 1;
    }
    return 0;
}

VisibleSpan SelectedSpan(const GridAxis& axis, int selectedFirst, int selectedLast, int first,
                         int visibleCount, uint32_t zoom) {
    const int end = first + visibleCount;
    const auto inView = [=](int index) { return index >= first && index <= end; };
    const bool touches = inView(selectedFirst) || inView(selectedLast) ||
                         (selectedFirst <= first && selectedLast >= end);
    if (!touches) return {false, 0, 0};
    const int shownFirst = std::max(selectedFirst, first);
    const int shownLast = std::min(selectedLast, end);
    return {true, SizeOfRange(axis, first, shownFirst, zoom),
            SizeOfRange(axis, shownFirst, shownLast + 1, zoom)};
}

int RowHeaderWidthFor(int lastNumber) {
    if (lastNumber < 1000) return 30;
    return lastNumber < 10000 ? 35 : 40;
}

}  // namespace kor
