// A page is drawn with the code that draws the screen. While it is printed, the record describes
// the page: hdcMem and rcPlot are the printer's, and fonts, margins and scaling follow from them.
// Meanwhile the window procedure keeps all messages away from the record; a missed paint or change
// of size is made up for afterwards.
#include "graph/output/printing.h"

#include "base/windows_helpers.h"
#include "graph/data/axes.h"
#include "graph/drawing/frame.h"
#include "graph/drawing/image.h"
#include "graph/drawing/layout.h"
#include "graph/drawing/redraw.h"
#include "graph/output/printing_calls.h"

namespace kor {

namespace {

// Only the fonts follow the printer's resolution. Pens, markers, minimum margins and ticks have the
// same number of pixels as on the screen, and come out small.
void BecomePage(GraphRecord& graph, HDC printer) {
    graph.rcPlot = {0, 0, GetDeviceCaps(printer, HORZRES), GetDeviceCaps(printer, VERTRES)};
    graph.hdcMem = printer;
    ClipToSurface(graph, printer);
    SetBkMode(printer, TRANSPARENT);  // like the off-screen image
    CreateGraphFonts(graph, printer);
    LayoutGraphMargins(graph, printer);
    Rescale(graph);
}

// Restores everything as it was for the screen, even where a new layout or scaling would give other
// values, so that a redraw gives the same picture as before. Only the fonts have to be created
// again.
void BecomeScreen(GraphRecord& graph, const GraphRecord& screen) {
    CreateGraphFonts(graph, screen.hdcMem);
    const GraphRecord page = graph;
    graph = screen;
    graph.hfontTitle = page.hfontTitle;
    graph.hfontXTitle = page.hfontXTitle;
    graph.hfontYTitle = page.hfontYTitle;
    graph.hfontLabel = page.hfontLabel;
    graph.hfontAxis = page.hfontAxis;
    graph.printing = page.printing;
    graph.life = page.life;
    graph.paintMissed = page.paintMissed;
    graph.sizeMissed = page.sizeMissed;
    ClipToSurface(graph, graph.hdcMem);
}

// Meanwhile default processing has validated the window and left the image in its old size.
void CatchUp(GraphRecord& graph) {
    graph.printing = PrintState::underWay;
    if (graph.life.retired) return;
    const RECT client = ClientRectOf(graph.hwnd);
    const bool fits = client.right == graph.rcPlot.right && client.bottom == graph.rcPlot.bottom;
    if (graph.sizeMissed && !fits && graph.hdcMem) {
        ResizeImage(graph, client.right, client.bottom);
    }
    if (graph.paintMissed) InvalidateArea(graph.hwnd, client);
    graph.paintMissed = graph.sizeMissed = false;
}

void PrintOn(GraphRecord& graph, HDC printer) {
    // Compatibility: the window stays disabled until the host enables it
    // (PrintProtocol.WindowStaysDisabledUntilTheHostEnablesIt).
    if (graph.hwnd) EnableWindow(graph.hwnd, FALSE);
    BeginPrintJob(printer);
    const GraphRecord screen = graph;
    graph.printing = PrintState::onPage;
    BecomePage(graph, printer);
    DrawGraph(graph);
    EndPrintJob(printer);
    DeleteDC(printer);
    BecomeScreen(graph, screen);
    CatchUp(graph);
}

}  // namespace

void PrintGraph(GraphRecord& graph) {
    if (!CanPrint() || graph.printing != PrintState::none) return;
    graph.printing = PrintState::underWay;
    HDC printer = AskForPrinter(graph.hwnd);
    if (printer && !graph.life.retired) {
        PrintOn(graph, printer);
    } else if (printer) {
        DeleteDC(printer);  // the chart was destroyed meanwhile
    }
    graph.printing = PrintState::none;
}

}  // namespace kor
