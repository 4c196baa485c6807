// Where the parts of the bar and of a menu entry stand: numbers only, in pixels.
#pragma once

#include "platform/platform.h"

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

constexpr POINT ArrowPlace(int textLeft, int textWidth, int clientBottom) {
    return {textLeft + textWidth + kArrowGap, clientBottom - kArrowAboveBottom};
}

static_assert(BarImageTop(25, 17) == 4);
static_assert(BarTextLeft(true, 16) == 22 && BarTextLeft(true, 0) == 6);
static_assert(BarTextLeft(false, 0) == 3);

// Height that makes a font of so many points on a device of so many pixels per inch.
constexpr int FontHeight(int points, int pixelsPerInch) { return -points * pixelsPerInch / 72; }

static_assert(FontHeight(10, 96) == -13 && FontHeight(10, 72) == -10);

// ---- A menu entry ----

constexpr int kEntryImageInset = 2;  // from the entry's left and top edge
constexpr int kEntryImageGap = 4;
constexpr int kMenuLeft = 3;  // of the whole menu, on the screen

constexpr int EntryTextLeft(int entryLeft, int imageWidth) {
    return entryLeft + kEntryImageInset + imageWidth + kEntryImageGap;
}

// Of the image and the gaps beside it; a text taller than its image makes the entry as high as
// itself.
constexpr SIZE EntrySize(SIZE text, SIZE image) {
    return {text.cx + image.cx + kEntryImageInset + kEntryImageGap,
            text.cy > image.cy ? text.cy : image.cy + kEntryImageInset};
}

static_assert(EntrySize({50, 15}, {16, 14}).cx == 72 && EntrySize({50, 15}, {16, 14}).cy == 15);
static_assert(EntrySize({50, 15}, {16, 15}).cy == 17);

}  // namespace kor
