// The chart types and zooms in the order of their combo boxes. An item's index is also its number
// in the chart's messages.
#pragma once

#include <iterator>

namespace kor {

constexpr const wchar_t* kTypeChoices[] = {L"Line", L"Area", L"Bar", L"Column", L"Pie"};
constexpr const wchar_t* kZoomChoices[] = {L"25%", L"50%", L"100%", L"200%"};

constexpr double kZoomFactors[] = {0.25, 0.5, 1.0, 2.0};
constexpr int kZoomCount = static_cast<int>(std::size(kZoomFactors));
static_assert(std::size(kZoomChoices) == kZoomCount);

// Index of a zoom factor; the last index when it is not in the table.
constexpr int PlaceOfZoom(double factor) {
    int place = 0;
    while (place < kZoomCount - 1 && kZoomFactors[place] != factor) ++place;
    return place;
}
static_assert(PlaceOfZoom(0.25) == 0 && PlaceOfZoom(1.0) == 2);
static_assert(PlaceOfZoom(2.0) == 3 && PlaceOfZoom(0.0) == 3);

}  // namespace kor
