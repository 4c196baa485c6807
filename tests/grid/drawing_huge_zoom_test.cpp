// Texts at zooms at which a letter is larger than the window: where nothing of them is to be seen,
// their letters are not made, and the pixels are those of DrawTextW all the same.
#include "grid/grid_fixture.h"

namespace kortest {
namespace {

class GridHugeZoom : public GridTest, public ::testing::WithParamInterface<UINT> {
protected:
    GridHugeZoom() : GridTest(260, 140) {}
    ~GridHugeZoom() override { DeleteObject(font); }

    void SetUp() override {
        create(260, 140);
        ToggleViewStateOfHeaders();
        spy.watch("ExtTextOutW");
    }

    // The grid's cell as it is drawn plainly.
    void drawPlainly(const Picture& before, const wchar_t* text, DWORD zoom) {
        ShowPicture(before);
        LOGFONTW description{};
        GetObjectW(font, sizeof description, &description);
        description.lfHeight = -static_cast<LONG>(zoom * 13 / 4);
        const HFONT zoomed = CreateFontIndirectW(&description);
        const HGDIOBJ previous = SelectObject(imageDC, zoomed);
        RECT box = cellBox(zoom);
        DrawTextW(imageDC, text, -1, &box, GetParam() | DT_NOPREFIX);
        SelectObject(imageDC, previous);
        DeleteObject(zoomed);
    }

    void ShowPicture(const Picture& picture) {
        for (int y = 0; y < picture.height(); ++y) {
            for (int x = 0; x < picture.width(); ++x) SetPixel(imageDC, x, y, picture.pixel(x, y));
        }
    }

    // The text's area in A1: the cell, less its margins.
    RECT cellBox(DWORD zoom) const {
        const int width = static_cast<WORD>(zoom * 15);
        const int height = static_cast<WORD>(zoom * 4);
        return {3, expected.equationBarHeight + 1, width - 3, expected.equationBarHeight + height};
    }

    HFONT font = CreateFontW(-13, 0, 0, 0, FW_NORMAL, FALSE, FALSE, FALSE, DEFAULT_CHARSET, 0, 0, 0,
                             0, L"Arial");
};

TEST_P(GridHugeZoom, HasThePixelsOfDrawText) {
    for (const DWORD zoom : {300u, 640u, 1000u, 2000u}) {
        for (const wchar_t* text : {L"1, 2", L"A", L"\u00c5g", L"_", L"W"}) {
            SetGridZoomLevel(zoom);
            const Picture before = image();
            SetCellValue(KORGRID_CELL(0, 0), text, font, RGB(0, 0, 90), RGB(255, 250, 200),
                         GetParam() | DT_NOPREFIX, 0, 0, FALSE, FALSE);
            const Picture drawn = image();
            drawPlainly(before, text, zoom);
            EXPECT_TRUE(SamePicture(drawn, image())) << zoom << " " << Narrow(text);
        }
    }
}

TEST_P(GridHugeZoom, MakesNoLettersThatAreOutOfView) {
    SetGridZoomLevel(2000);
    settle();
    SetCellValue(KORGRID_CELL(0, 0), L"W", font, RGB(0, 0, 90), RGB(255, 250, 200),
                 GetParam() | DT_NOPREFIX, 0, 0, FALSE, FALSE);
    int letters = 0;
    for (const ImportCall& call : spy.callsOf("ExtTextOutW")) {
        const bool inImage = reinterpret_cast<HDC>(call.arguments[0]) == imageDC;
        letters += inImage && NumberAt(call, 6) > 0;
    }
    EXPECT_GT(spy.count("ExtTextOutW"), 0);
    EXPECT_EQ(letters, 0);
}

INSTANTIATE_TEST_SUITE_P(Aligned, GridHugeZoom, ::testing::Values(DT_LEFT, DT_CENTER, DT_RIGHT));

}  // namespace
}  // namespace kortest
