// A bitmap for trial drawing of texts, whose pixels can be read.
#pragma once

#include <cstdint>

#include "base/gdi_scopes.h"

namespace kor {

// 32 bits per pixel, top-down, white at first.
class ScratchBitmap {
public:
    explicit ScratchBitmap(SIZE size) noexcept : size_(size), dc_(nullptr) {
        BITMAPINFO info = {};
        info.bmiHeader.biSize = sizeof info.bmiHeader;
        info.bmiHeader.biWidth = size.cx;
        info.bmiHeader.biHeight = -size.cy;
        info.bmiHeader.biPlanes = 1;
        info.bmiHeader.biBitCount = 32;
        if (!dc_.get()) return;
        bitmap_ = CreateDIBSection(dc_.get(), &info, DIB_RGB_COLORS, &bits_, nullptr, 0);
        if (bitmap_) blank_ = SelectObject(dc_.get(), bitmap_);
        isWhite_ = blank_ && PatBlt(dc_.get(), 0, 0, size.cx, size.cy, WHITENESS);
    }
    ~ScratchBitmap() {
        if (blank_) SelectObject(dc_.get(), blank_);
        if (bitmap_) DeleteObject(bitmap_);
    }
    ScratchBitmap(const ScratchBitmap&) = delete;
    ScratchBitmap& operator=(const ScratchBitmap&) = delete;

    bool IsMade() const noexcept { return isWhite_; }
    HDC dc() const noexcept { return dc_.get(); }

    // The pixels drawn so far. Requires IsMade().
    const uint32_t* Pixels() const noexcept {
        FinishDrawing();
        return static_cast<const uint32_t*>(bits_);
    }
    size_t PixelCount() const noexcept {
        return static_cast<size_t>(size_.cx) * static_cast<size_t>(size_.cy);
    }

private:
    SIZE size_;
    MemoryDC dc_;
    HBITMAP bitmap_ = nullptr;
    HGDIOBJ blank_ = nullptr;
    void* bits_ = nullptr;
    bool isWhite_ = false;
};

// A pixel's colour, without its upper byte.
constexpr uint32_t ColourOfPixel(uint32_t pixel) { return pixel & 0xFFFFFF; }
constexpr uint32_t kWhitePixel = 0xFFFFFF;

}  // namespace kor
