// The message table: results, initial values, what acts only inside WM_NOTIFY.
#include "graph/graph_fixture.h"

namespace kortest {
namespace {

class GraphMessages : public GraphTest {
protected:
    static LPARAM text(const wchar_t* words) { return reinterpret_cast<LPARAM>(words); }
};

TEST_F(GraphMessages, StartWithTheInitialValues) {
    create();
    EXPECT_EQ(KorGraph_GetType(graph), KORGRAPH_LINE);
    EXPECT_EQ(KorGraph_GetZoom(graph), KORGRAPH_ZOOM100);
    EXPECT_EQ(KorGraph_GetOptions(graph), kAllOptions);
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.0, 1.0}));
    EXPECT_EQ(range(KORGRAPH_Y), (std::pair{0.0, 1.0}));
    for (const UINT getter : {GM_GETTITLE, GM_GETXTITLE, GM_GETYTITLE})
        EXPECT_EQ(title(getter), nullptr);
    EXPECT_EQ(colour(0), 0u);
}

TEST_F(GraphMessages, AnswerZero) {
    create();
    EXPECT_EQ(add({1, 2}), 0);
    EXPECT_EQ(categories({L"a"}), 0);
    const GraphRange shownRange = {0, 0, 1, 5};
    RECT place = {10, 10, 60, 60};
    LONG number = 0;
    COLORREF found = 0;
    const wchar_t* stored = nullptr;
    const GraphValue value = {0, 0, 3};
    GraphRange read = {0, 0, 0, 0};
    const struct {
        UINT message;
        WPARAM wParam;
        LPARAM lParam;
    } rows[] = {{GM_SETTITLE, 0, text(L"t")},
                {GM_SETXTITLE, 0, text(L"t")},
                {GM_SETYTITLE, 0, text(L"t")},
                {GM_GETTITLE, 0, reinterpret_cast<LPARAM>(&stored)},
                {GM_GETXTITLE, 0, reinterpret_cast<LPARAM>(&stored)},
                {GM_GETYTITLE, 0, reinterpret_cast<LPARAM>(&stored)},
                {GM_SETTYPE, 0, KORGRAPH_AREA},
                {GM_GETTYPE, 0, reinterpret_cast<LPARAM>(&number)},
                {GM_SETRANGE, 0, reinterpret_cast<LPARAM>(&shownRange)},
                {GM_AUTORANGE, 0, KORGRAPH_X},
                {GM_SETZOOM, 0, KORGRAPH_ZOOM50},
                {GM_TOGGLEOPTIONS, 0, KORGRAPH_TITLE},
                {GM_GETOPTIONS, 0, reinterpret_cast<LPARAM>(&number)},
                {GM_SETDATAMODE, 0, 1},
                {GM_SHOWLEGEND, 0, reinterpret_cast<LPARAM>(&place)},
                {GM_GETSERIESCOLOR, 0, reinterpret_cast<LPARAM>(&found)},
                {GM_SETBKCOLOR, 0, RGB(1, 2, 3)},
                {GM_GETZOOM, 0, reinterpret_cast<LPARAM>(&number)},
                {GM_GETRANGE, 0, reinterpret_cast<LPARAM>(&read)},
                {WM_NOTIFY, GN_SETVALUE, reinterpret_cast<LPARAM>(&value)},
                {WM_NOTIFY, GN_REDRAW, 0},
                {WM_NOTIFY, GN_LIVEUPDATE, 0},
                {WM_NOTIFY, GN_CLEAR, 0},
                {WM_NOTIFY, GN_RESET, 1},
                {WM_LBUTTONDOWN, 0, MAKELPARAM(50, 50)},
                {WM_LBUTTONUP, 0, MAKELPARAM(50, 50)},
                {WM_RBUTTONDOWN, 0, MAKELPARAM(50, 50)},
                {WM_SIZE, 0, MAKELPARAM(230, 130)}};
    for (const auto& row : rows)
        EXPECT_EQ(send(row.message, row.wParam, row.lParam), 0) << row.message << " " << row.wParam;
}

TEST_F(GraphMessages, HandledOnesDoNotReachDefaultProcessing) {
    create();
    spy.watch("DefWindowProcW");
    for (UINT message = GM_ADDSERIES; message <= GM_GETOPTIONS; ++message)
        if (message != WM_USER + 6003) send(message, 0, 0);
    for (UINT message = GM_SETDATAMODE; message <= GM_GETRANGE; ++message) send(message, 0, 0);
    for (const UINT code : {GN_RESET, GN_SETVALUE, GN_REDRAW, GN_LIVEUPDATE, GN_CLEAR})
        notify(code, 0);
    send(WM_RBUTTONDOWN);
    send(WM_LBUTTONUP);
    send(WM_LBUTTONDOWN);
    EXPECT_EQ(spy.count("DefWindowProcW"), 0);
}

TEST_F(GraphMessages, OthersReachDefaultProcessing) {
    create();
    spy.watch("DefWindowProcW");
    const GraphSeriesData data = {1, nullptr, nullptr, 5};
    send(WM_USER + 6003);
    send(WM_USER + 5999);
    send(WM_USER + 6031);
    send(WM_NULL);
    send(WM_NOTIFY, 77, 0);
    send(WM_NOTIFY, GM_SETTYPE, 3);
    notify(GN_REPLACESERIES, reinterpret_cast<LPARAM>(&data));
    send(WM_MOUSEMOVE);
    EXPECT_EQ(defaultCalls(WM_USER + 6003), 1);
    EXPECT_EQ(defaultCalls(WM_USER + 5999), 1);
    EXPECT_EQ(defaultCalls(WM_USER + 6031), 1);
    EXPECT_EQ(defaultCalls(WM_NULL), 1);
    EXPECT_EQ(defaultCalls(WM_NOTIFY), 3);
    EXPECT_EQ(defaultCalls(WM_MOUSEMOVE), 1);
    EXPECT_EQ(KorGraph_GetType(graph), KORGRAPH_LINE) << "only the codes act inside WM_NOTIFY";
}

// The codes fall to default processing when they come as messages of their own.
TEST_F(GraphMessages, CodesOutsideNotifyDoNothing) {
    createRegular();
    const Picture before = image();
    const double values[] = {9, 9, 9};
    const GraphValue value = {0, 0, 9};
    const GraphSeriesData data = {3, nullptr, values, 0};
    spy.watch("DefWindowProcW");
    PatBlt(imageDC, 0, 0, 10, 10, BLACKNESS);
    for (const LPARAM argument : {LPARAM{0}, LPARAM{1}}) send(GN_RESET, 0, argument);
    send(GN_SETVALUE, 0, reinterpret_cast<LPARAM>(&value));
    send(GN_REDRAW);
    send(GN_LIVEUPDATE, 0, 5);
    send(GN_REPLACESERIES, 0, reinterpret_cast<LPARAM>(&data));
    send(GN_CLEAR);
    EXPECT_EQ(spy.count("DefWindowProcW"), 7);
    EXPECT_EQ(image().pixel(5, 5), RGB(0, 0, 0)) << "nothing was drawn";
    EXPECT_EQ(colour(0), RGB(0, 255, 0)) << "the series is still there";
    redraw();
    EXPECT_TRUE(SamePicture(before, image()));
}

TEST_F(GraphMessages, OptionsAreTurnedOver) {
    create();
    send(GM_TOGGLEOPTIONS, 0, 0x005);
    EXPECT_EQ(KorGraph_GetOptions(graph), 0x3FAu);
    send(GM_TOGGLEOPTIONS, 0, 0x401);
    EXPECT_EQ(KorGraph_GetOptions(graph), 0x7FBu);
    send(GM_TOGGLEOPTIONS, 0, static_cast<LPARAM>(0x80000000));
    EXPECT_EQ(KorGraph_GetOptions(graph), 0x800007FBu) << "bits without a meaning are kept";
    send(GM_TOGGLEOPTIONS, 0, 0);
    EXPECT_EQ(KorGraph_GetOptions(graph), 0x800007FBu);
}

// Margins follow the options at once: a plot without labels is larger, and points move.
TEST_F(GraphMessages, OptionsLayOutAndScaleButDrawNothing) {
    create();
    add({5, 5, 5});
    redraw();
    const Picture before = image();
    watchInvalidations();
    send(GM_TOGGLEOPTIONS, 0, kAllOptions);
    EXPECT_TRUE(SamePicture(before, image()));
    EXPECT_EQ(invalidations.size(), 0u);
    EXPECT_EQ(tap(65, 15), L"Value:5") << "50 pixels a unit from column 15";
}

TEST_F(GraphMessages, BackgroundIsForTheNextRedraw) {
    createPlain();
    watchInvalidations();
    const Picture before = image();
    send(GM_SETBKCOLOR, 0, RGB(10, 20, 30));
    EXPECT_TRUE(SamePicture(before, image()));
    EXPECT_EQ(invalidations.size(), 0u);
    redraw();
    EXPECT_EQ(image().pixel(3, 3), RGB(10, 20, 30));
    EXPECT_EQ(image().pixel(100, 60), RGB(10, 20, 30));
}

TEST_F(GraphMessages, BackgroundIsWhiteAtFirst) {
    createPlain();
    EXPECT_EQ(image().pixel(3, 3), RGB(255, 255, 255));
}

TEST_F(GraphMessages, EraseSetsTheColourAndErasesNothing) {
    create();
    send(GM_SETBKCOLOR, 0, RGB(10, 20, 30));
    Canvas canvas(20, 20, RGB(1, 1, 1));
    spy.watch("DefWindowProcW");
    EXPECT_EQ(send(WM_ERASEBKGND, reinterpret_cast<WPARAM>(canvas.dc())), 0);
    EXPECT_EQ(GetBkColor(canvas.dc()), RGB(10, 20, 30));
    EXPECT_EQ(canvas.picture().count(RGB(1, 1, 1)), 400);
    EXPECT_EQ(spy.count("DefWindowProcW"), 0);
}

TEST_F(GraphMessages, RedrawOfAHiddenChartStillDraws) {
    createPlain();
    ShowWindow(graph, SW_HIDE);
    PatBlt(imageDC, 0, 0, 230, 130, BLACKNESS);
    redraw();
    EXPECT_EQ(image().pixel(3, 3), RGB(255, 255, 255));
}

// ---- Reset ------------------------------------------------------------------------------------

class GraphReset : public GraphTest {
protected:
    GraphReset() {
        create();
        add({4, -6, 8}, L"one");
        categories({L"a", L"b", L"c"});
        KorGraph_SetRange(graph, KORGRAPH_X, 2, 20);
        send(GM_SETZOOM, 0, KORGRAPH_ZOOM50);
    }
};

TEST_F(GraphReset, ClearKeepsTheRanges) {
    notify(GN_CLEAR);
    EXPECT_EQ(colour(0), 0u) << "no series";
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{2.0, 20.0}));
    EXPECT_EQ(range(KORGRAPH_Y), (std::pair{-6.0, 8.0}));
}

TEST_F(GraphReset, WithoutRangesIsAClear) {
    notify(GN_RESET, 0);
    EXPECT_EQ(colour(0), 0u);
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{2.0, 20.0}));
    EXPECT_EQ(range(KORGRAPH_Y), (std::pair{-6.0, 8.0}));
}

TEST_F(GraphReset, WithRangesShowsZeroToOneAutomatically) {
    notify(GN_RESET, 1);
    EXPECT_EQ(colour(0), 0u);
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.0, 1.0}));
    EXPECT_EQ(range(KORGRAPH_Y), (std::pair{0.0, 1.0}));
    add({7, 7});
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.0, 3.0})) << "automatic again";
}

TEST_F(GraphReset, KeepsTheZoom) {
    notify(GN_RESET, 1);
    EXPECT_EQ(KorGraph_GetZoom(graph), KORGRAPH_ZOOM50);
}

TEST_F(GraphReset, DrawsNothing) {
    redraw();
    const Picture before = image();
    watchInvalidations();
    notify(GN_RESET, 1);
    EXPECT_TRUE(SamePicture(before, image()));
    EXPECT_EQ(invalidations.size(), 0u);
}

}  // namespace
}  // namespace kortest
