#include "graph/data/entries.h"

#include "graph/data/palette.h"
#include "graph/data/record.h"
#include "graph/data/series.h"

namespace kor {

bool IsPieChart(const GraphRecord& graph) { return graph.chartType == kPie; }

int EntryCount(const GraphRecord& graph) {
    if (!IsPieChart(graph)) return graph.seriesCount;
    if (graph.categoryLabels) return graph.categoryCount;
    const GraphSeries* series = SeriesAt(graph, 0);
    return series ? series->pointCount : 0;
}

const wchar_t* EntryName(const GraphRecord& graph, int entry, wchar_t (&number)[kDecimalCapacity]) {
    if (!IsPieChart(graph)) return SeriesName(graph, entry);
    if (graph.categoryLabels) return graph.categoryLabels[entry];
    FormatDecimal(entry + 1, number);
    return number;
}

COLORREF EntryColour(const GraphRecord& graph, int entry) {
    return IsPieChart(graph) ? SliceColour(entry) : SeriesColour(graph, entry);
}

}  // namespace kor
