// Drawing is the screen's, so for the time of a page the record stands for the page: hdcMem and
// rcPlot are the printer's, and fonts, margins and scaling follow from them. Meanwhile the window
// procedure keeps all messages away from the record; a paint and a new size are made up for after
// it.
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

// Only the fonts follow the printer's resolution. Pens, markers, least margins and ticks are so
// many pixels here as on the screen, and come out small.
void BecomePage(GraphRecord& graph, HDC printer) {
    graph.rcPlot = {0, 0, GetDeviceCaps(printer, HORZRES), GetDeviceCaps(printer, VERTRES)};
    graph.hdcMem = printer;
    ClipToSurface(graph, printer);
    SetBkMode(printer, TRANSPARENT);  // as the off-screen image has it
    CreateGraphFonts(graph, printer);
    LayoutGraphMargins(graph, printer);
    Rescale(graph);
}

// Everything is as it was for the screen, whatever a layout or a scaling would give by now: a
// redraw gives the picture from before. Only the fonts have to be made again.
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

// Default processing has validated the window and left the image in its old size.
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
    // The host enables the window again, when it likes.
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
        DeleteDC(printer);  // chosen for a chart that is gone
    }
    graph.printing = PrintState::none;
}

}  // namespace kor
