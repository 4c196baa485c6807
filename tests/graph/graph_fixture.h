// What every test of the chart's window needs: a host, a chart in it, senders and readers.
//
//   TEST_F(GraphTest, FirstSeriesIsGreen) {
//       create();
//       add({1, 2, 3});
//       EXPECT_EQ(colour(0), RGB(0, 255, 0));
//   }
#pragma once

#include <korcontrols/graph.h>
#include <korcontrols/legend.h>
#include <korcontrols/tooltip.h>

#include "support/guard_heap.h"
#include "support/handle_balance.h"
#include "support/import_spy.h"
#include "support/input.h"
#include "support/pixels.h"
#include "support/recording_host.h"

#include <gtest/gtest.h>

#include <functional>
#include <memory>
#include <string>
#include <utility>
#include <vector>

namespace kortest {

// What the chart asked its tooltip to show.
struct TipRequest {
    std::wstring text;
    LONG x;
    LONG y;
    LONG limit;
};

// One call of InvalidateRect; `isWhole` without a rectangle.
struct Invalidation {
    HWND window;
    bool isWhole;
    RECT area;
    bool erases;
};

constexpr DWORD kAllOptions = 0x3FF;

class GraphTest : public ::testing::Test {
protected:
    enum class Heap { kOrdinary, kGuarded };

    explicit GraphTest(Heap kind = Heap::kOrdinary);

    // A visible chart in the host, painted once.
    void create(int width = 230, int height = 130, int left = 0, int top = 0);

    // The same without any option, so that all margins are 15 pixels: the plot area of the usual
    // size is 200 by 100 pixels from (15, 15) to (215, 115).
    void createPlain(int width = 230, int height = 130);

    // A plain chart of nine points that shows 0 to 10 on both axes: 20 pixels make one x unit, 10
    // pixels one y unit. Point k has the value k + 1, the last one 10.
    void createRegular();

    void destroy();
    void resize(int width, int height);

    // Lets everything paint and forgets what was recorded.
    void settle();

    LRESULT send(UINT message, WPARAM wParam = 0, LPARAM lParam = 0) const;
    LRESULT notify(UINT code, LPARAM argument = 0) const;

    LRESULT add(const std::vector<double>& values, const wchar_t* name = nullptr) const;
    void setValue(LONG series, LONG point, double value) const;
    void replace(LONG series, const std::vector<double>& values) const;
    LRESULT categories(const std::vector<const wchar_t*>& labels) const;
    void redraw() const { notify(GN_REDRAW); }

    std::pair<double, double> range(LONG axis) const;
    COLORREF colour(LONG index) const { return KorGraph_GetSeriesColour(graph, index); }
    const wchar_t* title(UINT getter) const;

    // The off-screen image, as large as the client area.
    Picture image() const;
    SIZE bitmapSize() const;

    // The text that a press at a client position brings into the tooltip; "-" for none.
    std::wstring tap(int x, int y);

    // From now on InvalidateRect's calls are written down.
    void watchInvalidations();
    std::vector<Invalidation> invalidationsOf(HWND window) const;

    // The area of the only one that the chart had since the list was cleared: a part, not erased.
    RECT onlyInvalidation() const;

    // The texts that the library draws meanwhile, in order; measuring is left out.
    std::vector<std::wstring> textsOf(const std::function<void()>& action);

    HWND showLegend(const RECT& place) const;

    // Calls of DefWindowProcW with one message, since the spy's last clearCalls; it must be
    // watched.
    int defaultCalls(UINT message) const;

    ImportSpy spy;
    std::unique_ptr<GuardHeap> heap;  // outlives the host and with it every window
    RecordingHost host;
    HWND graph = nullptr;
    HWND tip = nullptr;
    HDC imageDC = nullptr;  // the chart's own off-screen DC
    std::vector<TipRequest> shown;
    int hidden = 0;  // times that the tooltip was told to hide
    std::vector<Invalidation> invalidations;

private:
    HWND newToolTip() const;
    static LRESULT CALLBACK tipProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam);
    WNDPROC tipOriginal_ = nullptr;
};

// The same with every heap block of the library against a page that nobody may touch.
class GuardedGraphTest : public GraphTest {
protected:
    GuardedGraphTest() : GraphTest(Heap::kGuarded) {}
    void TearDown() override { EXPECT_EQ(heap->report(), ""); }
};

// Registers the chart's class, once in the process.
void RegisterGraphClass();

// A chart of another parent, place or instance; it may come out without a record.
HWND CreateGraphWindow(HWND parent, DWORD style, const RECT& place, HINSTANCE instance);

// Client area of a window in its parent's client coordinates, and the whole window there.
RECT PlaceIn(HWND parent, HWND window);

RECT ClientOf(HWND window);

// An argument that is a number: 32 bits, on 64-bit systems the rest of its place is undefined.
DWORD NumberAt(const ImportCall& call, size_t place);

}  // namespace kortest
