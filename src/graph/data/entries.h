// What the legend sees of a chart: its entries, which are the series or, in a pie, the slices.
#pragma once

#include "base/runtime.h"
#include "platform/platform.h"

namespace kor {

struct GraphRecord;

bool IsPieChart(const GraphRecord& graph);

int EntryCount(const GraphRecord& graph);

// The entry's name, either in the chart's memory or in `number`; null for an entry without a name.
const wchar_t* EntryName(const GraphRecord& graph, int entry, wchar_t (&number)[kDecimalCapacity]);

COLORREF EntryColour(const GraphRecord& graph, int entry);

}  // namespace kor
