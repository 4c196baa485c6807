// Pies: layout, radii, outline, labels by plain GDI calls; the fill by each pixel's angle.
#include "graph/pictures/random_charts.h"

#include <algorithm>
#include <cmath>
#include <cstdio>
#include <cstdlib>

namespace kortest {
namespace {

constexpr COLORREF kBlack = RGB(0, 0, 0);
constexpr COLORREF kRed = RGB(255, 0, 0);
constexpr COLORREF kGreen = RGB(0, 255, 0);
constexpr COLORREF kWhite = RGB(255, 255, 255);

// Pixels that the fill leaves open: beside a boundary, or at the edge of the disc.
bool IsOpen(const ChartState& state, const LiteralPie& pie, int x, int y) {
    const int dx = x - pie.centre.x;
    const int dy = y - pie.centre.y;
    const double distance = std::hypot(dx, dy);
    if (std::fabs(distance - pie.radius) < 1.6) return true;
    if (distance > pie.radius) return false;
    const double angle = AngleOf(dx, dy);
    double end = 0;
    double nearest = 360;
    for (const double value : state.series[0].values) {
        nearest = std::min(nearest, std::fabs(angle - end));
        end += std::fabs(value) / state.absSum() * 360;
    }
    nearest = std::min({nearest, std::fabs(angle - end), 360 - angle});
    return nearest / 57.29577951308232 * distance < 1.6;
}

struct Verdict {
    int wrong = 0;
    int open = 0;
    int pixels = 0;
    POINT first{};
};

Verdict ComparePie(ChartPair& chart) {
    const Picture expected = chart.expected();
    const Picture shown = chart.shown();
    const LiteralPie pie = PlacePie(chart.state());
    const bool sliced = !chart.state().series.empty() && chart.state().absSum() > 0;
    Verdict verdict;
    for (int y = 0; y < expected.height(); ++y) {
        for (int x = 0; x < expected.width(); ++x) {
            ++verdict.pixels;
            if (expected.pixel(x, y) == shown.pixel(x, y)) continue;
            if (sliced && IsOpen(chart.state(), pie, x, y)) {
                ++verdict.open;
            } else if (verdict.wrong++ == 0) {
                verdict.first = {x, y};
            }
        }
    }
    return verdict;
}

class RandomPies : public ::testing::TestWithParam<unsigned> {
protected:
    RecordingHost host;
};

TEST_P(RandomPies, DifferOnlyBesideBoundaries) {
    RandomCharts charts(host, GetParam());
    charts.mostPoints = 40;
    int compared = 0;
    int differing = 0;
    long open = 0;
    long pixels = 0;
    std::string first;
    for (int i = 0; i < 150; ++i) {
        charts.next(KORGRAPH_PIE);
        const Verdict verdict = ComparePie(charts.chart());
        ++compared;
        open += verdict.open;
        pixels += verdict.pixels;
        if (!verdict.wrong || differing++ > 4) continue;
        first += "picture " + std::to_string(i) + ": " + charts.description() + "\n    (" +
                 std::to_string(verdict.first.x) + "," + std::to_string(verdict.first.y) +
                 ") and " + std::to_string(verdict.wrong) + " pixels\n";
    }
    std::printf("seed %u: %d compared, %d differing; %ld of %ld pixels beside boundaries differ\n",
                GetParam(), compared, differing, open, pixels);
    EXPECT_EQ(differing, 0) << first;
    EXPECT_LT(open, pixels / 200);  // or too little was compared
}

INSTANTIATE_TEST_SUITE_P(Pies, RandomPies, ::testing::Values(501u, 502u));

class GraphPie : public ChartTest {
protected:
    GraphPie() : ChartTest(200, 160) { chart.setType(KORGRAPH_PIE); }

    void show(const std::vector<double>& values) {
        chart.addSeries(values);
        chart.redraw();
        pie = PlacePie(chart.state());
        picture = chart.shown();
    }
    COLORREF at(int dx, int dy) const {
        return picture.pixel(pie.centre.x + dx, pie.centre.y + dy);
    }

    LiteralPie pie{};
    Picture picture;
};

TEST_F(GraphPie, OneAndThreeGiveAQuarterUpLeftAndTheRest) {
    show({1, 3});
    EXPECT_EQ(at(-10, -10), kRed);
    EXPECT_EQ(at(-10, 10), kGreen);
    EXPECT_EQ(at(10, 10), kGreen);
    EXPECT_EQ(at(10, -10), kGreen);
    EXPECT_EQ(ComparePie(chart).wrong, 0);
}

TEST_F(GraphPie, ANegativeValueCountsByItsMagnitude) {
    show({-2, 2});
    for (int dy = -20; dy <= 20; ++dy) {
        EXPECT_EQ(at(-10, dy), kRed) << dy;
        EXPECT_EQ(at(10, dy), kGreen) << dy;
    }
}

TEST_F(GraphPie, TheFillReachesTheBoundaryOnBothSides) {
    show({1, 1});
    for (int dy = 2; dy < pie.radius - 2; ++dy) {
        EXPECT_EQ(at(-1, dy), kRed) << dy;
        EXPECT_EQ(at(0, dy), kBlack) << dy;
        EXPECT_EQ(at(1, dy), kGreen) << dy;
    }
}

TEST_F(GraphPie, OneValueFillsTheWholeDiscWithOneRadiusUp) {
    show({5});
    EXPECT_EQ(at(0, -10), kBlack);
    for (const POINT p : {POINT{-10, -10}, {10, -10}, {10, 10}, {-10, 10}, {0, 10}, {-10, 0}}) {
        EXPECT_EQ(at(p.x, p.y), kRed);
    }
    EXPECT_EQ(ComparePie(chart).wrong, 0);
}

TEST_F(GraphPie, FillsNothingBesideItsOutlineAboveTheCentre) {
    show({1, 1});
    for (int dy = -pie.radius + 3; dy <= 0; ++dy) {
        int x = 0;
        while (picture.pixel(x, pie.centre.y + dy) == kWhite) ++x;
        EXPECT_EQ(picture.pixel(x, pie.centre.y + dy), kBlack) << dy;
        x = pie.box.right + 3;
        while (picture.pixel(x, pie.centre.y + dy) == kWhite) --x;
        EXPECT_EQ(picture.pixel(x, pie.centre.y + dy), kBlack) << dy;
    }
}

TEST_F(GraphPie, SixteenSlicesReuseTheFirstColour) {
    show(std::vector<double>(16, 1));
    const auto middle = [&](int slice) {
        const double angle = (slice + 0.5) * 22.5 * 3.14159265358979 / 180;
        return at(static_cast<int>(-30 * std::sin(angle)), static_cast<int>(-30 * std::cos(angle)));
    };
    EXPECT_EQ(middle(0), kRed);
    EXPECT_EQ(middle(14), PaletteColour(16));
    EXPECT_EQ(middle(15), kRed);
}

TEST_F(GraphPie, AllZerosGiveNoSliceButTheRadiusAndOutline) {
    show({0, 0, 0});
    EXPECT_EQ(at(0, -10), kBlack);
    EXPECT_EQ(at(10, 10), kWhite);
    EXPECT_TRUE(SamePicture(chart.expected(), picture));
}

TEST_F(GraphPie, WithoutSeriesOnlyTheTitleIsDrawn) {
    chart.setTitle(L"Nothing");
    EXPECT_TRUE(chart.same());
    EXPECT_GT(shownPixels(kBlack, {0, 0, 200, chart.state().marginTop}), 0);
    EXPECT_EQ(chart.shown().count(kWhite, {0, 25, 200, 160}), 200 * 135);
}

TEST_F(GraphPie, WithoutSeriesNothingIsInvalidated) {
    chart.redraw();
    ValidateRect(chart.window(), nullptr);
    KorGraph_Redraw(chart.window());
    EXPECT_FALSE(GetUpdateRect(chart.window(), nullptr, FALSE));
    chart.addSeries({1});
    KorGraph_Redraw(chart.window());
    EXPECT_TRUE(GetUpdateRect(chart.window(), nullptr, FALSE));
}

TEST_F(GraphPie, LabelsAreMeasuredFromTheClientCentre) {
    chart.setTitle(L"Above");
    show({1, 1, 1, 1});
    EXPECT_EQ(ComparePie(chart).wrong, 0);
    const int lowest = picture
                           .boundsOfOthers(kWhite, {0, pie.centre.y + pie.radius / 2,
                                                    pie.centre.x - pie.radius, 160})
                           .bottom;
    const int highest =
        picture.boundsOfOthers(kWhite, {0, 20, pie.centre.x - pie.radius, pie.centre.y - 10}).top;
    // With a title the pie stands lower than the labels around it.
    EXPECT_LT((lowest + highest) / 2, pie.centre.y);
}

TEST_F(GraphPie, KeepsTheLabelBoxesFreeAtTheSides) {
    chart.resize(120, 300);
    show({1});
    EXPECT_EQ(pie.box.left, chart.state().tipWidth + 4);
    EXPECT_EQ(pie.box.right, 120 - chart.state().tipWidth - 4);
    EXPECT_EQ(at(0, -pie.radius), kBlack);
    EXPECT_EQ(at(-pie.radius, 0), kBlack);
}

TEST_F(GraphPie, GrowsToTheEdgesWithoutPercentages) {
    chart.toggle(KORGRAPH_PERCENTAGES);
    show({1});
    EXPECT_EQ(pie.radius, (160 - 8) / 2);
    EXPECT_EQ(at(0, -pie.radius), kBlack);
    EXPECT_EQ(ComparePie(chart).wrong, 0);
}

TEST_F(GraphPie, DrawsNoGridAxesOrLabels) {
    show({1});
    EXPECT_EQ(picture.count(RGB(0, 150, 150)), 0);
    EXPECT_EQ(picture.pixel(28, 100), kWhite);
}

TEST_F(GraphPie, TinyWindowsDrawRadiusAndOutlineOnly) {
    chart.addSeries({1, 2, 3});
    for (int side = 1; side < 90; ++side) {
        chart.resize(side, side);
        chart.redraw();
        EXPECT_EQ(ComparePie(chart).wrong, 0) << side;
    }
}

TEST_F(GraphPie, APieHasOnlyTheFirstSeries) {
    chart.addSeries({1});
    chart.addSeries({1, 1, 1});
    chart.redraw();
    EXPECT_EQ(ComparePie(chart).wrong, 0);
    EXPECT_EQ(chart.shown().count(kGreen), 0);
}

}  // namespace
}  // namespace kortest
