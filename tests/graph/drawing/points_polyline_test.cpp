// A polyline through the points that a series' picture needs has the pixels of one through all of
// its points, the missing last pixel included.
#include "graph/number_graph.h"

#include "graph/drawing/series_points.h"
#include "support/bitmap_canvas.h"

#include <cmath>
#include <limits>
#include <random>

namespace kortest {
namespace {

constexpr int kWidth = 230;
constexpr int kHeight = 130;

class LineCanvas : public BitmapCanvas {
public:
    LineCanvas() : BitmapCanvas(kWidth, kHeight) {}

    std::vector<uint32_t> Draw(const POINT* points, int count) const {
        clear();
        Polyline(dc(), points, count);
        return pixels();
    }
};

class GraphPolyline : public NumberGraph {
protected:
    // Values in few rows, often many to a column and now and then none at all.
    std::vector<double> randomValues() {
        std::vector<double> values(1 + random() % (random() % 2 ? 3000 : 20));
        const unsigned rows = 1 + random() % 12;
        for (double& value : values) {
            value = random() % rows + 0.09 * (random() % 10) / 10;
            if (random() % 9 == 0) value = std::numeric_limits<double>::quiet_NaN();
        }
        return values;
    }

    std::vector<POINT> allPoints(const std::vector<double>& values) const {
        std::vector<POINT> points;
        for (size_t i = 0; i < values.size(); ++i) {
            if (!std::isfinite(values[i])) continue;
            points.push_back(
                {kor::xPixel(graph, static_cast<double>(i + 1)), kor::yPixel(graph, values[i])});
        }
        return points;
    }

    std::mt19937 random{40};
    LineCanvas canvas;
};

TEST_F(GraphPolyline, OfTheNeededPointsIsThatOfAllPoints) {
    int withoutLastPixel = 0;
    for (int round = 0; round < 1000; ++round) {
        const std::vector<double> values = randomValues();
        showX(0, static_cast<double>(values.size()) * (1 + random() % 40));
        kor::RemoveAllSeries(graph);
        const kor::GraphSeries& series = add(values);
        const std::vector<POINT> all = allPoints(values);
        kor::SeriesPoints needed;
        ASSERT_TRUE(needed.Make(kor::TraceOf(graph, series), 15, 215, kor::PointsOf::polyline, 0));
        const auto expected = canvas.Draw(all.data(), static_cast<int>(all.size()));
        ASSERT_EQ(canvas.Draw(needed.begin(), needed.count()), expected) << "round " << round;
        if (all.empty()) continue;
        const POINT last = all.back();
        const uint32_t pixel = expected[static_cast<size_t>(last.y * kWidth + last.x)];
        withoutLastPixel += (pixel & 0xFFFFFF) != 0;
    }
    EXPECT_GT(withoutLastPixel, 50);  // or nothing was at stake
}

// Only what lies in view matters: the line crosses its edge all the same.
TEST_F(GraphPolyline, RunsOnBeyondTheViewPastValuesThatAreNone) {
    const double none = std::numeric_limits<double>::quiet_NaN();
    const kor::GraphSeries& series = add({2, none, none, 4, 5, 6, none, none, 9, 1});
    showX(3.5, 6.5);
    kor::SeriesPoints needed;
    ASSERT_TRUE(needed.Make(kor::TraceOf(graph, series), 15, 215, kor::PointsOf::polyline, 0));
    ASSERT_EQ(needed.count(), 5);
    EXPECT_EQ(needed.begin()[0].x, kor::xPixel(graph, 1));
    EXPECT_EQ(needed.begin()[0].y, kor::yPixel(graph, 2));
    EXPECT_EQ(needed.begin()[4].x, kor::xPixel(graph, 9));
    EXPECT_EQ(needed.begin()[4].y, kor::yPixel(graph, 9));
}

TEST_F(GraphPolyline, NeedsFewPointsWhereManyShareAColumn) {
    std::vector<double> values(100000);
    for (double& value : values) value = random() % 10;
    showX(0, 100001);
    kor::SeriesPoints needed;
    ASSERT_TRUE(needed.Make(kor::TraceOf(graph, add(values)), 15, 215, kor::PointsOf::polyline, 0));
    EXPECT_LE(needed.count(), 4 * 202 + 2);
}

}  // namespace
}  // namespace kortest
