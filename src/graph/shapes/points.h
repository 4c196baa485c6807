// Reduces a series to the points that its picture needs. Of the points in one pixel column only
// four matter: the first, the lowest, the highest and the last. NaNs and infinities have no point.
// Arithmetic only.
#pragma once

#include "graph/scale/axis.h"
#include "numbers/shapes.h"

namespace kor {

// A range of point numbers, counted from 1, both ends included; empty when last < first.
struct PointRange {
    int first;
    int last;
};

// The points, of `count`, whose positions lie between two pixels of the category axis, and one more
// on each side. Pixels must grow with the point numbers: for rows pass the reversed axis.
PointRange PointsBetween(const Axis& along, int count, int lowPixel, int highPixel);

// Visits the pixel positions of a range of points, one after the other, each with the points that
// share it.
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
    int low_ = 0;       // during the search for the end: a point of this position,
    int endPixel_ = 0;  // and the pixel of the point at the end
};

// The points that represent all points [number, end), as indexes into the values; -1 for none.
struct PositionSummary {
    int first;
    int lowest;
    int highest;
    int last;
};

PositionSummary Summarise(const double* values, int number, int end);

// What is drawn with the points. A polyline omits its final pixel unless an earlier segment has
// drawn it; a polygon is closed.
enum class PointsOf { polyline, polygon };

// Values against their point numbers, counted from 1. Owns nothing.
struct ValueTrace {
    Axis x;
    Axis y;
    const double* values;
    int count;
};

// The points for a view between two columns: from the one before the view to the one after it, both
// with finite values.
PointRange RangeInView(const ValueTrace& trace, int left, int right);

// The maximum number of points that FillPoints writes for the range.
int PointCapacity(PointRange range, int left, int right);

// Writes the points of a line or an area in image pixels, in order, and returns how many.
int FillPoints(const ValueTrace& trace, PointRange range, PointsOf shape, Point* points,
               int capacity);

}  // namespace kor
