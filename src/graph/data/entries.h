// What the legend may know of a chart: its entries, the series or, in a pie, the slices.
#pragma once

#include "base/runtime.h"
#include "platform/platform.h"

namespace kor {

struct GraphRecord;

bool IsPieChart(const GraphRecord& graph);

int EntryCount(const GraphRecord& graph);

// The entry's name, in the chart's memory or in `number`; null for an entry that has none.
const wchar_t* EntryName(const GraphRecord& graph, int entry, wchar_t (&number)[kDecimalCapacity]);

COLORREF EntryColour(const GraphRecord& graph, int entry);

}  // namespace kor
