// Pictures of windows and DCs as arrays of pixels.
#pragma once

#include <gtest/gtest.h>
#include <windows.h>

#include <string>
#include <vector>

namespace kortest {

class Picture {
public:
    Picture() = default;
    Picture(int width, int height, COLORREF colour);

    int width() const { return width_; }
    int height() const { return height_; }
    RECT area() const { return {0, 0, width_, height_}; }

    // CLR_INVALID outside the picture.
    COLORREF pixel(int x, int y) const;
    void setPixel(int x, int y, COLORREF colour);

    // Pixels of a colour, in a rectangle (ends exclusive, cut to the picture) or altogether.
    int count(COLORREF colour, const RECT& area) const;
    int count(COLORREF colour) const { return count(colour, area()); }

    // Smallest rectangle around every pixel of another colour; empty when there is none.
    RECT boundsOfOthers(COLORREF background) const { return boundsOfOthers(background, area()); }
    RECT boundsOfOthers(COLORREF background, const RECT& area) const;

    Picture part(const RECT& area) const;

    bool operator==(const Picture& other) const = default;

private:
    bool contains(int x, int y) const;
    size_t place(int x, int y) const;

    int width_ = 0;
    int height_ = 0;
    std::vector<COLORREF> pixels_;  // rows from the top
};

// What a DC shows now, in its device coordinates; what a window's client area shows, children
// included. Nothing is painted for it: let pending WM_PAINT messages through first.
Picture ReadDC(HDC dc, const RECT& area);
Picture ReadWindow(HWND window);

// Empty when the pictures are equal, else the first difference (by rows) and their number.
std::string FirstDifference(const Picture& expected, const Picture& actual);

// EXPECT_TRUE(SamePicture(expected, actual)).
::testing::AssertionResult SamePicture(const Picture& expected, const Picture& actual);

// Writes a 24-bit BMP, to look at when a test fails.
bool SavePicture(const Picture& picture, const std::string& path);

// A 32-bit bitmap of the test's own, to draw an expected picture with GDI.
class Canvas {
public:
    Canvas(int width, int height, COLORREF colour);
    ~Canvas();
    Canvas(const Canvas&) = delete;
    Canvas& operator=(const Canvas&) = delete;

    HDC dc() const { return dc_; }
    Picture picture() const;

private:
    int width_;
    int height_;
    HDC dc_;
    HBITMAP bitmap_;
    HGDIOBJ previous_;
};

std::string RectText(const RECT& rect);  // "(left,top)-(right,bottom)"

}  // namespace kortest

// For GoogleTest's messages.
void PrintTo(const RECT& rect, std::ostream* stream);
bool operator==(const RECT& a, const RECT& b);
