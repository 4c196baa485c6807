// The points of a line or an area, on the local heap.
#pragma once

#include "base/local_text.h"
#include "base/windows_helpers.h"
#include "graph/data/record.h"
#include "graph/shapes/points.h"

namespace kor {

// A series with the axes of its chart. Valid as long as the series' values.
ValueTrace TraceOf(const GraphRecord& graph, const GraphSeries& series);

class SeriesPoints {
public:
    SeriesPoints() = default;
    ~SeriesPoints() { FreeLocal(points_); }
    SeriesPoints(const SeriesPoints&) = delete;
    SeriesPoints& operator=(const SeriesPoints&) = delete;

    // Makes the points of a trace for the view between two columns, with `spare` elements before
    // and after them. False for lack of memory.
    bool Make(const ValueTrace& trace, int left, int right, PointsOf shape, int spare);

    POINT* begin() { return PlatformPoints(points_ + spare_); }
    int count() const { return count_; }

private:
    Point* points_ = nullptr;
    int spare_ = 0;
    int count_ = 0;
};

}  // namespace kor
