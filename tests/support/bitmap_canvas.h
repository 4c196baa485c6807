// A 32-bit bitmap that a test draws into and reads back.
#pragma once

#include <windows.h>

#include <cstdint>
#include <vector>

namespace kortest {

class BitmapCanvas {
public:
    BitmapCanvas(int width, int height)
        : dc_(CreateCompatibleDC(nullptr)), width_(width), height_(height) {
        BITMAPINFO info = {};
        info.bmiHeader.biSize = sizeof info.bmiHeader;
        info.bmiHeader.biWidth = width;
        info.bmiHeader.biHeight = -height;
        info.bmiHeader.biPlanes = 1;
        info.bmiHeader.biBitCount = 32;
        void* bits = nullptr;
        bitmap_ = CreateDIBSection(dc_, &info, DIB_RGB_COLORS, &bits, nullptr, 0);
        pixels_ = static_cast<const uint32_t*>(bits);
        blank_ = SelectObject(dc_, bitmap_);
        clear();
    }
    ~BitmapCanvas() {
        SelectObject(dc_, blank_);
        DeleteObject(bitmap_);
        DeleteDC(dc_);
    }
    BitmapCanvas(const BitmapCanvas&) = delete;
    BitmapCanvas& operator=(const BitmapCanvas&) = delete;

    HDC dc() const { return dc_; }
    void clear() const { PatBlt(dc_, 0, 0, width_, height_, WHITENESS); }
    std::vector<uint32_t> pixels() const {
        GdiFlush();
        return {pixels_, pixels_ + width_ * height_};
    }

private:
    HDC dc_;
    HBITMAP bitmap_ = nullptr;
    HGDIOBJ blank_ = nullptr;
    const uint32_t* pixels_ = nullptr;
    int width_;
    int height_;
};

}  // namespace kortest
