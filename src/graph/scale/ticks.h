// Where ticks, grid lines and number labels stand on an axis: at the multiples of a step, as two
// walks from 0 outwards would find them. Numbers only.
#pragma once

#include "graph/scale/axis.h"

namespace kor {

// The multiples k whose pixels may lie in view, both ends included; empty when last < first.
struct TickRange {
    double first;
    double last;
};

// The multiples of `step` between two data values, one more on each side; none when the step is too
// small against the values to change them.
TickRange TicksBetween(double valueA, double valueB, double step);

// The multiples of a step between two pixels of an axis, lowEdge <= highEdge, one after the other:
//
//     for (TickWalk tick(axis, step, left, right); tick.Next();) Draw(tick.value(), tick.pixel());
//
// First those below 0, away from it, then those above; the one at 0 may come twice. Both ends of
// the view take part only on the side that a walk reaches last.
class TickWalk {
public:
    TickWalk(const Axis& axis, double step, int lowEdge, int highEdge);

    // Goes to the next tick; false when there is none.
    bool Next();

    double value() const { return value_; }
    int pixel() const { return pixel_; }

private:
    bool IsDrawn(int pixel) const;

    Axis axis_;  // in the sense in which pixels grow with the values
    bool isReversed_;
    double step_;
    TickRange range_;
    int low_;
    int high_;
    bool isForward_ = false;
    double k_;  // the multiple that comes next
    double value_ = 0;
    int pixel_ = 0;
};

}  // namespace kor
