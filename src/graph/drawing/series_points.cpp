#include "graph/drawing/series_points.h"

#include "graph/data/axes.h"

namespace kor {

ValueTrace TraceOf(const GraphRecord& graph, const GraphSeries& series) {
    return {XAxis(graph), YAxis(graph), series.values, series.pointCount};
}

bool SeriesPoints::Make(const ValueTrace& trace, int left, int right, PointsOf shape, int spare) {
    const PointRange range = RangeInView(trace, left, right);
    const int capacity = PointCapacity(range, left, right);
    points_ = static_cast<Point*>(
        LocalAlloc(LMEM_FIXED, static_cast<SIZE_T>(capacity + 2 * spare) * sizeof(Point)));
    if (!points_) return false;
    spare_ = spare;
    count_ = FillPoints(trace, range, shape, points_ + spare, capacity);
    return true;
}

}  // namespace kor
