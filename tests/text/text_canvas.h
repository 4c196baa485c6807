// What texts are drawn on, in which font and where, for tests that compare two ways of drawing
// them.
#pragma once

#include "support/bitmap_canvas.h"

#include <random>

namespace kortest {

constexpr int kWidth = 160;
constexpr int kHeight = 40;

class Canvas : public BitmapCanvas {
public:
    Canvas() : BitmapCanvas(kWidth, kHeight) {}
};

inline HFONT RandomFont(std::mt19937& random) {
    LOGFONTW description = {};
    description.lfHeight = -static_cast<LONG>(6 + random() % 18);
    description.lfWeight = random() % 2 ? FW_BOLD : FW_NORMAL;
    description.lfItalic = random() % 3 == 0;
    description.lfCharSet = DEFAULT_CHARSET;
    static const wchar_t* const kFaces[] = {L"Tahoma", L"Courier New", L"Times New Roman", L""};
    lstrcpyW(description.lfFaceName, kFaces[random() % 4]);
    return CreateFontIndirectW(&description);
}

inline RECT RandomArea(std::mt19937& random) {
    const LONG left = static_cast<LONG>(random() % 80) - 10;
    const LONG top = static_cast<LONG>(random() % 24) - 6;
    return {left, top, left + static_cast<LONG>(random() % 120) - 10,
            top + static_cast<LONG>(random() % 30)};
}

}  // namespace kortest
