#include "graph/drawing/image.h"

#include <korcontrols/graph.h>

#include <algorithm>

#include "base/gdi_scopes.h"
#include "graph/data/axes.h"
#include "graph/drawing/frame.h"
#include "graph/drawing/live.h"
#include "graph/drawing/redraw.h"

namespace kor {

namespace {

void ReplaceBitmap(GraphRecord& graph, int width, int height) {
    WindowDC window(graph.hwnd);
    HBITMAP bitmap = CreateCompatibleBitmap(window.get(), std::max(RoundedUpTo4(width), 1),
                                            std::max(RoundedUpTo4(height), 1));
    if (!bitmap) return;  // the old image is better than none
    HGDIOBJ previous = SelectObject(graph.hdcMem, bitmap);
    if (graph.hbmMem) {
        DeleteObject(graph.hbmMem);
    } else {
        graph.blankBitmap = previous;
    }
    graph.hbmMem = bitmap;
}

// In live mode an area that touches neither the left nor the right edge is drawn in the window
// itself.
bool IsLivePart(const GraphRecord& graph, const RECT& area) {
    return HasOption(graph, KORGRAPH_LIVE) && area.left != 0 && area.right != graph.rcPlot.right;
}

}  // namespace

void ResizeImage(GraphRecord& graph, int width, int height) {
    ReplaceBitmap(graph, width, height);
    graph.rcPlot = {0, 0, width, height};
    ClipToSurface(graph, graph.hdcMem);
    Rescale(graph);
    RedrawGraph(graph);
}

void PaintFromImage(GraphRecord& graph) {
    PaintScope paint(graph.hwnd);
    const RECT& area = paint.area();
    if (!paint.dc()) {
        WindowDC window(graph.hwnd);
        BitBlt(window.get(), 0, 0, graph.rcPlot.right, graph.rcPlot.bottom, graph.hdcMem, 0, 0,
               SRCCOPY);
    } else if (IsLivePart(graph, area)) {
        PaintLiveRect(graph, paint.dc(), area);
    } else {
        // This copies more than the rectangle; the update region clips the excess.
        BitBlt(paint.dc(), area.left, area.top, area.right, area.bottom, graph.hdcMem, area.left,
               area.top, SRCCOPY);
    }
}

}  // namespace kor
