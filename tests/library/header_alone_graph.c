/* The first and only thing that this file includes. */
#include <korcontrols/graph.h>

DWORD useGraphHeaderAlone(HWND graph);

DWORD useGraphHeaderAlone(HWND graph)
{
    static const double values[] = {1, 2};
    GraphSeriesData data = {2, L"name", 0, 0};
    RECT place = {0, 0, 10, 10};
    data.values = values;
    KorGraph_AddSeries(graph, &data);
    KorGraph_ReplaceSeries(graph, &data);
    KorGraph_SetValue(graph, 0, 0, 3.0);
    KorGraph_SetTitle(graph, L"title");
    KorGraph_SetRange(graph, KORGRAPH_X, 0, 1);
    KorGraph_SetType(graph, KORGRAPH_PIE);
    KorGraph_SetZoom(graph, KORGRAPH_ZOOM100);
    KorGraph_ToggleOptions(graph, KORGRAPH_LIVE);
    KorGraph_ShowLegend(graph, &place);
    KorGraph_Redraw(graph);
    return KorGraph_GetOptions(graph) + KorGraph_GetSeriesColour(graph, 0) +
           RegisterGraphControl(0) + (DWORD)(GetGraphControlClassName() != 0);
}
