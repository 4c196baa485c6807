#include "zoom/zoom.h"

namespace kor {

constinit uint32_t zoomLevel = kZoomWhole;

int ZoomedFontHeight(int height, uint32_t zoom) {
    const double scaled = (zoom * 0.25) * height;
    // An absurd zoom must not overflow the integer.
    constexpr double kLimit = 32767.0;
    if (scaled > kLimit || scaled < -kLimit) return -32767;
    const int truncated = static_cast<int>(scaled);
    return truncated > 0 ? -truncated : truncated;
}

}  // namespace kor
