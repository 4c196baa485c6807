// Labels, titles and the margins that make room for them.
#include "graph/pictures/chart_pair.h"
#include "support/import_spy.h"

#include <algorithm>

namespace kortest {
namespace {

constexpr COLORREF kWhite = RGB(255, 255, 255);

class GraphTexts : public ChartTest {
protected:
    void only(DWORD options) { chart.toggle(chart.state().options ^ options); }
    void show() {
        EXPECT_TRUE(chart.same());
        picture = chart.shown();
        plot = chart.state().plot();
    }
    bool isEmpty(const RECT& area) const {
        const RECT bounds = picture.boundsOfOthers(kWhite, area);
        return bounds.left == bounds.right;
    }
    int lineHeight() { return chart.fonts().measure(L"9", chart.fonts().upright()).cy; }

    Picture picture;
    RECT plot{};
};

class GraphMargins : public GraphTexts {};
class GraphXLabels : public GraphTexts {};
class GraphYLabels : public GraphTexts {};
class GraphTitles : public GraphTexts {};

TEST_F(GraphMargins, AreFifteenWithoutTexts) {
    only(KORGRAPH_XTICKS);
    show();
    EXPECT_EQ(plot, (RECT{15, 15, 305, 225}));
    const int y = chart.state().yPixel(0);
    for (int x = 15; x < 305; ++x) ASSERT_NE(picture.pixel(x, y), kWhite) << x;
    EXPECT_TRUE(isEmpty({0, 0, 14, 240}));
    EXPECT_TRUE(isEmpty({306, 0, 320, 240}));
}

TEST_F(GraphMargins, MakeRoomForARowOfLabels) {
    only(KORGRAPH_XLABELS);
    show();
    EXPECT_EQ(plot.bottom, 240 - std::max(15, lineHeight() + 4));
}

TEST_F(GraphMargins, OfATitleCountOnlyWithItsText) {
    const int line = lineHeight();
    show();
    EXPECT_EQ(plot.top, 15);
    chart.setTitle(L"T");
    chart.setXTitle(L"X");
    show();
    EXPECT_EQ(plot.top, std::max(15, line + 4));
    EXPECT_EQ(plot.bottom, 240 - 2 * (line + 4));
    chart.setTitle(L"");
    show();
    EXPECT_EQ(plot.top, 15);
}

TEST_F(GraphMargins, OfTheLeftAreMeasuredByTheUpperEndAlone) {
    chart.setRange(KORGRAPH_Y, -123456, 1);
    chart.setTitle(L"");
    show();
    EXPECT_EQ(chart.state().labelMaxWidth, 10);
    chart.setRange(KORGRAPH_Y, 0, 123456);
    chart.setTitle(L"");
    show();
    EXPECT_GT(chart.state().labelMaxWidth, 10);
}

TEST_F(GraphMargins, OfTheLeftNeverShrink) {
    chart.setRange(KORGRAPH_Y, 0, 1.2345e100);
    chart.setTitle(L"");
    show();
    const int wide = plot.left;
    chart.setRange(KORGRAPH_Y, 0, 1);
    chart.setTitle(L"");
    show();
    EXPECT_EQ(plot.left, wide);
    EXPECT_GT(wide, 50);
}

TEST_F(GraphMargins, FollowAnOptionAtOnce) {
    only(0x3FF & ~KORGRAPH_YLABELS);
    show();
    EXPECT_EQ(plot.left, 15);
    only(0x3FF);
    show();
    EXPECT_GT(plot.left, 15);
}

TEST_F(GraphXLabels, OfCategoriesStandUnderTheirPoints) {
    only(KORGRAPH_XLABELS);
    chart.addSeries({1, 2, 3});
    chart.setCategories({L"H", L"", L"I"});
    show();
    const int top = plot.bottom + 4;
    const auto under = [&](double x) {
        const int at = chart.state().xPixel(x);
        return RECT{at - 8, top, at + 8, top + chart.state().xLabelHeight};
    };
    EXPECT_FALSE(isEmpty(under(1)));
    EXPECT_TRUE(isEmpty(under(2)));
    EXPECT_FALSE(isEmpty(under(3)));
}

TEST_F(GraphXLabels, OfCategoriesAreClippedSixPixelsInsideThePlot) {
    only(KORGRAPH_XLABELS);
    chart.addSeries({1});
    chart.setRange(KORGRAPH_X, 1, 4);
    chart.setCategories({L"MMMMMMMMMMMMMMMM"});
    show();
    const RECT row{0, plot.bottom + 4, 320, 240};
    EXPECT_GE(picture.boundsOfOthers(kWhite, row).left, plot.left + 6);
    EXPECT_LE(picture.boundsOfOthers(kWhite, row).left, plot.left + 9);
}

TEST_F(GraphXLabels, LeaveOutCategoriesAtAndPastThePlotsRight) {
    only(KORGRAPH_XLABELS);
    chart.addSeries({1, 2});
    chart.setRange(KORGRAPH_X, 0, 2);
    chart.setCategories({L"", L"WWWW", L"WWWW"});
    show();
    EXPECT_EQ(chart.state().xPixel(2), plot.right);
    EXPECT_TRUE(isEmpty({0, plot.bottom + 4, 320, 240}));
}

TEST_F(GraphXLabels, OfABarChartAreNumbersWhateverTheCategories) {
    only(KORGRAPH_XLABELS | KORGRAPH_YLABELS);
    chart.setType(KORGRAPH_BAR);
    chart.addSeries({1, 2, 3});
    chart.setCategories({L"one", L"two", L"three"});
    show();
    EXPECT_FALSE(isEmpty({plot.left + 20, plot.bottom + 4, 320, 240}));
    const int y = chart.state().yPixel(2);
    EXPECT_FALSE(isEmpty({0, y - 4, plot.left - 4, y + 4}));
}

TEST_F(GraphXLabels, WithCategoriesNoneAreNumbers) {
    only(KORGRAPH_XLABELS);
    chart.addSeries({1, 2, 3});
    chart.setCategories({L""});
    show();
    EXPECT_TRUE(isEmpty({0, plot.bottom + 4, 320, 240}));
}

TEST_F(GraphXLabels, ThousandsOfCategoriesOutOfSightChangeNothing) {
    std::vector<std::wstring> labels(30000, L"far");
    labels[1] = L"H";
    chart.addSeries({1, 2, 3});
    chart.setCategories(labels);
    chart.setRange(KORGRAPH_X, 0, 4);
    show();
}

TEST_F(GraphXLabels, LeaveOutThePlotsLeftWhenItIsAboveZero) {
    only(KORGRAPH_XLABELS);
    chart.setRange(KORGRAPH_X, 4, 24);
    show();
    ASSERT_EQ(chart.state().xTickStep, 4);
    ASSERT_EQ(chart.state().xPixel(4), plot.left);
    EXPECT_TRUE(isEmpty({0, plot.bottom + 4, plot.left + 8, 240}));
    EXPECT_FALSE(isEmpty({plot.left + 8, plot.bottom + 4, 320, 240}));
}

TEST_F(GraphYLabels, OfCategoriesLeaveOutThePlotsTopAndKeepItsBottom) {
    only(KORGRAPH_YLABELS);
    chart.setType(KORGRAPH_BAR);
    chart.addSeries(std::vector<double>(9, 1));
    chart.setCategories(std::vector<std::wstring>(10, L"W"));
    show();
    EXPECT_EQ(chart.state().yPixel(10), plot.top);
    EXPECT_TRUE(isEmpty({0, 0, plot.left - 4, plot.top + 4}));
    int labelled = 0;
    for (int i = 1; i <= 10; ++i) {
        const int y = chart.state().yPixel(i);
        labelled += !isEmpty({0, y - 3, plot.left - 4, y + 3});
    }
    EXPECT_EQ(labelled, 9);
}

TEST_F(GraphYLabels, OfNumbersFillTheColumnLeftOfTheAxis) {
    only(KORGRAPH_YLABELS);
    chart.setRange(KORGRAPH_Y, 0, 12345);
    show();
    const RECT column = picture.boundsOfOthers(kWhite, {0, 0, plot.left - 1, 240});
    EXPECT_GE(column.left, plot.left - 4 - 2 * chart.state().labelMaxWidth);
    EXPECT_LE(column.right, plot.left - 4);
}

TEST_F(GraphTitles, OfTheChartIsCentredAtTheTop) {
    only(KORGRAPH_TITLE);
    chart.setTitle(L"HHHH");
    show();
    const RECT text = picture.boundsOfOthers(kWhite, {0, 0, 320, plot.top - 1});
    EXPECT_NEAR((text.left + text.right) / 2, 160, 2);
    chart.toggle(KORGRAPH_TITLE);
    show();
    EXPECT_TRUE(isEmpty({0, 0, 320, 12}));
}

TEST_F(GraphTitles, OfTheXAxisLiesUnderTheLabels) {
    only(KORGRAPH_XTITLE | KORGRAPH_XLABELS);
    chart.setXTitle(L"HHHH");
    show();
    const int top = plot.bottom + chart.state().xLabelHeight + 8;
    const RECT text = picture.boundsOfOthers(kWhite, {plot.left, top, plot.right, 240});
    EXPECT_NEAR((text.left + text.right) / 2, (plot.left + plot.right) / 2, 2);
}

TEST_F(GraphTitles, OfTheYAxisBeginsAtTheMiddleAndRunsUp) {
    only(KORGRAPH_YTITLE);
    chart.setYTitle(L"HHHH");
    show();
    const int middle = plot.bottom - (plot.bottom - plot.top) / 2;
    const RECT text = picture.boundsOfOthers(kWhite, {0, 0, plot.left - 1, 240});
    EXPECT_LE(text.bottom, middle + 1);
    EXPECT_GE(text.bottom, middle - 4);
    EXPECT_GE(text.left, 3);
}

TEST_F(GraphTitles, OfTheYAxisIsCutAtThePlotsTop) {
    only(KORGRAPH_YTITLE);
    chart.setYTitle(std::wstring(60, L'M'));
    show();
    EXPECT_GE(picture.boundsOfOthers(kWhite, {0, 0, plot.left - 1, 240}).top, plot.top);
}

TEST_F(GraphTitles, OfTheYAxisIsCutAtTwentyFivePixelsWhateverTheFont) {
    chart.setYTitle(L"HHHH");
    show();
    ImportSpy spy;
    spy.watch("ExtTextOutW");
    RECT strip{};
    spy.replace("ExtTextOutW", [&](ULONG_PTR* arguments) {
        const auto* area = reinterpret_cast<const RECT*>(arguments[4]);
        if (arguments[1] == 4 && (arguments[3] & ETO_CLIPPED)) strip = *area;
        return spy.callReal("ExtTextOutW", arguments);
    });
    KorGraph_Redraw(chart.window());
    EXPECT_EQ(strip, (RECT{0, plot.top, 25, plot.bottom}));
}

TEST_F(GraphTitles, TradePlacesWithTheAxes) {
    chart.setXTitle(L"across");
    chart.setYTitle(L"up");
    chart.addSeries({1, 2, 3});
    show();
    chart.setType(KORGRAPH_BAR);
    show();
    EXPECT_EQ(chart.state().xTitle, L"up");
    chart.setType(KORGRAPH_LINE);
    show();
}

TEST_F(GraphTitles, TakeAnAmpersandAsDrawTextDoes) {
    chart.setTitle(L"Salt && &Pepper");
    show();
}

}  // namespace
}  // namespace kortest
