// Layout of the bar and of a menu entry: pure calculations, in pixels.
#pragma once

#include "numbers/shapes.h"

namespace kor {

// ---- The bar, in client coordinates ----

constexpr int kBarLeft = 3;  // of the image, or of the text without one
constexpr int kBarImageGap = 3;
constexpr int kArrowGap = 6;
constexpr int kArrowAboveBottom = 13;
constexpr int kArrowWidth = 13;

constexpr int BarImageTop(int clientHeight, int imageHeight) {
    return clientHeight / 2 - imageHeight / 2;
}

constexpr int BarTextLeft(bool hasImage, int imageWidth) {
    return hasImage ? kBarLeft + imageWidth + kBarImageGap : kBarLeft;
}

constexpr Point ArrowPlace(int textLeft, int textWidth, int clientBottom) {
    return {textLeft + textWidth + kArrowGap, clientBottom - kArrowAboveBottom};
}

static_assert(BarImageTop(25, 17) == 4);
static_assert(BarTextLeft(true, 16) == 22 && BarTextLeft(true, 0) == 6);
static_assert(BarTextLeft(false, 0) == 3);

// Font height in pixels, negative as in LOGFONT, for a size in points.
constexpr int FontHeight(int points, int pixelsPerInch) { return -points * pixelsPerInch / 72; }

static_assert(FontHeight(10, 96) == -13 && FontHeight(10, 72) == -10);

// ---- A menu entry ----

constexpr int kEntryImageInset = 2;  // from the entry's left and top edge
constexpr int kEntryImageGap = 4;
constexpr int kMenuLeft = 3;  // of the whole menu, in screen coordinates

constexpr int EntryTextLeft(int entryLeft, int imageWidth) {
    return entryLeft + kEntryImageInset + imageWidth + kEntryImageGap;
}

// Width of the text, the image and the gaps beside it. Height of the image and its inset, or of a
// text that is taller than the image.
constexpr Size EntrySize(Size text, Size image) {
    return {text.width + image.width + kEntryImageInset + kEntryImageGap,
            text.height > image.height ? text.height : image.height + kEntryImageInset};
}

static_assert(EntrySize({50, 15}, {16, 14}).width == 72 &&
              EntrySize({50, 15}, {16, 14}).height == 15);
static_assert(EntrySize({50, 15}, {16, 15}).height == 17);

}  // namespace kor
