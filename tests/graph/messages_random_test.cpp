// Messages that nobody would send, with fixed seeds; numbers only, or pointers to whole records.
#include "graph/graph_fixture.h"

#include <limits>
#include <random>

namespace kortest {
namespace {

class GraphRandom : public GuardedGraphTest, public ::testing::WithParamInterface<unsigned> {
protected:
    int below(unsigned limit) { return static_cast<int>(random() % limit); }

    LPARAM number() {
        static const DWORD kExtremes[] = {
            0, 1, 2, 3, 4, 5, 0x7FFF, 0x8000, 0xFFFF, 0x10000, 0x7FFFFFFF, 0x80000000, 0xFFFFFFFF};
        switch (below(4)) {
        case 0: return static_cast<LPARAM>(kExtremes[random() % std::size(kExtremes)]);
        case 1: return static_cast<LPARAM>(static_cast<int>(random()));
        default: return MAKELPARAM(below(260), below(160));
        }
    }

    double value() {
        switch (below(12)) {
        case 0: return std::numeric_limits<double>::infinity();
        case 1: return std::numeric_limits<double>::quiet_NaN();
        case 2: return -1e300;
        case 3: return 1e-300;
        case 4: return 0;
        default: return (below(2000) - 700) / 100.0;
        }
    }

    std::vector<double> values() {
        std::vector<double> some(static_cast<size_t>(1 + below(12)));
        for (double& one : some) one = value();
        return some;
    }

    void sendNumber() {
        static const UINT kMessages[] = {
            WM_SIZE,        WM_PAINT,         WM_LBUTTONDOWN, WM_LBUTTONDOWN, WM_LBUTTONUP,
            WM_RBUTTONDOWN, WM_MOUSEMOVE,     GM_SETTYPE,     GM_AUTORANGE,   GM_SETZOOM,
            GM_SETZOOM,     GM_TOGGLEOPTIONS, GM_SETDATAMODE, GM_SETBKCOLOR,  WM_USER + 6003,
            WM_SHOWWINDOW,  WM_ENABLE,        GN_CLEAR,       GN_RESET,       GN_REDRAW};
        const UINT message = kMessages[random() % std::size(kMessages)];
        LPARAM lParam = number();
        if (message == WM_SIZE) lParam = MAKELPARAM(below(400), below(300));
        if (message == GM_SETTYPE && below(8)) lParam = below(5);
        if (message == GM_SETZOOM && below(4)) lParam = below(4);
        if (message == WM_SHOWWINDOW) lParam = 0;
        send(message, static_cast<WPARAM>(below(2)), lParam);
    }

    void sendData() {
        switch (below(10)) {
        case 0:
        case 1: add(values(), below(2) ? L"name" : nullptr); break;
        case 2:
        case 3: setValue(below(6) - 1, below(14) - 1, value()); break;
        case 4: replace(below(6) - 1, values()); break;
        case 5:
            categories(std::vector<const wchar_t*>(random() % 9, below(3) ? L"text" : nullptr));
            break;
        case 6:
        case 7: KorGraph_SetRange(graph, below(3), value(), value()); break;
        case 8: notify(GN_RESET, below(2)); break;
        default: notify(GN_CLEAR);
        }
    }

    void sendNotification() {
        static const UINT kCodes[] = {GN_REDRAW, GN_REDRAW, GN_SETVALUE, GN_REPLACESERIES};
        notify(kCodes[random() % std::size(kCodes)], 0);
    }

    // In replace mode the argument is a pointer.
    void liveUpdate() {
        KorGraph_SetDataMode(graph, below(3));
        const std::vector<double> some = values();
        const GraphSeriesData data = {static_cast<LONG>(some.size()), nullptr, some.data(),
                                      below(3) - 1};
        notify(GN_LIVEUPDATE, reinterpret_cast<LPARAM>(&data));
        const RECT part = {below(200), 0, 40 + below(200), 130};
        InvalidateRect(graph, &part, FALSE);
        UpdateWindow(graph);
    }

    void sendToLegend() {
        if (const HWND legend = GetDlgItem(graph, KORLEGEND_ID))
            SendMessageW(legend, below(3) ? UINT{WM_VSCROLL} : UINT{WM_PAINT},
                         MAKEWPARAM(below(10), below(100)), 0);
    }

    std::mt19937 random;
};

TEST_P(GraphRandom, MessagesLeaveTheChartAlive) {
    random.seed(GetParam() * 7919);
    create();
    if (GetParam() % 2) showLegend({10, 10, 90, 80});
    for (int i = 0; i < 400; ++i) {
        switch (below(10)) {
        case 0:
        case 1:
        case 2: sendData(); break;
        case 3: liveUpdate(); break;
        case 4: sendNotification(); break;
        case 5: sendToLegend(); break;
        default: sendNumber();
        }
        if (i % 25 == 0) settle();
        ASSERT_EQ(heap->report(), "") << "after " << i;
    }
    EXPECT_TRUE(IsWindow(graph));
    if (KorGraph_GetOptions(graph) & KORGRAPH_LIVE) send(GM_TOGGLEOPTIONS, 0, KORGRAPH_LIVE);
    send(GM_TOGGLEOPTIONS, 0, static_cast<LPARAM>(KorGraph_GetOptions(graph)));
    KorGraph_SetType(graph, KORGRAPH_LINE);
    for (const UINT setter : {GM_SETTITLE, GM_SETXTITLE, GM_SETYTITLE}) send(setter);
    notify(GN_RESET, 1);
    KorGraph_SetZoom(graph, KORGRAPH_ZOOM100);
    send(WM_SIZE, 0, MAKELPARAM(230, 130));
    add({1, 2, 3, 4, 5, 6, 7, 8, 10});
    EXPECT_EQ(tap(95, 75), L"Value:4") << "a chart like any other";
}

INSTANTIATE_TEST_SUITE_P(Seeds, GraphRandom, ::testing::Range(1u, 13u));

}  // namespace
}  // namespace kortest
