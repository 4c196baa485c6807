// Null pointers, senseless numbers and sizes.
#include "graph/graph_fixture.h"

#include <cfloat>
#include <limits>

namespace kortest {
namespace {

class GraphBadInput : public GuardedGraphTest {
protected:
    void drawEverything() {
        for (LONG type = 0; type <= 4; ++type) {
            KorGraph_SetType(graph, type);
            for (LONG zoom = 0; zoom <= 3; ++zoom) KorGraph_SetZoom(graph, zoom);
            for (int x = 16; x < 230; x += 50) tap(x, 60);
        }
        host.pump();
    }
};

TEST_F(GraphBadInput, NullPointersChangeNothing) {
    create();
    add({1, 2, 3}, L"one");
    KorGraph_SetTitle(graph, L"title");
    redraw();
    const Picture before = image();
    EXPECT_EQ(send(GM_ADDSERIES), 1);
    for (const UINT message :
         {GM_GETTITLE, GM_GETXTITLE, GM_GETYTITLE, GM_GETTYPE, GM_SETRANGE, GM_GETOPTIONS,
          GM_SHOWLEGEND, GM_GETSERIESCOLOR, GM_GETZOOM, GM_GETRANGE})
        EXPECT_EQ(send(message), 0) << message;
    EXPECT_EQ(notify(GN_SETVALUE), 0);
    EXPECT_EQ(notify(GN_REPLACESERIES), 0);
    EXPECT_EQ(GetDlgItem(graph, KORLEGEND_ID), nullptr);
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.0, 4.0}));
    EXPECT_STREQ(title(GM_GETTITLE), L"title");
    redraw();
    EXPECT_TRUE(SamePicture(before, image()));
}

TEST_F(GraphBadInput, NullPointersInLiveModeChangeNothing) {
    create();
    send(GM_TOGGLEOPTIONS, 0, KORGRAPH_LIVE);
    add({1, 2, 3});
    send(GM_SETDATAMODE, 0, KORGRAPH_REPLACE);
    EXPECT_EQ(notify(GN_LIVEUPDATE), 0);
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.0, 4.0}));
}

TEST_F(GraphBadInput, NullArraysInRecordsAreSurvived) {
    create();
    add({1, 2, 3});
    const GraphSeriesData empty = {3, L"name", nullptr, 0};
    EXPECT_EQ(send(GM_ADDSERIES, 0, reinterpret_cast<LPARAM>(&empty)), 1);
    notify(GN_REPLACESERIES, reinterpret_cast<LPARAM>(&empty));
    EXPECT_EQ(send(GM_SETCATEGORIES, 5, 0), 0);
    drawEverything();
}

TEST_F(GraphBadInput, CountsBelowOneAddNothing) {
    create();
    const double value = 5;
    for (const LONG count : {0L, -1L, (std::numeric_limits<LONG>::min)()}) {
        const GraphSeriesData data = {count, L"name", &value, 0};
        EXPECT_EQ(send(GM_ADDSERIES, 0, reinterpret_cast<LPARAM>(&data)), 1) << count;
    }
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.0, 1.0}));
    add({5});
    EXPECT_EQ(colour(0), RGB(0, 255, 0)) << "the first one";
}

TEST_F(GraphBadInput, NegativeCategoryCountRemovesThem) {
    create();
    const wchar_t* label = L"a";
    for (const WPARAM count : {WPARAM{0}, static_cast<WPARAM>(-1), WPARAM{0x80000000}})
        EXPECT_EQ(send(GM_SETCATEGORIES, count, reinterpret_cast<LPARAM>(&label)), 0);
    drawEverything();
}

TEST_F(GraphBadInput, BadIndexesStoreColourZero) {
    create();
    add({1});
    for (const LONG index : {1L, 2L, -1L, 0x7FFFFFFFL, (std::numeric_limits<LONG>::min)()}) {
        COLORREF found = 0x123456;
        send(GM_GETSERIESCOLOR, static_cast<WPARAM>(index), reinterpret_cast<LPARAM>(&found));
        EXPECT_EQ(found, 0u) << index;
    }
}

TEST_F(GraphBadInput, BadIndexesOfValuesAreIgnored) {
    createPlain();
    add({5, 5, 5});
    for (const LONG series : {0L, -1L, 1L, 0x7FFFFFFFL})
        for (const LONG point : {-1L, 3L, 0x7FFFFFFFL, (std::numeric_limits<LONG>::min)()}) {
            setValue(series, point, 99);
            replace(series == 0 ? -1 : series, {99, 99});
        }
    EXPECT_EQ(tap(65, 15), L"Value:5");
    EXPECT_EQ(tap(115, 15), L"Value:5");
    EXPECT_EQ(tap(165, 15), L"Value:5");
}

TEST_F(GraphBadInput, OtherZoomsAxesAndDataModesAreSurvived) {
    create();
    for (const LONG number : {4L, -1L, 100L, 0x7FFFFFFFL, (std::numeric_limits<LONG>::min)()}) {
        KorGraph_SetZoom(graph, number);
        KorGraph_AutoRange(graph, number);
        KorGraph_SetRange(graph, number, 3, 4);
        KorGraph_SetDataMode(graph, number);
    }
    EXPECT_EQ(KorGraph_GetZoom(graph), KORGRAPH_ZOOM100);
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.0, 1.0}));
    EXPECT_EQ(range(KORGRAPH_Y), (std::pair{0.0, 1.0}));
}

TEST_F(GraphBadInput, RangesOfAnyEndsAreSurvived) {
    create();
    add({1, -5, 3});
    const double infinity = std::numeric_limits<double>::infinity();
    const double nan = std::numeric_limits<double>::quiet_NaN();
    const double ends[][2] = {{10, 0},
                              {0, infinity},
                              {-infinity, infinity},
                              {nan, 1},
                              {0, nan},
                              {1e300, 1e300},
                              {0, 1e-300},
                              {0, DBL_MIN},
                              {-DBL_MAX, DBL_MAX},
                              {1e15, 1e15 + 1},
                              {1e18, 2e18},
                              {-0.3, 0.3},
                              {infinity, infinity},
                              {0, 1e9},
                              {5, 5}};
    for (const auto& end : ends) {
        KorGraph_SetRange(graph, KORGRAPH_X, end[0], end[1]);
        KorGraph_SetRange(graph, KORGRAPH_Y, end[0], end[1]);
        drawEverything();
        KorGraph_SetType(graph, KORGRAPH_LINE);
    }
    KorGraph_AutoRange(graph, KORGRAPH_X);
    KorGraph_AutoRange(graph, KORGRAPH_Y);
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.0, 4.0}));
    EXPECT_EQ(range(KORGRAPH_Y), (std::pair{-5.0, 3.0}));
}

TEST_F(GraphBadInput, RangesThatAreNoNumbersAreKeptAsGiven) {
    create();
    const double infinity = std::numeric_limits<double>::infinity();
    KorGraph_SetRange(graph, KORGRAPH_X, -infinity, infinity);
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{-infinity, infinity}));
    KorGraph_SetRange(graph, KORGRAPH_Y, 9, -9);
    EXPECT_EQ(range(KORGRAPH_Y), (std::pair{9.0, -9.0}));
}

TEST_F(GraphBadInput, ValuesThatAreNoNumbersLeaveTheRestDrawn) {
    createPlain();
    const double infinity = std::numeric_limits<double>::infinity();
    const double nan = std::numeric_limits<double>::quiet_NaN();
    add({infinity, -infinity, nan, 1e308, -1e308});
    add({5, 5, 5, 5, 5, 5, 5, 5, 5});
    drawEverything();
    KorGraph_SetRange(graph, KORGRAPH_X, 0, 10);
    KorGraph_SetRange(graph, KORGRAPH_Y, 0, 10);
    KorGraph_SetType(graph, KORGRAPH_LINE);
    KorGraph_SetZoom(graph, KORGRAPH_ZOOM100);
    EXPECT_EQ(image().pixel(105, 65), RGB(0, 0, 255)) << "the second series";
    EXPECT_EQ(tap(135, 65), L"Value:5");
}

TEST_F(GraphBadInput, LongTextsAreSurvived) {
    create();
    const std::wstring text(100000, L'm');
    add({1, 2}, text.c_str());
    categories({text.c_str(), text.c_str()});
    showLegend({10, 10, 90, 90});
    drawEverything();
    EXPECT_EQ(colour(0), RGB(255, 0, 0)) << "a pie's first slice";
}

TEST_F(GraphBadInput, ManyPointsAreSurvived) {
    create();
    add(std::vector<double>(5000, 3.0));
    drawEverything();
    EXPECT_EQ(range(KORGRAPH_X).second, 5001.0);
}

}  // namespace
}  // namespace kortest
