#include "graph/pointer.h"

#include <korcontrols/tooltip.h>

#include "graph/data/axes.h"
#include "graph/drawing/redraw.h"
#include "graph/hit_test.h"

namespace kor {

namespace {

// One per process, because there is only one pointer.
constinit wchar_t tipText[kTipTextCapacity] = {};

void ShowValueAt(const GraphRecord& graph, int x, int y) {
    if (!HitTestGraphValue(graph, x, y, tipText)) return;
    RECT parent = {};
    RECT chart = {};
    GetWindowRect(graph.hwndParent, &parent);
    GetWindowRect(graph.hwnd, &chart);
    const ToolTipRequest request = {tipText, chart.left - parent.left + x,
                                    chart.top - parent.top + y, 2 * chart.right - parent.right};
    KorToolTip_Show(graph.hwndToolTip, &request);
}

// Each step moves the view by one tick, as long as there is data beyond that edge.
void PanLeft(GraphRecord& graph, const RECT& plot) {
    if (xPixel(graph, graph.xDataMin) >= plot.left) return;
    MoveXCentre(graph, -graph.xTickStep);
    RedrawGraph(graph);
}

void PanRight(GraphRecord& graph, const RECT& plot) {
    if (xPixel(graph, graph.xDataMax) <= plot.right) return;
    MoveXCentre(graph, graph.xTickStep);
    RedrawGraph(graph);
}

void PanUp(GraphRecord& graph, const RECT& plot) {
    if (yPixel(graph, graph.yDataMax) >= plot.top) return;
    MoveYCentre(graph, graph.yTickStep);
    RedrawGraph(graph);
}

void PanDown(GraphRecord& graph, const RECT& plot) {
    if (yPixel(graph, graph.yDataMin) <= plot.bottom) return;
    MoveYCentre(graph, -graph.yTickStep);
    RedrawGraph(graph);
}

// Whether the position lies in the box around an arrow, whose tip is its first point.
bool IsInBox(int x, int y, LONG left, LONG right, LONG top, LONG bottom) {
    return left <= x && x <= right && top <= y && y <= bottom;
}

bool IsOnSideArrow(const Triangle& arrow, LONG left, LONG right, int x, int y) {
    return IsInBox(x, y, left, right, arrow.points[1].y, arrow.points[2].y);
}

bool IsOnUprightArrow(const Triangle& arrow, LONG top, LONG bottom, int x, int y) {
    return IsInBox(x, y, arrow.points[1].x, arrow.points[2].x, top, bottom);
}

// Only the first arrow that is hit acts.
bool PanByArrow(GraphRecord& graph, const RECT& plot, int x, int y) {
    const auto shown = [&](uint32_t bit) { return (graph.panArrows & bit) != 0; };
    const auto& left = graph.arrowLeft;
    const auto& right = graph.arrowRight;
    const auto& up = graph.arrowUp;
    const auto& down = graph.arrowDown;
    if (shown(kPanLeft) && IsOnSideArrow(left, left.points[0].x, left.points[1].x, x, y)) {
        PanLeft(graph, plot);
    } else if (shown(kPanRight) &&
               IsOnSideArrow(right, right.points[1].x, right.points[0].x, x, y)) {
        PanRight(graph, plot);
    } else if (shown(kPanUp) && IsOnUprightArrow(up, up.points[0].y, up.points[1].y, x, y)) {
        PanUp(graph, plot);
    } else if (shown(kPanDown) &&
               IsOnUprightArrow(down, down.points[1].y, down.points[0].y, x, y)) {
        PanDown(graph, plot);
    } else {
        return false;
    }
    return true;
}

}  // namespace

LRESULT OnGraphButtonDown(GraphRecord& graph, int x, int y) {
    const RECT plot = PlotArea(graph);
    if (plot.left <= x && x <= plot.right && plot.top <= y && y <= plot.bottom) {
        ShowValueAt(graph, x, y);
    } else if (PanByArrow(graph, plot, x, y)) {
        InvalidateRect(graph.hwnd, &graph.rcPlot, TRUE);
        UpdateWindow(graph.hwndParent);
    }
    return 0;
}

LRESULT OnGraphButtonUp(const GraphRecord& graph) {
    KorToolTip_Hide(graph.hwndToolTip);
    return 0;
}

}  // namespace kor
