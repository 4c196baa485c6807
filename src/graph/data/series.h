// The chart's data: copies of what the host passes, their extremes, and category labels.
#pragma once

#include <korcontrols/graph.h>

#include "graph/data/record.h"
#include "graph/shapes/pie_layout.h"

namespace kor {

// Adds a series. False, with nothing added, for null values, a count below 1 or lack of memory.
bool AddSeries(GraphRecord& graph, const GraphSeriesData& data);

// Stores one value and updates the series' extremes. Compatibility: the extremes of the whole chart
// are found only when a series is added; single values do not change them
// (GraphDataExtremes.FollowOnlyTheLastAddedSeries).
void SetSeriesValue(GraphRecord& graph, const GraphValue& point);

// Copies new values over a series' old ones. Its number of points stays.
void ReplaceSeriesValues(GraphRecord& graph, const GraphSeriesData& data);

// Frees all series and labels. Compatibility: the number of categories stays, although there are
// none any more (GraphCategories.CountStaysWhenAllSeriesAreRemoved).
void RemoveAllSeries(GraphRecord& graph);

// Replaces the category labels. False for lack of memory; the labels copied so far stay.
bool SetCategories(GraphRecord& graph, int count, const wchar_t* const* labels);

// The series at an index, or null.
GraphSeries* SeriesAt(const GraphRecord& graph, int index);

// Colour of a series, or of a slice while the chart is a pie; 0 for a bad index.
COLORREF SeriesColour(const GraphRecord& graph, int index);

// Whether the series makes a pie: it has values, and the sum of their absolute values is above 0
// and finite.
bool HasSlices(const GraphSeries* series);

// The slices of a series that has some.
Slices SlicesOf(const GraphSeries& series);

// Name of a series; null without one and for a bad index.
const wchar_t* SeriesName(const GraphRecord& graph, int index);

}  // namespace kor
