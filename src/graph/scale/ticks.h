// Where ticks, grid lines and number labels stand on an axis: at the multiples of a step, in the
// order of two walks from 0 outwards. Arithmetic only.
#pragma once

#include "graph/scale/axis.h"

namespace kor {

// The multiples k whose pixels may lie in view, both ends included; empty when last < first.
struct TickRange {
    double first;
    double last;
};

// The multiples of `step` between two data values, one more on each side; none when the step is too
// small relative to the values to change them.
TickRange TicksBetween(double valueA, double valueB, double step);

// The multiples of a step between two pixels of an axis, lowEdge <= highEdge, one after the other:
//
//     for (TickWalk tick(axis, step, left, right); tick.Next();) Draw(tick.value(), tick.pixel());
//
// The first walk goes down from 0, the second goes up; the tick at 0 may come twice. Compatibility:
// each walk includes the end of the view that it reaches last and omits the end where it begins
// (GraphTicks.LeaveOutThePlotsEdgeOfTheWalkThatBeginsThere).
class TickWalk {
public:
    TickWalk(const Axis& axis, double step, int lowEdge, int highEdge);

    // Goes to the next tick; false when there is none.
    bool Next();

    double value() const { return value_; }
    int pixel() const { return pixel_; }

private:
    bool IsDrawn(int pixel) const;

    Axis axis_;  // oriented so that pixels grow with the values
    bool isReversed_;
    double step_;
    TickRange range_;
    int low_;
    int high_;
    bool isForward_ = false;
    double k_;  // the next multiple
    double value_ = 0;
    int pixel_ = 0;
};

}  // namespace kor
