// Lines, markers, areas, columns and bars, one sentence at a time.
#include "graph/pictures/chart_pair.h"
#include "support/import_spy.h"

#include <cmath>
#include <limits>

namespace kortest {
namespace {

constexpr COLORREF kBlack = RGB(0, 0, 0);
constexpr COLORREF kWhite = RGB(255, 255, 255);
constexpr COLORREF kGreen = RGB(0, 255, 0);  // of the first series
constexpr COLORREF kBlue = RGB(0, 0, 255);
constexpr COLORREF kYellow = RGB(255, 255, 0);

class GraphSeriesShapes : public ChartTest {
protected:
    GraphSeriesShapes() { chart.toggle(0x3FF); }  // a bare plot

    void show() {
        EXPECT_TRUE(chart.same());
        picture = chart.shown();
        plot = chart.state().plot();
    }
    int xOf(double x) { return chart.state().xPixel(x); }
    int yOf(double y) { return chart.state().yPixel(y); }

    Picture picture;
    RECT plot{};
};

class GraphLine : public GraphSeriesShapes {};
class GraphArea : public GraphSeriesShapes {};
class GraphColumn : public GraphSeriesShapes {};
class GraphBar : public GraphSeriesShapes {};
class GraphOddValues : public GraphSeriesShapes {};

TEST_F(GraphLine, MarksEachPointWithAFilledCircle) {
    chart.addSeries({5, 9, 5});
    show();
    const int x = xOf(2);
    const int y = yOf(9);
    EXPECT_EQ(picture.pixel(x - 4, y), kGreen);
    EXPECT_EQ(picture.pixel(x + 3, y), kGreen);
    EXPECT_EQ(picture.pixel(x + 4, y), kWhite);
    EXPECT_EQ(picture.pixel(x, y + 3), kGreen);
    EXPECT_EQ(picture.pixel(x, y + 4), kWhite);
    EXPECT_EQ(picture.pixel(x - 4, y - 4), kWhite);
}

TEST_F(GraphLine, OfOnePointIsItsMarkerAlone) {
    chart.addSeries({5});
    show();
    EXPECT_EQ(picture.pixel(xOf(1), yOf(5) + 2), kGreen);
    EXPECT_LT(picture.count(kGreen), 60);
}

TEST_F(GraphLine, IsClippedToThePlot) {
    chart.addSeries({-50, 50, -50, 50});
    chart.setRange(KORGRAPH_Y, -10, 10);
    chart.setRange(KORGRAPH_X, 1, 4);
    show();
    EXPECT_EQ(picture.count(kGreen, {0, 0, 320, plot.top}), 0);
    EXPECT_EQ(picture.count(kGreen, {0, plot.bottom, 320, 240}), 0);
    EXPECT_EQ(picture.count(kGreen, {0, 0, plot.left, 240}), 0);
    EXPECT_EQ(picture.count(kGreen, {plot.right, 0, 320, 240}), 0);
    EXPECT_GT(picture.count(kGreen), 100);
}

TEST_F(GraphLine, LaterSeriesLieOnTop) {
    chart.addSeries({5, 5, 5});
    chart.addSeries({5, 5, 5});
    show();
    EXPECT_EQ(picture.pixel(xOf(2) + 1, yOf(5)), kBlue);
    EXPECT_EQ(picture.count(kGreen), 0);
}

TEST_F(GraphLine, ManyPointsInOneColumnKeepTheirExtremes) {
    std::vector<double> values(5000, 0);
    values[2500] = 100;
    values[2501] = -100;
    chart.addSeries(values);
    show();
    EXPECT_EQ(picture.pixel(xOf(2501), yOf(60)), kGreen);
    EXPECT_EQ(picture.pixel(xOf(2502), yOf(-60)), kGreen);
}

TEST_F(GraphLine, EndsAsAPlainPolylineDoes) {
    // The last pixel column holds many points, up and down.
    for (const double last : {0.0, 100.0, -100.0, 37.0}) {
        chart.reset();
        std::vector<double> values(4000);
        for (unsigned i = 0; i < values.size(); ++i) values[i] = i % 3 ? 100.0 : -100.0 + i % 7;
        values.back() = last;
        chart.addSeries(values);
        chart.setRange(KORGRAPH_X, 0, 3900);
        show();
        chart.autoRange(KORGRAPH_X);
        show();
    }
}

TEST_F(GraphLine, CrossesThePlotFromPointsOutsideIt) {
    chart.addSeries({0, 10, -10, 5, 8});
    for (double low = 0.25; low < 5; low += 0.25) {
        chart.setRange(KORGRAPH_X, low, low + 0.75);
        show();
    }
}

TEST_F(GraphLine, MarkersReachIntoThePlotFromOutsideIt) {
    for (const int count : {5, 1400}) {
        chart.reset();
        std::vector<double> values(static_cast<size_t>(count));
        for (unsigned i = 0; i < values.size(); ++i) values[i] = static_cast<double>(i % 5);
        chart.addSeries(values);
        for (int i = -12; i <= 12; ++i) {
            chart.setRange(KORGRAPH_X, 1 + i * 0.004 * count, count + i * 0.004 * count);
            chart.setRange(KORGRAPH_Y, 0.01 * i, 4 + 0.01 * i);
            show();
        }
    }
}

TEST_F(GraphArea, GoesDownToTheZeroLine) {
    chart.setType(KORGRAPH_AREA);
    chart.addSeries({10, 10, 10});
    show();
    EXPECT_EQ(picture.pixel(xOf(1) + 3, yOf(0) - 3), kGreen);
    EXPECT_EQ(picture.pixel(xOf(1), yOf(5)), kBlack);
    EXPECT_EQ(picture.pixel(xOf(3), yOf(5)), kBlack);
    EXPECT_EQ(picture.pixel(xOf(3) + 2, yOf(5)), kWhite);
}

TEST_F(GraphArea, OfTheFirstSeriesLiesOnTop) {
    chart.setType(KORGRAPH_AREA);
    chart.addSeries({10, 10, 10});
    chart.addSeries({10, 10, 10});
    show();
    EXPECT_EQ(picture.pixel(xOf(2), yOf(5)), kGreen);
    EXPECT_EQ(picture.count(kBlue), 0);
}

TEST_F(GraphArea, HasNoMarkers) {
    chart.setType(KORGRAPH_AREA);
    chart.addSeries({10, 10});
    show();
    EXPECT_EQ(picture.pixel(xOf(1) - 3, yOf(10)), kWhite);
}

TEST_F(GraphArea, OfOnePointIsALine) {
    chart.setType(KORGRAPH_AREA);
    chart.addSeries({10});
    show();
    EXPECT_EQ(picture.pixel(xOf(1), yOf(5)), kBlack);
    EXPECT_EQ(picture.count(kGreen), 0);
}

TEST_F(GraphColumn, GroupsStandSideBySideAroundTheirPoint) {
    chart.setType(KORGRAPH_COLUMN);
    for (int i = 0; i < 3; ++i) chart.addSeries({10, 10, 10});
    show();
    const int w = chart.state().barWidth;
    ASSERT_GT(w, 5);
    const int left = xOf(2) - 3 * w / 2;
    EXPECT_EQ(picture.pixel(left, yOf(5)), kBlack);
    EXPECT_EQ(picture.pixel(left + w / 2, yOf(5)), kGreen);
    EXPECT_EQ(picture.pixel(left + w, yOf(5)), kBlack);
    EXPECT_EQ(picture.pixel(left + w + w / 2, yOf(5)), kBlue);
    EXPECT_EQ(picture.pixel(left + 2 * w + w / 2, yOf(5)), kYellow);
    EXPECT_EQ(picture.pixel(left + 3 * w, yOf(5)), kBlack);
}

TEST_F(GraphColumn, OffsetsAreHalvedTowardZero) {
    chart.setType(KORGRAPH_COLUMN);
    chart.addSeries({10});
    for (int width = 60; width < 90; ++width) {
        chart.resize(width, 100);
        show();
    }
}

TEST_F(GraphColumn, OfNegativeValuesHangDown) {
    chart.setType(KORGRAPH_COLUMN);
    chart.addSeries({-10, 10});
    show();
    EXPECT_EQ(picture.pixel(xOf(1), yOf(-5)), kGreen);
    EXPECT_EQ(picture.pixel(xOf(1), yOf(5)), kWhite);
    EXPECT_EQ(picture.pixel(xOf(2), yOf(5)), kGreen);
}

TEST_F(GraphColumn, BecomeLinesWhenZoomedAway) {
    chart.setType(KORGRAPH_COLUMN);
    chart.addSeries(std::vector<double>(79, 10));
    ASSERT_EQ(chart.state().barWidth, 3);
    chart.setZoom(KORGRAPH_ZOOM25);
    show();
    EXPECT_EQ(picture.count(kGreen), 0);
    EXPECT_EQ(picture.pixel(xOf(40), yOf(5)), kBlack);
}

TEST_F(GraphColumn, KeepTheirWidthWhenZoomedIn) {
    chart.setType(KORGRAPH_COLUMN);
    chart.addSeries({10, 10, 10, 10});
    const int w = chart.state().barWidth;
    chart.setZoom(KORGRAPH_ZOOM200);
    show();
    EXPECT_EQ(chart.state().barWidth, w);
    const int left = xOf(2) - w / 2;
    EXPECT_EQ(picture.pixel(left, yOf(5)), kBlack);
    EXPECT_EQ(picture.pixel(left + w, yOf(5)), kBlack);
}

TEST_F(GraphColumn, ReachIntoThePlotFromPointsOutsideIt) {
    chart.setType(KORGRAPH_COLUMN);
    for (int i = 0; i < 4; ++i) chart.addSeries({10, 10, 10, 10, 10, 10});
    for (double low = 0.5; low < 3; low += 0.0625) {
        chart.setRange(KORGRAPH_X, low, low + 1.5);
        show();
    }
}

TEST_F(GraphColumn, OfManySeriesReachFarFromTheirPoints) {
    for (const int type : {KORGRAPH_COLUMN, KORGRAPH_BAR}) {
        chart.reset();
        chart.setType(type);
        chart.addSeries({10, 10, 10, 10, 10, 10, 10, 10, 10});
        // The thickness stays that of one series in a fixed range.
        if (type == KORGRAPH_COLUMN) chart.setRange(KORGRAPH_X, 4, 6);
        for (int i = 0; i < 6; ++i) chart.addSeries({9, 8, 7, 6, 5, 6, 7, 8, 9});
        show();
    }
}

TEST_F(GraphColumn, WiderThanTheirRangeFitNegativeThickness) {
    chart.setType(KORGRAPH_COLUMN);
    chart.addSeries({10, 5, 8});
    chart.addSeries({1, 5, 9});
    chart.setRange(KORGRAPH_X, 4, 0);
    ASSERT_LT(chart.state().barWidth, 0);
    show();
}

TEST_F(GraphBar, ReachesRightForValuesAndLeftForNegativeOnes) {
    chart.setType(KORGRAPH_BAR);
    chart.addSeries({10, -10});
    show();
    EXPECT_EQ(picture.pixel(xOf(5), yOf(1)), kGreen);
    EXPECT_EQ(picture.pixel(xOf(-5), yOf(1)), kWhite);
    EXPECT_EQ(picture.pixel(xOf(-5), yOf(2)), kGreen);
    EXPECT_EQ(picture.pixel(xOf(5), yOf(2)), kWhite);
}

TEST_F(GraphBar, LaterSeriesStandHigher) {
    chart.setType(KORGRAPH_BAR);
    chart.addSeries({10, 10});
    chart.addSeries({10, 10});
    show();
    const int h = chart.state().barHeight;
    const int bottom = yOf(1) + h;
    EXPECT_EQ(picture.pixel(xOf(5), bottom), kBlack);
    EXPECT_EQ(picture.pixel(xOf(5), bottom - h / 2), kGreen);
    EXPECT_EQ(picture.pixel(xOf(5), bottom - h - h / 2), kBlue);
}

TEST_F(GraphBar, ReachIntoThePlotFromPointsOutsideIt) {
    chart.setType(KORGRAPH_BAR);
    for (int i = 0; i < 3; ++i) chart.addSeries({10, 10, 10, 10, 10, 10});
    chart.setZoom(KORGRAPH_ZOOM200);
    show();
    for (int i = 0; i < 4; ++i) {
        chart.pan(kArrowUp);
        show();
    }
}

TEST_F(GraphSeriesShapes, WithoutSeriesAllTypesAreEmptyFrames) {
    for (int type = KORGRAPH_LINE; type <= KORGRAPH_COLUMN; ++type) {
        chart.setType(type);
        show();
        EXPECT_EQ(picture.count(kGreen), 0);
    }
}

TEST_F(GraphSeriesShapes, AnotherTypeDrawsNothing) {
    chart.addSeries({1, 2});
    show();
    const Picture before = picture;
    chart.setType(9);
    KorGraph_Redraw(chart.window());
    UpdateWindow(chart.window());
    EXPECT_TRUE(SamePicture(before, chart.shown()));
}

TEST_F(GraphSeriesShapes, OfWindowsSmallerThanTheirMarginsAreThoseOfPlainCalls) {
    std::vector<double> values(300);
    for (unsigned i = 0; i < values.size(); ++i) values[i] = static_cast<double>(i * 7 % 23) - 9;
    chart.addSeries(values);
    for (int type = KORGRAPH_LINE; type <= KORGRAPH_COLUMN; ++type) {
        chart.setType(type);
        for (int side = 1; side < 60; side += 3) {
            chart.resize(side, 100);
            show();
            chart.resize(100, side);
            show();
        }
    }
}

TEST_F(GraphSeriesShapes, EndWithAnInvalidWindowThatIsNotErased) {
    chart.addSeries({1, 2});
    show();
    ValidateRect(chart.window(), nullptr);
    KorGraph_Redraw(chart.window());
    RECT invalid{};
    EXPECT_TRUE(GetUpdateRect(chart.window(), &invalid, FALSE));
    EXPECT_EQ(invalid, (RECT{0, 0, 320, 240}));
}

TEST_F(GraphOddValues, AreLeftOutAndTheRestIsDrawn) {
    const double nan = std::numeric_limits<double>::quiet_NaN();
    const double inf = std::numeric_limits<double>::infinity();
    for (int type = KORGRAPH_LINE; type <= KORGRAPH_COLUMN; ++type) {
        chart.reset();
        chart.setType(type);
        chart.addSeries({4, 8, -3, 5, 7, 2});
        for (const auto& [index, value] : {std::pair{2, nan}, {0, inf}, {5, -inf}}) {
            const bool bars = type == KORGRAPH_BAR;
            chart.setRange(bars ? KORGRAPH_X : KORGRAPH_Y, -4, 9);
            KorGraph_SetValue(chart.window(), 0, index, value);
            chart.state().series[0].values[static_cast<size_t>(index)] = value;
            EXPECT_TRUE(chart.same()) << "type " << type << ", value " << value;
        }
    }
}

TEST_F(GraphOddValues, AmongThousandsAreLeftOut) {
    const double odd[] = {std::numeric_limits<double>::quiet_NaN(),
                          std::numeric_limits<double>::infinity(),
                          -std::numeric_limits<double>::infinity()};
    for (int type = KORGRAPH_LINE; type <= KORGRAPH_COLUMN; ++type) {
        chart.reset();
        chart.setType(type);
        std::vector<double> values(3000);
        for (unsigned i = 0; i < values.size(); ++i) values[i] = std::sin(i * 0.7) * (i % 13);
        chart.addSeries(values);
        chart.setRange(type == KORGRAPH_BAR ? KORGRAPH_X : KORGRAPH_Y, -10, 10);
        for (size_t i = 0; i < values.size(); i += 1 + i % 5) {
            KorGraph_SetValue(chart.window(), 0, static_cast<LONG>(i), odd[i % 3]);
            chart.state().series[0].values[i] = odd[i % 3];
        }
        EXPECT_TRUE(chart.same()) << "type " << type;
    }
}

TEST_F(GraphOddValues, AloneDrawAnEmptyFrame) {
    const double nan = std::numeric_limits<double>::quiet_NaN();
    for (int type = KORGRAPH_LINE; type <= KORGRAPH_PIE; ++type) {
        KorGraph_Reset(chart.window(), TRUE);
        KorGraph_SetType(chart.window(), type);
        const double values[] = {nan, nan};
        const GraphSeriesData data{2, nullptr, values, 0};
        EXPECT_TRUE(KorGraph_AddSeries(chart.window(), &data));
        KorGraph_Redraw(chart.window());
        UpdateWindow(chart.window());
        EXPECT_EQ(chart.shown().count(kGreen), 0) << type;
    }
}

TEST_F(GraphOddValues, HugeOnesBesideSmallRangesReachTheEdges) {
    chart.setType(KORGRAPH_COLUMN);
    chart.addSeries({1e300, -1e300, 1e9, 3});
    chart.setRange(KORGRAPH_Y, -5, 5);
    show();
    EXPECT_EQ(picture.pixel(xOf(1), plot.top), kGreen);
    EXPECT_EQ(picture.pixel(xOf(2), plot.bottom - 1), kGreen);
    EXPECT_EQ(picture.pixel(xOf(3), plot.top), kGreen);
}

// The platform's Polygon takes time for each row between a polygon's corners, seen or not: with the
// values of this test minutes.
TEST_F(GraphOddValues, FarBeyondTheViewDoNotReachThePlatformsPolygon) {
    std::vector<double> values(1000);
    for (unsigned i = 0; i < values.size(); ++i) values[i] = (i % 2 ? -1.0 : 1.0) * (1 + i % 7);
    ImportSpy spy;
    LONG farthest = 0;
    int polygons = 0;
    ASSERT_TRUE(spy.watch("Polygon"));
    spy.replace("Polygon", [&](ULONG_PTR* arguments) {
        const auto* corners = reinterpret_cast<const POINT*>(arguments[1]);
        for (ULONG_PTR i = 0; i < arguments[2]; ++i) {
            farthest = std::max({farthest, std::abs(corners[i].x), std::abs(corners[i].y)});
        }
        ++polygons;
        return farthest < 4096 ? spy.callReal("Polygon", arguments) : TRUE;
    });
    for (const int type : {KORGRAPH_AREA, KORGRAPH_COLUMN, KORGRAPH_BAR}) {
        KorGraph_Reset(chart.window(), TRUE);
        KorGraph_SetType(chart.window(), type);
        const LONG count = type == KORGRAPH_AREA ? 1000 : 10;  // bars that have a thickness
        const GraphSeriesData data{count, nullptr, values.data(), 0};
        EXPECT_TRUE(KorGraph_AddSeries(chart.window(), &data));
        chart.setRange(type == KORGRAPH_BAR ? KORGRAPH_X : KORGRAPH_Y, -1e-6, 1e-6);
        KorGraph_Redraw(chart.window());
        UpdateWindow(chart.window());
        EXPECT_GT(chart.shown().count(kGreen) + chart.shown().count(kBlack), 10000) << type;
    }
    EXPECT_GT(polygons, 0);
    EXPECT_LT(farthest, 4096);
}

}  // namespace
}  // namespace kortest
