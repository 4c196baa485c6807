#include "sheet_images.h"

#include <array>

#include "open_sheets.h"

namespace workbook {

namespace {

constexpr COLORREF kTransparent = RGB(255, 0, 255);
constexpr COLORREF kPaper = RGB(255, 255, 255);
constexpr COLORREF kLines = RGB(160, 160, 160);
constexpr COLORREF kInk = RGB(64, 64, 64);
constexpr COLORREF kModified = RGB(230, 81, 0);

// Draws one image after the other and adds each to a list.
class ImageMaker {
public:
    ImageMaker()
        : list_(ImageList_Create(kImageSize, kImageSize, ILC_COLOR24 | ILC_MASK, 2, 8)),
          dc_(CreateCompatibleDC(nullptr)) {}
    ~ImageMaker() { DeleteDC(dc_); }
    ImageMaker(const ImageMaker&) = delete;
    ImageMaker& operator=(const ImageMaker&) = delete;

    HIMAGELIST list() const { return list_; }

    void fill(COLORREF colour, int left, int top, int right, int bottom) const {
        const RECT area = {left, top, right, bottom};
        SetBkColor(dc_, colour);
        ExtTextOutW(dc_, 0, 0, ETO_OPAQUE, &area, L"", 0, nullptr);
    }

    // draw() fills parts of an image that is transparent at first.
    template <typename Draw>
    void add(Draw draw) const {
        const HDC screen = GetDC(nullptr);
        const HBITMAP image = CreateCompatibleBitmap(screen, kImageSize, kImageSize);
        ReleaseDC(nullptr, screen);
        const HGDIOBJ previous = SelectObject(dc_, image);
        fill(kTransparent, 0, 0, kImageSize, kImageSize);
        draw();
        SelectObject(dc_, previous);
        ImageList_AddMasked(list_, image, kTransparent);
        DeleteObject(image);
    }

private:
    HIMAGELIST list_;
    HDC dc_;
};

// A page with a heading in the sheet's colour, and a mark in its corner when it is not saved.
void AddSheet(const ImageMaker& maker, COLORREF colour, bool isModified) {
    maker.add([&] {
        maker.fill(colour, 2, 1, 14, 15);
        maker.fill(kPaper, 3, 5, 13, 14);
        for (const int y : {8, 11}) maker.fill(kLines, 3, y, 13, y + 1);
        for (const int x : {6, 10}) maker.fill(kLines, x, 5, x + 1, 14);
        if (!isModified) return;
        maker.fill(kPaper, 8, 8, 16, 16);
        maker.fill(kModified, 9, 9, 15, 15);
    });
}

void AddNumbers(const ImageMaker& maker) {
    maker.add([&] {
        maker.fill(kInk, 2, 9, 5, 14);
        maker.fill(kInk, 6, 6, 9, 14);
        maker.fill(kInk, 10, 3, 13, 14);
    });
}

void AddTexts(const ImageMaker& maker) {
    maker.add([&] {
        for (const int y : {4, 7, 10}) maker.fill(kInk, 2, y, 14, y + 1);
        maker.fill(kInk, 2, 13, 9, 14);
    });
}

void AddSeries(const ImageMaker& maker, COLORREF colour) {
    maker.add([&] {
        maker.fill(kInk, 2, 2, 14, 14);
        maker.fill(colour, 3, 3, 13, 13);
    });
}

}  // namespace

int SheetImage(int colour, bool isModified) { return colour * 2 + (isModified ? 1 : 0); }

HIMAGELIST CreateSheetImages() {
    const ImageMaker maker;
    for (int colour = 0; colour < kSheetColours; ++colour) {
        AddSheet(maker, SheetColour(colour), false);
        AddSheet(maker, SheetColour(colour), true);
    }
    AddNumbers(maker);
    AddTexts(maker);
    return maker.list();
}

HIMAGELIST CreateColumnImages(const std::vector<COLORREF>& series) {
    const ImageMaker maker;
    AddNumbers(maker);
    AddTexts(maker);
    for (const COLORREF colour : series) AddSeries(maker, colour);
    return maker.list();
}

}  // namespace workbook
