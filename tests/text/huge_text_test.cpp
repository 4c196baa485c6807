// Which texts of a huge font may show ink on a small surface, and the background that those leave
// that do not.
#include "text/huge_text.h"

#include "text_canvas.h"

#include <gtest/gtest.h>

namespace {

using namespace kortest;

constexpr RECT kSurface = {0, 0, kWidth, kHeight};
constexpr COLORREF kGround = RGB(250, 0, 0);

class HugeText : public ::testing::Test {
protected:
    ~HugeText() override { useFont(nullptr); }

    void selectFont(LONG height) {
        useFont(CreateFontW(height, 0, 0, 0, FW_NORMAL, FALSE, FALSE, FALSE, DEFAULT_CHARSET, 0, 0,
                            0, 0, L"Arial"));
    }

    bool mayShow(POINT at, const RECT& surface = kSurface) const {
        return kor::MayShowInk(canvas.dc(), L"H", 1, at, surface);
    }

    // Where the canvas is not white any more.
    RECT marked() const {
        RECT found = {kWidth, kHeight, 0, 0};
        const std::vector<uint32_t> pixels = canvas.pixels();
        for (LONG i = 0; i < kWidth * kHeight; ++i) {
            if ((pixels[static_cast<size_t>(i)] & 0xFFFFFF) == 0xFFFFFF) continue;
            found.left = std::min(found.left, i % kWidth);
            found.right = std::max(found.right, i % kWidth + 1);
            found.top = std::min(found.top, i / kWidth);
            found.bottom = std::max(found.bottom, i / kWidth + 1);
        }
        return found;
    }

    void drawBackground(POINT at, int width, const RECT& area, int mode = OPAQUE) const {
        canvas.clear();
        SetBkColor(canvas.dc(), kGround);
        SetBkMode(canvas.dc(), mode);
        kor::DrawTextBackground(canvas.dc(), at, width, area);
    }

    void expectMarked(const RECT& area) const {
        const RECT found = marked();
        EXPECT_TRUE(EqualRect(&found, &area))
            << found.left << " " << found.top << " " << found.right << " " << found.bottom;
    }

    const Canvas canvas;

private:
    void useFont(HFONT font) {
        SelectObject(canvas.dc(), font ? font : GetStockObject(SYSTEM_FONT));
        if (font_) DeleteObject(font_);
        font_ = font;
    }

    HFONT font_ = nullptr;
};

TEST_F(HugeText, OfAUsualSizeAlwaysMayShowInk) {
    for (const LONG height : {-13, 13, -2047, 2047}) {
        selectFont(height);
        EXPECT_TRUE(mayShow({-30000, 0})) << height;
    }
}

TEST_F(HugeText, ShowsNoneFarFromItsLetters) {
    for (const LONG height : {-2048, 2048, -30000, 30000}) {
        selectFont(height);
        EXPECT_FALSE(mayShow({-100000, 0})) << height;
        EXPECT_FALSE(mayShow({1000, 0})) << height;
        EXPECT_FALSE(mayShow({0, -100000})) << height;
        EXPECT_FALSE(mayShow({0, 3000})) << height;
    }
}

TEST_F(HugeText, ShowsInkWhereALetterCoversTheSurface) {
    for (const LONG height : {-2048, 2048, -30000, 30000}) {
        selectFont(height);
        TEXTMETRICW metrics = {};
        ASSERT_TRUE(GetTextMetricsW(canvas.dc(), &metrics));
        // The left stem and the bar of an H cross here.
        EXPECT_TRUE(mayShow({-std::abs(height) / 8, -metrics.tmAscent / 2})) << height;
    }
}

TEST_F(HugeText, IsTakenToShowInkWhereThatCannotBeFoundOut) {
    EXPECT_TRUE(kor::MayShowInk(nullptr, L"H", 1, {0, 0}, kSurface)) << "no DC";
    selectFont(-2048);
    EXPECT_TRUE(mayShow({-100000, 0}, {0, 0, 80000, 10})) << "too wide a surface";
    EXPECT_TRUE(mayShow({-100000, 0}, {0, 0, 10, 80000})) << "too high a surface";
    EXPECT_FALSE(mayShow({-100000, 0}, {0, 0, 1000, 1000}));
}

TEST_F(HugeText, LeavesItsBackgroundWithinTheArea) {
    selectFont(-2048);
    drawBackground({-100, -100}, 5000, {10, 5, 90, 30});
    expectMarked({10, 5, 90, 30});
    drawBackground({20, 7}, 30, {10, 5, 90, 30});
    expectMarked({20, 7, 50, 30});
    TEXTMETRICW metrics = {};
    GetTextMetricsW(canvas.dc(), &metrics);
    drawBackground({20, 9 - metrics.tmHeight}, 30, {10, 5, 90, 30});
    expectMarked({20, 5, 50, 9});
}

TEST_F(HugeText, LeavesNoBackgroundOutsideTheAreaOrWhereTheDeviceContextDrawsNone) {
    selectFont(-2048);
    const RECT nothing = {kWidth, kHeight, 0, 0};
    drawBackground({90, 0}, 30, {10, 5, 90, 30});
    expectMarked(nothing);
    drawBackground({0, 30}, 30, {10, 5, 90, 30});
    expectMarked(nothing);
    drawBackground({0, 0}, 5000, {10, 5, 90, 30}, TRANSPARENT);
    expectMarked(nothing);
    EXPECT_EQ(GetBkMode(canvas.dc()), TRANSPARENT);
}

}  // namespace
