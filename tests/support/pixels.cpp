#include "support/pixels.h"

#include <algorithm>
#include <cstdint>
#include <cstdio>
#include <memory>
#include <ostream>
#include <sstream>

namespace kortest {
namespace {

// A 32-bit bitmap whose rows run from the top; `bits` receives its pixels, 0x00RRGGBB each.
HBITMAP CreatePixelBitmap(int width, int height, uint32_t** bits) {
    BITMAPINFO info{};
    info.bmiHeader.biSize = sizeof info.bmiHeader;
    info.bmiHeader.biWidth = width;
    info.bmiHeader.biHeight = -height;
    info.bmiHeader.biPlanes = 1;
    info.bmiHeader.biBitCount = 32;
    info.bmiHeader.biCompression = BI_RGB;
    void* memory = nullptr;
    HBITMAP bitmap = CreateDIBSection(nullptr, &info, DIB_RGB_COLORS, &memory, nullptr, 0);
    *bits = static_cast<uint32_t*>(memory);
    return bitmap;
}

COLORREF ColourOfBits(uint32_t bits) {
    return RGB((bits >> 16) & 0xFF, (bits >> 8) & 0xFF, bits & 0xFF);
}

std::string ColourText(COLORREF colour) {
    char text[40];
    std::snprintf(text, sizeof text, "RGB(%d,%d,%d)", GetRValue(colour), GetGValue(colour),
                  GetBValue(colour));
    return text;
}

RECT Intersection(const RECT& a, const RECT& b) {
    return {std::max(a.left, b.left), std::max(a.top, b.top), std::min(a.right, b.right),
            std::min(a.bottom, b.bottom)};
}

void WriteLittleEndian(std::vector<BYTE>& bytes, size_t place, uint32_t value, int count) {
    for (int i = 0; i < count; ++i) {
        bytes[place + static_cast<size_t>(i)] = static_cast<BYTE>(value >> (8 * i));
    }
}

// File and information header of a 24-bit BMP with rows from the bottom.
std::vector<BYTE> BitmapFileHeader(int width, int height, size_t rowBytes) {
    constexpr uint32_t kHeaderBytes = 14 + 40;
    const auto imageBytes = static_cast<uint32_t>(rowBytes) * static_cast<uint32_t>(height);
    std::vector<BYTE> header(kHeaderBytes, 0);
    header[0] = 'B';
    header[1] = 'M';
    WriteLittleEndian(header, 2, kHeaderBytes + imageBytes, 4);
    WriteLittleEndian(header, 10, kHeaderBytes, 4);
    WriteLittleEndian(header, 14, 40, 4);
    WriteLittleEndian(header, 18, static_cast<uint32_t>(width), 4);
    WriteLittleEndian(header, 22, static_cast<uint32_t>(height), 4);
    WriteLittleEndian(header, 26, 1, 2);
    WriteLittleEndian(header, 28, 24, 2);
    WriteLittleEndian(header, 34, imageBytes, 4);
    return header;
}

}  // namespace

Picture::Picture(int width, int height, COLORREF colour)
    : width_(width), height_(height),
      pixels_(static_cast<size_t>(width) * static_cast<size_t>(height), colour) {}

bool Picture::contains(int x, int y) const { return x >= 0 && y >= 0 && x < width_ && y < height_; }

size_t Picture::place(int x, int y) const {
    return static_cast<size_t>(y) * static_cast<size_t>(width_) + static_cast<size_t>(x);
}

COLORREF Picture::pixel(int x, int y) const {
    return contains(x, y) ? pixels_[place(x, y)] : CLR_INVALID;
}

void Picture::setPixel(int x, int y, COLORREF colour) {
    if (contains(x, y)) pixels_[place(x, y)] = colour;
}

int Picture::count(COLORREF colour, const RECT& wanted) const {
    const RECT box = Intersection(wanted, area());
    int found = 0;
    for (int y = box.top; y < box.bottom; ++y) {
        for (int x = box.left; x < box.right; ++x) found += pixel(x, y) == colour;
    }
    return found;
}

RECT Picture::boundsOfOthers(COLORREF background, const RECT& wanted) const {
    const RECT box = Intersection(wanted, area());
    RECT bounds{box.right, box.bottom, box.left, box.top};
    for (int y = box.top; y < box.bottom; ++y) {
        for (int x = box.left; x < box.right; ++x) {
            if (pixel(x, y) == background) continue;
            bounds.left = std::min<LONG>(bounds.left, x);
            bounds.top = std::min<LONG>(bounds.top, y);
            bounds.right = std::max<LONG>(bounds.right, x + 1);
            bounds.bottom = std::max<LONG>(bounds.bottom, y + 1);
        }
    }
    return bounds.left < bounds.right ? bounds : RECT{0, 0, 0, 0};
}

Picture Picture::part(const RECT& wanted) const {
    const RECT box = Intersection(wanted, area());
    if (box.left >= box.right || box.top >= box.bottom) return {};
    Picture copy(box.right - box.left, box.bottom - box.top, 0);
    for (int y = 0; y < copy.height_; ++y) {
        for (int x = 0; x < copy.width_; ++x) {
            copy.setPixel(x, y, pixel(box.left + x, box.top + y));
        }
    }
    return copy;
}

Picture ReadDC(HDC dc, const RECT& area) {
    Canvas canvas(area.right - area.left, area.bottom - area.top, 0);
    BitBlt(canvas.dc(), 0, 0, area.right - area.left, area.bottom - area.top, dc, area.left,
           area.top, SRCCOPY);
    return canvas.picture();
}

Picture ReadWindow(HWND window) {
    RECT client{};
    GetClientRect(window, &client);
    HDC dc = GetDCEx(window, nullptr, DCX_CACHE);  // the class's or window's clipping left aside
    Picture picture = ReadDC(dc, client);
    ReleaseDC(window, dc);
    return picture;
}

std::string FirstDifference(const Picture& expected, const Picture& actual) {
    std::ostringstream text;
    if (expected.width() != actual.width() || expected.height() != actual.height()) {
        text << "size " << actual.width() << " x " << actual.height() << " instead of "
             << expected.width() << " x " << expected.height();
        return text.str();
    }
    int differences = 0;
    for (int y = 0; y < expected.height(); ++y) {
        for (int x = 0; x < expected.width(); ++x) {
            if (expected.pixel(x, y) == actual.pixel(x, y)) continue;
            if (differences++) continue;
            text << "pixel (" << x << "," << y << ") is " << ColourText(actual.pixel(x, y))
                 << " instead of " << ColourText(expected.pixel(x, y));
        }
    }
    if (differences) text << "; " << differences << " pixels differ";
    return text.str();
}

::testing::AssertionResult SamePicture(const Picture& expected, const Picture& actual) {
    const std::string difference = FirstDifference(expected, actual);
    if (difference.empty()) return ::testing::AssertionSuccess();
    return ::testing::AssertionFailure() << difference;
}

bool SavePicture(const Picture& picture, const std::string& path) {
    const size_t rowBytes = (static_cast<size_t>(picture.width()) * 3 + 3) / 4 * 4;
    std::vector<BYTE> bytes = BitmapFileHeader(picture.width(), picture.height(), rowBytes);
    for (int y = picture.height() - 1; y >= 0; --y) {
        const size_t rowEnd = bytes.size() + rowBytes;
        for (int x = 0; x < picture.width(); ++x) {
            const COLORREF colour = picture.pixel(x, y);
            bytes.insert(bytes.end(), {GetBValue(colour), GetGValue(colour), GetRValue(colour)});
        }
        bytes.resize(rowEnd, 0);
    }
    std::unique_ptr<FILE, int (*)(FILE*)> file(std::fopen(path.c_str(), "wb"), std::fclose);
    return file && std::fwrite(bytes.data(), 1, bytes.size(), file.get()) == bytes.size();
}

Canvas::Canvas(int width, int height, COLORREF colour)
    : width_(width), height_(height), dc_(CreateCompatibleDC(nullptr)) {
    uint32_t* bits = nullptr;
    bitmap_ = CreatePixelBitmap(std::max(width, 1), std::max(height, 1), &bits);
    previous_ = SelectObject(dc_, bitmap_);
    HBRUSH brush = CreateSolidBrush(colour);
    const RECT all{0, 0, width, height};
    FillRect(dc_, &all, brush);
    DeleteObject(brush);
}

Canvas::~Canvas() {
    SelectObject(dc_, previous_);
    DeleteObject(bitmap_);
    DeleteDC(dc_);
}

Picture Canvas::picture() const {
    GdiFlush();
    DIBSECTION section{};
    GetObjectW(bitmap_, sizeof section, &section);
    const auto* bits = static_cast<const uint32_t*>(section.dsBm.bmBits);
    Picture picture(width_, height_, 0);
    for (int y = 0; y < height_; ++y) {
        for (int x = 0; x < width_; ++x) picture.setPixel(x, y, ColourOfBits(bits[y * width_ + x]));
    }
    return picture;
}

std::string RectText(const RECT& rect) {
    std::ostringstream text;
    text << '(' << rect.left << ',' << rect.top << ")-(" << rect.right << ',' << rect.bottom << ')';
    return text.str();
}

}  // namespace kortest

void PrintTo(const RECT& rect, std::ostream* stream) { *stream << kortest::RectText(rect); }

bool operator==(const RECT& a, const RECT& b) {
    return a.left == b.left && a.top == b.top && a.right == b.right && a.bottom == b.bottom;
}
