#include "graph/drawing/redraw.h"

#include "graph/drawing/bars.h"
#include "graph/drawing/lines.h"
#include "graph/drawing/pie.h"

namespace kor {

void DrawGraph(GraphRecord& graph) {
    switch (graph.chartType) {
    case kLine: DrawLineChart(graph, graph.hdcMem); break;
    case kArea: DrawAreaChart(graph, graph.hdcMem); break;
    case kBar: DrawBarChart(graph, graph.hdcMem); break;
    case kColumn: DrawColumnChart(graph, graph.hdcMem); break;
    case kPie: DrawPieChart(graph, graph.hdcMem); break;
    default: break;
    }
}

void RedrawGraph(GraphRecord& graph) {
    if (graph.hwnd) DrawGraph(graph);
}

}  // namespace kor
