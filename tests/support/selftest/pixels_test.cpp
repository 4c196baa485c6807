#include "support/pixels.h"

#include <gtest/gtest.h>

namespace kortest {
namespace {

constexpr COLORREF kWhite = RGB(255, 255, 255);
constexpr COLORREF kInk = RGB(10, 20, 30);

Picture PictureWithBlock(const RECT& block) {
    Canvas canvas(40, 30, kWhite);
    HBRUSH brush = CreateSolidBrush(kInk);
    FillRect(canvas.dc(), &block, brush);
    DeleteObject(brush);
    return canvas.picture();
}

TEST(Pixels, GiveColoursAsTheyWereDrawn) {
    const Picture picture = PictureWithBlock({5, 6, 9, 8});
    EXPECT_EQ(picture.pixel(5, 6), kInk);
    EXPECT_EQ(picture.pixel(4, 6), kWhite);
    EXPECT_EQ(picture.pixel(40, 0), CLR_INVALID);
    EXPECT_EQ(picture.pixel(0, -1), CLR_INVALID);
}

TEST(Pixels, CountAColourInARectangle) {
    const Picture picture = PictureWithBlock({5, 6, 9, 8});
    EXPECT_EQ(picture.count(kInk), 8);
    EXPECT_EQ(picture.count(kInk, {8, 7, 100, 100}), 1);
    EXPECT_EQ(picture.count(kInk, {9, 0, 40, 30}), 0);
}

TEST(Pixels, FindTheBoundsOfWhatWasDrawn) {
    const Picture picture = PictureWithBlock({5, 6, 9, 8});
    EXPECT_EQ(picture.boundsOfOthers(kWhite), (RECT{5, 6, 9, 8}));
    EXPECT_EQ(picture.boundsOfOthers(kWhite, {6, 0, 40, 7}), (RECT{6, 6, 9, 7}));
    EXPECT_EQ(picture.boundsOfOthers(kWhite, {20, 0, 40, 30}), (RECT{0, 0, 0, 0}));
}

TEST(Pixels, TellTheFirstDifference) {
    Picture one = PictureWithBlock({5, 6, 9, 8});
    Picture two = one;
    EXPECT_EQ(FirstDifference(one, two), "");
    two.setPixel(7, 7, kWhite);
    two.setPixel(6, 7, RGB(1, 2, 3));
    EXPECT_EQ(FirstDifference(one, two),
              "pixel (6,7) is RGB(1,2,3) instead of RGB(10,20,30); 2 pixels differ");
    EXPECT_FALSE(SamePicture(one, two));
    EXPECT_EQ(FirstDifference(one, Picture(3, 2, 0)), "size 3 x 2 instead of 40 x 30");
}

TEST(Pixels, CutOutAPart) {
    const Picture part = PictureWithBlock({5, 6, 9, 8}).part({4, 5, 6, 7});
    EXPECT_EQ(part.width(), 2);
    EXPECT_EQ(part.height(), 2);
    EXPECT_EQ(part.pixel(0, 0), kWhite);
    EXPECT_EQ(part.pixel(1, 1), kInk);
}

TEST(Pixels, ReadWhatAWindowShows) {
    HWND window = CreateWindowExW(0, L"STATIC", L"", WS_POPUP | WS_VISIBLE | SS_WHITERECT, 0, 0, 40,
                                  30, nullptr, nullptr, GetModuleHandleW(nullptr), nullptr);
    UpdateWindow(window);
    HDC dc = GetDC(window);
    SetPixel(dc, 3, 4, kInk);
    const Picture picture = ReadWindow(window);
    EXPECT_EQ(picture.width(), 40);
    EXPECT_EQ(picture.height(), 30);
    EXPECT_EQ(picture.boundsOfOthers(kWhite), (RECT{3, 4, 4, 5}));
    EXPECT_EQ(ReadDC(dc, {3, 3, 5, 6}).boundsOfOthers(kWhite), (RECT{0, 1, 1, 2}));
    ReleaseDC(window, dc);
    DestroyWindow(window);
}

}  // namespace
}  // namespace kortest
