// The points that a series' picture needs: no more than there is room for, and with the pixels of
// all its points.
#include "fuzz_chart.h"

#include "graph/shapes/points.h"

#include <utility>

namespace korfuzz {
namespace {

using Pixels = std::vector<std::pair<int, int>>;

constexpr int kMostRaster = 1000;

bool IsNear(kor::Point point) {
    return std::abs(point.x) < kMostRaster && std::abs(point.y) < kMostRaster;
}

// A line's pixels but the last, as any drawing of lines has them that depends on their ends alone.
void DrawLine(Pixels& pixels, kor::Point from, kor::Point to, int left, int right) {
    const int dx = std::abs(to.x - from.x);
    const int dy = std::abs(to.y - from.y);
    const int stepX = from.x < to.x ? 1 : -1;
    const int stepY = from.y < to.y ? 1 : -1;
    int error = dx - dy;
    while (from.x != to.x || from.y != to.y) {
        if (from.x >= left && from.x <= right) pixels.emplace_back(from.x, from.y);
        const int twice = 2 * error;
        if (twice > -dy) {
            error -= dy;
            from.x += stepX;
        }
        if (twice < dx) {
            error += dx;
            from.y += stepY;
        }
    }
}

Pixels Drawn(const kor::Point* points, size_t count, int left, int right) {
    Pixels pixels;
    for (size_t i = 1; i < count; ++i) DrawLine(pixels, points[i - 1], points[i], left, right);
    std::sort(pixels.begin(), pixels.end());
    pixels.erase(std::unique(pixels.begin(), pixels.end()), pixels.end());
    return pixels;
}

std::vector<kor::Point> AllPoints(const kor::GraphRecord& graph, const kor::GraphSeries& series) {
    std::vector<kor::Point> points;
    for (int i = 0; i < series.pointCount; ++i) {
        if (!std::isfinite(series.values[i])) continue;
        points.push_back({kor::xPixel(graph, i + 1), kor::yPixel(graph, series.values[i])});
    }
    return points;
}

void CheckPositions(const kor::GraphRecord& graph, kor::PointRange range) {
    int next = range.first;
    for (kor::PositionWalk walk(kor::XAxis(graph), range); !walk.IsAtEnd(); walk.Next()) {
        EXPECT_THAT(walk.number() == next && walk.end() > next);
        for (; next < walk.end(); ++next) EXPECT_THAT(kor::xPixel(graph, next) == walk.pixel());
    }
    EXPECT_THAT(next == std::max(range.last + 1, range.first));
}

void CheckPixels(const std::vector<kor::Point>& all, const std::vector<kor::Point>& needed,
                 int left, int right) {
    if (!std::all_of(all.begin(), all.end(), IsNear)) return;
    if (!std::all_of(needed.begin(), needed.end(), IsNear)) return;
    EXPECT_THAT(Drawn(needed.data(), needed.size(), left, right) ==
                Drawn(all.data(), all.size(), left, right));
}

}  // namespace
}  // namespace korfuzz

extern "C" int LLVMFuzzerTestOneInput(const uint8_t* data, size_t size) {
    using namespace korfuzz;
    Input input(data, size);
    Chart chart;
    chart.resize(input);
    chart.show(input);
    // A closed shape's extremes may come in another order, so that it is compared in its count
    // alone.
    const bool closed = input.ConsumeBool();
    const int left = input.ConsumeIntegralInRange(-50, 400);
    const int right = input.ConsumeIntegralInRange(-50, 400);
    chart.add(AnyValues(input, 1500));

    const kor::GraphSeries& series = *chart.record.series[0];
    CheckPositions(chart.record, {1, series.pointCount});
    const kor::ValueTrace trace = {kor::XAxis(chart.record), kor::YAxis(chart.record),
                                   series.values, series.pointCount};
    const auto shape = closed ? kor::PointsOf::polygon : kor::PointsOf::polyline;
    const kor::PointRange range = kor::RangeInView(trace, left, right);
    const int capacity = kor::PointCapacity(range, left, right);
    EXPECT_THAT(capacity >= 0 && capacity <= 4 * (std::max(right - left, 0) + 4) + 2);
    std::vector<kor::Point> needed(static_cast<size_t>(capacity));  // its end is watched
    const int count = kor::FillPoints(trace, range, shape, needed.data(), capacity);
    EXPECT_THAT(count >= 0 && count <= capacity);
    needed.resize(static_cast<size_t>(count));
    if (left <= right && !closed) {
        CheckPixels(AllPoints(chart.record, series), needed, left, right);
    }
    return 0;
}
