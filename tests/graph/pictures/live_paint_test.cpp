// The incremental painting of live mode, and redraws that fail or might leak.
#include "graph/pictures/chart_pair.h"
#include "support/handle_balance.h"
#include "support/import_spy.h"

#include <cmath>

namespace kortest {
namespace {

class GraphLivePaint : public ChartTest {
protected:
    GraphLivePaint() { chart.toggle(KORGRAPH_LIVE); }

    void update(LPARAM argument) { KorGraph_Notify(chart.window(), GN_LIVEUPDATE, argument); }

    void replace(const std::vector<double>& values) {
        const GraphSeriesData data{static_cast<LONG>(values.size()), nullptr, values.data(), 0};
        update(reinterpret_cast<LPARAM>(&data));
        chart.state().series[0].values = values;
    }

    // What painting `area` gives over the picture shown before.
    Picture painted(RECT area, const std::vector<std::vector<POINT>>& traces) {
        ChartState& state = chart.state();
        Surface surface(chart.window(), state.surface.right, state.surface.bottom);
        HDC window = GetDCEx(chart.window(), nullptr, DCX_CACHE);
        BitBlt(surface.dc(), 0, 0, surface.width(), surface.height(), window, 0, 0, SRCCOPY);
        ReleaseDC(chart.window(), window);
        Picture result = surface.picture();
        FillLiteral(surface.dc(), area, state.background);
        const RECT wide{area.left - 1, area.top - 1, area.right + 1, area.bottom + 1};
        ClipDC(surface.dc(), state.plot());
        DrawLiteralGrid(state, surface.dc(), &wide);
        for (size_t i = 0; i < traces.size(); ++i) {
            Drawn pen(surface.dc(), CreatePen(PS_SOLID, 1, state.series[i].colour));
            Polyline(surface.dc(), traces[i].data(), static_cast<int>(traces[i].size()));
        }
        ClipDC(surface.dc(), {0, 0, surface.width() + 1, surface.height() + 1});
        DrawLiteralXAxis(state, surface.dc());
        // Only what was invalid changes.
        const Picture drawn = surface.picture();
        for (int y = area.top; y < area.bottom; ++y) {
            for (int x = area.left; x < area.right; ++x) result.setPixel(x, y, drawn.pixel(x, y));
        }
        return result;
    }

    std::vector<POINT> trace(size_t series) {
        std::vector<POINT> points;
        for (const double value : chart.state().series[series].values) {
            points.push_back({chart.state().xPixel(static_cast<double>(points.size()) + 1),
                              chart.state().yPixel(value)});
        }
        return points;
    }
};

TEST_F(GraphLivePaint, DrawsTheReplacedTraceInItsRectangle) {
    chart.addSeries({1, 5, 3, 9, 4, 4, 2});
    chart.addSeries({2, 2, 3, 4, 5, 6, 7});
    KorGraph_SetDataMode(chart.window(), KORGRAPH_REPLACE);
    chart.redraw();
    replace({1, 5, 3, 9, 4, 4, 2});
    UpdateWindow(chart.window());
    for (const auto& values :
         {std::vector<double>{2, 4, 6, 8, 1, 9, 3}, {9, 1, 9, 1, 9, 1, 9}, {5, 5, 5, 5, 5, 5, 5}}) {
        replace(values);
        const RECT area{60, 40, 250, 200};
        ValidateRect(chart.window(), nullptr);
        InvalidateRect(chart.window(), &area, FALSE);
        const Picture expected = painted(area, {trace(0), trace(1)});
        UpdateWindow(chart.window());
        EXPECT_TRUE(SamePicture(expected, chart.shown()));
    }
}

TEST_F(GraphLivePaint, DrawsTheSweepsNewestPieces) {
    chart.setRange(KORGRAPH_X, 0, 50);
    chart.setRange(KORGRAPH_Y, 0, 100);
    chart.addSeries({0, 0, 0});
    chart.redraw();
    std::vector<POINT> points(3);
    for (int i = 0; i < 60; ++i) {
        const int sample = (i * 37) % 100;
        const int x = i % 51;
        if (x < 2) {
            points[0] = points[1] = {chart.state().xPixel(0), chart.state().yPixel(0)};
        } else {
            points[0] = points[1];
            points[1] = points[2];
        }
        points[2] = {chart.state().xPixel(x), chart.state().yPixel(sample)};
        update(sample);
        RECT area{};
        GetUpdateRect(chart.window(), &area, FALSE);
        EXPECT_EQ(area, (RECT{points[1].x - 1, 0, points[2].x + 1, 240})) << i;
        const Picture expected = painted(area, {points});
        UpdateWindow(chart.window());
        EXPECT_TRUE(SamePicture(expected, chart.shown())) << i;
    }
}

TEST_F(GraphLivePaint, TracesNotYetWrittenAreNotDrawn) {
    chart.addSeries({1, 5, 3, 9});
    chart.redraw();
    const RECT area{60, 40, 250, 200};
    InvalidateRect(chart.window(), &area, FALSE);
    const Picture expected = painted(area, {});
    UpdateWindow(chart.window());
    EXPECT_TRUE(SamePicture(expected, chart.shown()));
}

TEST_F(GraphLivePaint, GridLinesAtTheRectanglesEdgesAreDrawn) {
    chart.addSeries({1, 5, 3, 9, 4, 8, 2, 7});
    chart.redraw();
    ChartState& state = chart.state();
    const RECT area{state.xPixel(2 * state.xTickStep), state.yPixel(3 * state.yTickStep),
                    state.xPixel(3 * state.xTickStep) + 1, state.yPixel(state.yTickStep) + 1};
    InvalidateRect(chart.window(), &area, FALSE);
    const Picture expected = painted(area, {});
    UpdateWindow(chart.window());
    const Picture shown = chart.shown();
    EXPECT_TRUE(SamePicture(expected, shown));
    EXPECT_EQ(shown.pixel(area.left, area.top + 5), RGB(0, 150, 150));
    EXPECT_EQ(shown.pixel(area.right - 1, area.top + 5), RGB(0, 150, 150));
    EXPECT_EQ(shown.pixel(area.left + 5, area.top), RGB(0, 150, 150));
}

TEST_F(GraphLivePaint, AreasAtTheLeftOrRightEdgeAreCopied) {
    chart.addSeries({1, 5, 3, 9});
    chart.redraw();
    for (const RECT area : {RECT{0, 40, 250, 200}, RECT{60, 40, 320, 200}}) {
        InvalidateRect(chart.window(), &area, FALSE);
        UpdateWindow(chart.window());
        EXPECT_TRUE(chart.compare());
    }
}

TEST_F(GraphLivePaint, WithoutLiveModePartsAreCopied) {
    chart.toggle(KORGRAPH_LIVE);
    chart.addSeries({1, 5, 3, 9});
    chart.redraw();
    const RECT area{60, 40, 250, 200};
    InvalidateRect(chart.window(), &area, FALSE);
    UpdateWindow(chart.window());
    EXPECT_TRUE(chart.compare());
}

class GraphDrawingFaults : public ::testing::Test {
protected:
    GraphDrawingFaults() : chart(host, 320, 240) {
        chart.setTitle(L"Title");
        chart.setXTitle(L"x");
        chart.setYTitle(L"y");
        std::vector<double> values(900);
        for (unsigned i = 0; i < values.size(); ++i) values[i] = std::sin(i * 0.3) * (i % 17);
        chart.addSeries(values);
        chart.addSeries({3, 1, 4, 1, 5});
    }

    ImportSpy spy;
    RecordingHost host;
    ChartPair chart;
};

TEST_F(GraphDrawingFaults, EveryHandleOfARedrawIsGivenBack) {
    WatchHandles(spy);
    for (int type = KORGRAPH_LINE; type <= KORGRAPH_PIE; ++type) {
        chart.setType(type);
        spy.clearCalls();
        KorGraph_Redraw(chart.window());
        UpdateWindow(chart.window());
        EXPECT_EQ(UnreturnedHandles(spy), std::vector<std::string>{}) << type;
    }
}

TEST_F(GraphDrawingFaults, HundredsOfRedrawsKeepNoHandleAndNoBlock) {
    spy.watchAll({"LocalAlloc", "LocalFree"});
    for (int type = KORGRAPH_LINE; type <= KORGRAPH_PIE; ++type) {
        chart.setType(type);
        KorGraph_Redraw(chart.window());
        spy.clearCalls();
        const auto slot = [] {
            HPEN pen = CreatePen(PS_SOLID, 1, RGB(1, 2, 3));
            const auto low = static_cast<WORD>(reinterpret_cast<UINT_PTR>(pen));
            DeleteObject(pen);
            return low;
        };
        const WORD before = slot();
        for (int i = 0; i < 200; ++i) KorGraph_Redraw(chart.window());
        EXPECT_EQ(slot(), before) << type;
        EXPECT_EQ(spy.count("LocalAlloc"), spy.count("LocalFree")) << type;
    }
}

TEST_F(GraphDrawingFaults, WithoutPensOrBrushesTheNextRedrawIsWhole) {
    for (int type = KORGRAPH_LINE; type <= KORGRAPH_PIE; ++type) {
        for (const char* maker : {"CreatePen", "CreateSolidBrush"}) {
            chart.setType(type);
            spy.watch(maker);
            spy.failAlways(maker);
            KorGraph_Redraw(chart.window());
            spy.stopFailing(maker);
            if (type != KORGRAPH_PIE) {
                EXPECT_TRUE(chart.same()) << type << ' ' << maker;
            }
        }
    }
}

TEST_F(GraphDrawingFaults, WithoutMemoryForItsPointsASeriesIsLeftOut) {
    spy.watch("LocalAlloc");
    for (const int type : {KORGRAPH_LINE, KORGRAPH_AREA}) {
        chart.setType(type);
        spy.failAlways("LocalAlloc");
        KorGraph_Redraw(chart.window());
        UpdateWindow(chart.window());
        spy.stopFailing("LocalAlloc");
        const Picture shown = chart.shown();
        EXPECT_EQ(shown.count(RGB(0, 255, 0)) + shown.count(RGB(0, 0, 255)), 0) << type;
        EXPECT_TRUE(chart.same());
    }
}

TEST_F(GraphDrawingFaults, TheFirstSeriesWithoutMemoryLeavesTheSecond) {
    spy.watch("LocalAlloc");
    spy.failNth("LocalAlloc", 1);
    KorGraph_Redraw(chart.window());
    UpdateWindow(chart.window());
    EXPECT_EQ(chart.shown().count(RGB(0, 255, 0)), 0);
    EXPECT_GT(chart.shown().count(RGB(0, 0, 255)), 0);
}

TEST_F(GraphDrawingFaults, MarkersWithoutMemoryAreDrawnOneByOne) {
    spy.watch("LocalAlloc");
    chart.redraw();
    for (int nth = 2; nth <= 3; ++nth) {
        spy.failNth("LocalAlloc", nth);
        EXPECT_TRUE(chart.same()) << nth;
    }
}

TEST_F(GraphDrawingFaults, MarkersWithoutAScratchBitmapAreDrawnOneByOne) {
    spy.watchAll({"CreateCompatibleDC", "CreateCompatibleBitmap"});
    spy.failNth("CreateCompatibleDC", 1);
    EXPECT_TRUE(chart.same());
    spy.failNth("CreateCompatibleBitmap", 1);
    EXPECT_TRUE(chart.same());
    EXPECT_TRUE(chart.same());
}

TEST_F(GraphDrawingFaults, APieWithoutMemoryHasItsRadiiAndOutline) {
    chart.setType(KORGRAPH_PIE);
    spy.watch("LocalAlloc");
    spy.failAlways("LocalAlloc");
    KorGraph_Redraw(chart.window());
    UpdateWindow(chart.window());
    spy.stopFailing("LocalAlloc");
    const LiteralPie pie = PlacePie(chart.state());
    const Picture shown = chart.shown();
    EXPECT_EQ(shown.pixel(pie.centre.x, pie.centre.y - 20), RGB(0, 0, 0));
    EXPECT_EQ(shown.count(RGB(255, 0, 0)), 0);
}

}  // namespace
}  // namespace kortest
