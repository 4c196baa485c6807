// Column and bar charts.
#pragma once

#include "graph/record.h"

namespace kor {

void DrawColumnChart(GraphRecord& graph, HDC dc);
void DrawBarChart(GraphRecord& graph, HDC dc);

// Where series number `index`, from 0, stands across a group that is centred on its category, in
// pixels from the category's own.
constexpr int OffsetInGroup(int index, int seriesCount, int thickness) {
    return index * thickness - (seriesCount * thickness) / 2;
}

}  // namespace kor
