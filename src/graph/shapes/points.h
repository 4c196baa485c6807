// A series as the points that its picture needs. A picture has only so many pixels, so of the
// points that share a pixel position along the axis four say all: the first, the lowest, the
// highest and the last. Values that are no numbers, or infinite, have no point. No DC.
#pragma once

#include "graph/record.h"

namespace kor {

// Points by number, from 1, both ends included; empty when last < first.
struct PointRange {
    int first;
    int last;
};

// Position of point number i along the axis that counts the points; never falls as i grows.
using AlongAxis = int (*)(const GraphRecord& graph, double pointNumber);

// The points of `count` whose positions lie between two pixels, and one more on each side.
// Positions that fall as numbers grow (bar charts) are given negated.
PointRange PointsBetween(const GraphRecord& graph, AlongAxis along, int count, int lowPixel,
                         int highPixel);

// The points of a range that share a position, one position after the other.
class PositionWalk {
public:
    PositionWalk(const GraphRecord& graph, AlongAxis along, PointRange range);

    bool IsAtEnd() const { return number_ > range_.last; }
    void Next();

    int pixel() const { return pixel_; }
    int number() const { return number_; }  // the first point of this position
    int end() const { return end_; }        // the first point of the next one

private:
    void FindEnd(int expected);
    void Try(int number);

    const GraphRecord& graph_;
    AlongAxis along_;
    PointRange range_;
    int pixel_ = 0;
    int number_;
    int end_;
    int low_ = 0;       // while the end is looked for: a point of this position,
    int endPixel_ = 0;  // and the position of the point at the end
};

// Points with numbers [number, end) that stand for all of them, by index into the values; -1 for
// none.
struct PositionSummary {
    int first;
    int lowest;
    int highest;
    int last;
};

PositionSummary Summarise(const double* values, int number, int end);

// What is drawn with the points. A polyline leaves out its very last pixel, unless it has been
// there before; a polygon is closed.
enum class PointsOf { polyline, polygon };

// The points of a line or an area in image pixels, in order. Owns its array.
class SeriesPoints {
public:
    SeriesPoints() = default;
    ~SeriesPoints();
    SeriesPoints(const SeriesPoints&) = delete;
    SeriesPoints& operator=(const SeriesPoints&) = delete;

    // Makes the points of a series for the view between two columns, with `spare` places before and
    // after them; false without memory.
    bool Make(const GraphRecord& graph, const GraphSeries& series, int left, int right,
              PointsOf shape, int spare);

    POINT* begin() { return points_ + spare_; }
    int count() const { return count_; }

private:
    void Append(const GraphRecord& graph, const GraphSeries& series, int column, int index);
    void AppendPosition(const GraphRecord& graph, const GraphSeries& series, int column, int number,
                        int end);
    void AppendLastPosition(const GraphRecord& graph, const GraphSeries& series, int column,
                            int number, int end);

    POINT* points_ = nullptr;
    int capacity_ = 0;  // without the spare places
    int spare_ = 0;
    int count_ = 0;
};

}  // namespace kor
