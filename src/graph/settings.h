// What the host sets on a chart besides its data: titles, type, options, zoom, colour.
#pragma once

#include "graph/data/record.h"

namespace kor {

// Replaces one of the record's titles; null or empty removes it.
void SetTitle(GraphRecord& graph, wchar_t*& title, const wchar_t* text);

void SetChartType(GraphRecord& graph, int type);
void ToggleOptions(GraphRecord& graph, uint32_t options);
void SetZoomIndex(GraphRecord& graph, int index);
int ZoomIndex(const GraphRecord& graph);
void SetBackgroundColour(GraphRecord& graph, COLORREF colour);

}  // namespace kor
