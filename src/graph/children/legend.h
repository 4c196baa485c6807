// The legend: one line per entry of a chart, with a scroll bar of its own.
#pragma once

#include "platform/platform.h"

namespace kor {

struct GraphRecord;

// Registers the class once per process; false when that first call failed.
bool RegisterLegendClass(HINSTANCE instance);

// Lets a legend read a chart. False, with no change, without a chart or a legend's record. The
// chart must detach itself before its record is freed.
bool AttachLegend(HWND legend, const GraphRecord* graph);
void DetachLegend(HWND legend);

// Pixels from one line to the next in the legend's font, which is selected in `dc`.
int LegendLinePitch(HDC dc);

}  // namespace kor
