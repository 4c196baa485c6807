// A series as the points that its picture needs. A picture has only so many pixels, so of the
// points in one pixel column only four matter: the first, the lowest, the highest and the last.
// NaNs and infinities have no point. Numbers only.
#pragma once

#include "graph/scale/axis.h"
#include "numbers/shapes.h"

namespace kor {

// Points by number, from 1, both ends included; empty when last < first.
struct PointRange {
    int first;
    int last;
};

// The points of `count` whose positions lie between two pixels of the axis that counts the points,
// and one more on each side. Pixels grow with the numbers; for rows give the axis reversed.
PointRange PointsBetween(const Axis& along, int count, int lowPixel, int highPixel);

// The points of a range that share a position, one position after the other.
class PositionWalk {
public:
    PositionWalk(const Axis& along, PointRange range);

    bool IsAtEnd() const { return number_ > range_.last; }
    void Next();

    int pixel() const { return pixel_; }
    int number() const { return number_; }  // the first point of this position
    int end() const { return end_; }        // the first point of the next one

private:
    void FindEnd(int expected);
    void Try(int number);

    Axis along_;
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

// Values against their numbers, from 1. Owns nothing.
struct ValueTrace {
    Axis x;
    Axis y;
    const double* values;
    int count;
};

// The points for a view between two columns: from the one before the view to the one behind it, the
// ends being finite.
PointRange RangeInView(const ValueTrace& trace, int left, int right);

// The most points that FillPoints makes of the range.
int PointCapacity(PointRange range, int left, int right);

// Writes the points of a line or an area in image pixels, in order, and returns how many.
int FillPoints(const ValueTrace& trace, PointRange range, PointsOf shape, Point* points,
               int capacity);

}  // namespace kor
