// The two colour tables, and which one all charts of the process use.
#pragma once

#include "platform/platform.h"

namespace kor {

// Takes the grey table for a device of fewer than 5 bits per pixel, else the colour table. The
// chart created last decides for all.
void ChoosePalette(HDC dc);

// Entry 0 is the foreground, 1 the background, series colours follow. Entries past a table's end
// are black, up to 20.
COLORREF PaletteEntry(int index);

// So many colours a pie's slices have, one after another and then again.
constexpr int kSliceColours = 15;

// Colour of a pie's slice k, and of the series added as number `count` (1 for the first).
COLORREF SliceColour(int slice);
COLORREF ColourOfSeriesNumber(int count);

}  // namespace kor
