// Points, sizes and rectangles in pixels, for code that needs no window. They are laid out like the
// platform's.
#pragma once

#include <cstdint>

namespace kor {

struct Point {
    int32_t x;
    int32_t y;
};

struct Size {
    int32_t width;
    int32_t height;
};

// `right` and `bottom` are exclusive.
struct Rect {
    int32_t left;
    int32_t top;
    int32_t right;
    int32_t bottom;
};

}  // namespace kor
