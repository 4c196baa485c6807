// What texts are drawn on, in which font and where, for tests that compare two ways of drawing
// them.
#pragma once

#include "platform/platform.h"

#include <cstdint>
#include <iterator>
#include <random>
#include <vector>

namespace kortest {

constexpr int kWidth = 160;
constexpr int kHeight = 40;

// A 32-bit picture that a test draws into.
class Canvas {
public:
    Canvas() : dc_(CreateCompatibleDC(nullptr)) {
        BITMAPINFO info = {};
        info.bmiHeader.biSize = sizeof info.bmiHeader;
        info.bmiHeader.biWidth = kWidth;
        info.bmiHeader.biHeight = -kHeight;
        info.bmiHeader.biPlanes = 1;
        info.bmiHeader.biBitCount = 32;
        void* bits = nullptr;
        bitmap_ = CreateDIBSection(dc_, &info, DIB_RGB_COLORS, &bits, nullptr, 0);
        pixels_ = static_cast<const uint32_t*>(bits);
        blank_ = SelectObject(dc_, bitmap_);
        Clear();
    }
    ~Canvas() {
        SelectObject(dc_, blank_);
        DeleteObject(bitmap_);
        DeleteDC(dc_);
    }
    Canvas(const Canvas&) = delete;
    Canvas& operator=(const Canvas&) = delete;

    HDC dc() const { return dc_; }
    void Clear() { PatBlt(dc_, 0, 0, kWidth, kHeight, WHITENESS); }
    std::vector<uint32_t> Pixels() const {
        GdiFlush();
        return {pixels_, pixels_ + kWidth * kHeight};
    }

private:
    HDC dc_;
    HBITMAP bitmap_ = nullptr;
    HGDIOBJ blank_ = nullptr;
    const uint32_t* pixels_ = nullptr;
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
