// The points of a line or an area, on the local heap.
#pragma once

#include "base/local_text.h"
#include "base/windows_helpers.h"
#include "graph/data/series.h"
#include "graph/scale/scale.h"
#include "graph/shapes/points.h"

namespace kor {

// A series as its picture's axes see it; valid as long as its values.
inline ValueTrace TraceOf(const GraphRecord& graph, const GraphSeries& series) {
    return {XAxis(graph), YAxis(graph), series.values, series.pointCount};
}

class SeriesPoints {
public:
    SeriesPoints() = default;
    ~SeriesPoints() { FreeLocal(points_); }
    SeriesPoints(const SeriesPoints&) = delete;
    SeriesPoints& operator=(const SeriesPoints&) = delete;

    // Makes the points of a trace for the view between two columns, with `spare` places before and
    // after them; false without memory.
    bool Make(const ValueTrace& trace, int left, int right, PointsOf shape, int spare) {
        const PointRange range = RangeInView(trace, left, right);
        const int capacity = PointCapacity(range, left, right);
        points_ = static_cast<Point*>(
            LocalAlloc(LMEM_FIXED, static_cast<SIZE_T>(capacity + 2 * spare) * sizeof(Point)));
        if (!points_) return false;
        spare_ = spare;
        count_ = FillPoints(trace, range, shape, points_ + spare, capacity);
        return true;
    }

    POINT* begin() { return PlatformPoints(points_ + spare_); }
    int count() const { return count_; }

private:
    Point* points_ = nullptr;
    int spare_ = 0;
    int count_ = 0;
};

}  // namespace kor
