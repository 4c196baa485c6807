// How the time of a redraw grows with the points of one series, beside one pass over their values.
#pragma once

#include <array>
#include <iterator>
#include <vector>

namespace bench {

inline constexpr const char* kCurveWays[] = {"pass", "line", "area", "bar", "column"};

struct CurveRow {
    int points;
    std::array<double, std::size(kCurveWays)> times;  // microseconds
};

// 10, 100 and so on to 10,000,000 points.
std::vector<CurveRow> MeasureCurve();

}  // namespace bench
