// Fonts and margins: how much room titles and labels need around the plot area.
#pragma once

#include "graph/data/record.h"

namespace kor {

// Creates the chart's fonts for a device: 10 points high, one of them rotated to read upwards.
void CreateGraphFonts(GraphRecord& graph, HDC dc);

// Measures titles and labels on `dc` and sets the margins. The right one never changes.
void LayoutGraphMargins(GraphRecord& graph, HDC dc);

// Size of a text in a font, as DrawTextW measures it.
SIZE MeasureText(HDC dc, HFONT font, const wchar_t* text);

}  // namespace kor
