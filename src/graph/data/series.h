// The chart's data: copies of what the host hands over, their extremes, and category labels.
#pragma once

#include <korcontrols/graph.h>

#include "graph/data/record.h"
#include "graph/shapes/pie_layout.h"

namespace kor {

// Adds a series; false for null values, a count below 1 or no memory, and nothing is added then.
bool AddSeries(GraphRecord& graph, const GraphSeriesData& data);

// Stores one value and keeps the series' extremes. What the chart as a whole spans follows the last
// added series only; single values do not change it.
void SetSeriesValue(GraphRecord& graph, const GraphValue& point);

// Copies new values over a series' old ones; its number of points stays.
void ReplaceSeriesValues(GraphRecord& graph, const GraphSeriesData& data);

// Frees all series and labels. The number of categories stays as it was, although there are none.
void RemoveAllSeries(GraphRecord& graph);

// Replaces the category labels; false without memory, with the labels copied so far kept.
bool SetCategories(GraphRecord& graph, int count, const wchar_t* const* labels);

// The series of an index, or null.
GraphSeries* SeriesAt(const GraphRecord& graph, int index);

// Colour of a series, or of a slice while the chart is a pie; 0 for a bad index.
COLORREF SeriesColour(const GraphRecord& graph, int index);

// Whether the series makes a pie: it has values, and they are not all 0.
bool HasSlices(const GraphSeries* series);

// The slices of a series that has some.
Slices SlicesOf(const GraphSeries& series);

// Name of a series; null without one and for a bad index.
const wchar_t* SeriesName(const GraphRecord& graph, int index);

}  // namespace kor
