// The two colour tables, and which one all charts of the process use.
#pragma once

#include "platform/platform.h"

namespace kor {

// Selects the grey table for a device of fewer than 5 bits per pixel, else the colour table. The
// chart created last decides for all charts.
void ChoosePalette(HDC dc);

// Entry 0 is the foreground, 1 the background; series colours follow. Entries past a table's end
// are black.
COLORREF PaletteEntry(int index);

// Number of different slice colours in a pie; they repeat in order.
constexpr int kSliceColours = 15;

// Colour of a pie's slice, counted from 0, and of the series added as number `count`, 1 for the
// first.
COLORREF SliceColour(int slice);
COLORREF ColourOfSeriesNumber(int count);

}  // namespace kor
