#include "graph/shapes/bar_layout.h"

#include "numbers/comparable.h"

namespace kor {

int FindBar(const BarAxes& axes, const double* values, int count, int offset, int thickness,
            Point at) {
    const int along = axes.upright ? at.x : -at.y;
    const int height = axes.upright ? -at.y : at.x;
    const int zero = PixelAt(axes.value, 0);
    const PointRange range =
        PointsBetween(axes.along, count, along - offset - thickness, along - offset);
    for (int i = range.first; i <= range.last; ++i) {
        const double value = values[i - 1];
        const int begin = PixelAt(axes.along, i) + offset;
        if (!IsFinite(value) || along < begin || along > begin + thickness) continue;
        const int end = PixelAt(axes.value, value);
        const bool isHit =
            value >= 0 ? zero <= height && height <= end : end <= height && height <= zero;
        if (isHit) return i - 1;
    }
    return -1;
}

}  // namespace kor
