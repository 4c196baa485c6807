#include "graph/graph_redraw.h"

#include "graph/graph_bars.h"
#include "graph/graph_lines.h"
#include "graph/graph_pie.h"

namespace kor {

void RedrawGraph(GraphRecord& graph) {
    if (!graph.hwnd) return;
    switch (graph.chartType) {
    case kLine: DrawLineChart(graph, graph.hdcMem); break;
    case kArea: DrawAreaChart(graph, graph.hdcMem); break;
    case kBar: DrawBarChart(graph, graph.hdcMem); break;
    case kColumn: DrawColumnChart(graph, graph.hdcMem); break;
    case kPie: DrawPieChart(graph, graph.hdcMem); break;
    default: break;
    }
}

}  // namespace kor
