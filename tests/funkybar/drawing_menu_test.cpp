// Size and look of the menu's entries, compared with plain GDI calls of the test's own.
#include "funkybar/bar_fixture.h"

namespace kortest {
namespace {

constexpr COLORREF kRed = RGB(255, 0, 0);
constexpr COLORREF kBlue = RGB(0, 0, 255);
constexpr RECT kArea = {7, 5, 127, 25};

struct Expected {
    const wchar_t* text;
    int imageWidth = 0;
    int imageHeight = 0;
    COLORREF image = 0;
    bool selected = false;
    COLORREF textColour = CLR_INVALID;
};

class BarMenuDrawing : public BarTest {
protected:
    BarMenuDrawing() {
        create();
        replaceMenu([] { return 0; });
    }

    ULONG_PTR entry(size_t index) {
        press();
        return entries.at(index).data;
    }

    Picture drawn(ULONG_PTR data, UINT itemState = 0) {
        Canvas canvas(140, 30, RGB(9, 8, 7));
        SetTextColor(canvas.dc(), RGB(20, 30, 40));
        EXPECT_EQ(draw(canvas.dc(), kArea, data, itemState), 1);
        EXPECT_EQ(GetTextColor(canvas.dc()), RGB(20, 30, 40)) << "put back";
        EXPECT_EQ(GetBkMode(canvas.dc()), OPAQUE);
        return canvas.picture();
    }

    static Picture expected(const Expected& want) {
        Canvas canvas(140, 30, RGB(9, 8, 7));
        HDC dc = canvas.dc();
        FillRect(dc, &kArea, GetSysColorBrush(want.selected ? COLOR_HIGHLIGHT : COLOR_MENU));
        if (want.imageWidth) {
            const RECT image = {kArea.left + 2, kArea.top + 2, kArea.left + 2 + want.imageWidth,
                                kArea.top + 2 + want.imageHeight};
            HBRUSH brush = CreateSolidBrush(want.image);
            FillRect(dc, &image, brush);
            DeleteObject(brush);
        }
        SetTextColor(dc, want.selected ? GetSysColor(COLOR_HIGHLIGHTTEXT) : RGB(20, 30, 40));
        if (want.textColour != CLR_INVALID) SetTextColor(dc, want.textColour);
        SetBkMode(dc, TRANSPARENT);
        RECT text = kArea;
        text.left += 2 + want.imageWidth + 4;
        DrawTextW(dc, want.text, -1, &text, DT_VCENTER);
        return canvas.picture();
    }

    SIZE textSize(const wchar_t* text) const {
        const HDC dc = GetDC(bar);
        SIZE size{};
        GetTextExtentPoint32W(dc, text, lstrlenW(text), &size);
        ReleaseDC(bar, dc);
        return size;
    }

    SIZE measured(ULONG_PTR data) const {
        SIZE size{};
        EXPECT_EQ(measure(data, &size), 1);
        return size;
    }

    FunkyBarItemDesc withImage(const wchar_t* text, LONG image) const {
        FunkyBarItemDesc item = described(text);
        item.mask |= FBIF_IMAGE;
        item.image = image;
        return item;
    }
};

TEST_F(BarMenuDrawing, OfAText) {
    insert(L"Some text");
    EXPECT_TRUE(SamePicture(expected({L"Some text"}), drawn(entry(0))));
}

TEST_F(BarMenuDrawing, OfASelectedText) {
    insert(L"Some text");
    Expected want{L"Some text"};
    want.selected = true;
    EXPECT_TRUE(SamePicture(expected(want), drawn(entry(0), ODS_SELECTED | ODS_FOCUS)));
}

TEST_F(BarMenuDrawing, OfAnImageAndAText) {
    KorFunkyBar_SetImageList(bar, makeImages(14, 10, {kBlue, kRed}));
    insert(withImage(L"Red", 1));
    EXPECT_TRUE(SamePicture(expected({L"Red", 14, 10, kRed}), drawn(entry(0))));
}

TEST_F(BarMenuDrawing, WithTheItemsColour) {
    FunkyBarItemDesc item = described(L"Blue");
    item.mask |= FBIF_COLOURS;
    item.textColour = kBlue;
    item.backgroundColour = kRed;
    insert(item);
    Expected want{L"Blue"};
    want.textColour = kBlue;
    EXPECT_TRUE(SamePicture(expected(want), drawn(entry(0)))) << "its background does not show";
    want.selected = true;
    EXPECT_TRUE(SamePicture(expected(want), drawn(entry(0), ODS_SELECTED)));
}

TEST_F(BarMenuDrawing, WithoutAnImageListLeavesNoRoomForTheImage) {
    insert(withImage(L"text", 0));
    EXPECT_TRUE(SamePicture(expected({L"text"}), drawn(entry(0))));
    EXPECT_EQ(measured(entry(0)).cx, textSize(L"text").cx + 6);
}

TEST_F(BarMenuDrawing, OfAnImageThatIsNotInTheList) {
    KorFunkyBar_SetImageList(bar, makeImages(14, 10, {kBlue}));
    for (const LONG image : {1L, -1L, 0x7FFFFFFFL}) {
        FunkyBarItemDesc item = withImage(L"text", image);
        item.index = 0;
        insert(item);
        EXPECT_TRUE(SamePicture(expected({L"text"}), drawn(entry(0)))) << image;
    }
}

TEST_F(BarMenuDrawing, OfADestroyedImageList) {
    const HIMAGELIST images = ImageList_Create(14, 10, ILC_COLOR24, 1, 1);
    KorFunkyBar_SetImageList(bar, images);
    insert(withImage(L"text", 0));
    ImageList_Destroy(images);
    EXPECT_TRUE(SamePicture(expected({L"text"}), drawn(entry(0))));
    EXPECT_EQ(measured(entry(0)).cx, textSize(L"text").cx + 6);
}

TEST_F(BarMenuDrawing, AsksForTheWholeTextAndTheImageOnItsBackground) {
    KorFunkyBar_SetImageList(bar, makeImages(14, 10, {kBlue}));
    insert(withImage(L"text", 0));
    const ULONG_PTR data = entry(0);
    spy.watchAll({"DrawTextW", "ImageList_Draw"});
    drawn(data);
    ASSERT_EQ(spy.count("DrawTextW"), 1);
    const ImportCall text = spy.callsOf("DrawTextW")[0];
    EXPECT_EQ(static_cast<int>(text.arguments[2]), -1);
    EXPECT_EQ(static_cast<UINT>(text.arguments[4]), UINT{DT_VCENTER});
    ASSERT_EQ(spy.count("ImageList_Draw"), 1);
    EXPECT_EQ(static_cast<UINT>(spy.callsOf("ImageList_Draw")[0].arguments[5]), UINT{ILD_NORMAL});
}

TEST_F(BarMenuDrawing, MeasuresAText) {
    insert(L"Some text");
    const SIZE text = textSize(L"Some text");
    const SIZE size = measured(entry(0));
    EXPECT_EQ(size.cx, text.cx + 6);
    EXPECT_EQ(size.cy, text.cy);
}

TEST_F(BarMenuDrawing, MeasuresImages) {
    const SIZE text = textSize(L"text");
    const struct {
        int imageHeight;
        LONG expected;
    } cases[] = {{static_cast<int>(text.cy) - 1, text.cy},  // the text is taller
                 {static_cast<int>(text.cy), text.cy + 2},
                 {static_cast<int>(text.cy) + 5, text.cy + 7}};
    insert(withImage(L"text", 0));
    for (const auto& each : cases) {
        KorFunkyBar_SetImageList(bar, makeImages(21, each.imageHeight, {kRed}));
        const SIZE size = measured(entry(0));
        EXPECT_EQ(size.cx, text.cx + 21 + 6);
        EXPECT_EQ(size.cy, each.expected) << each.imageHeight;
    }
}

TEST_F(BarMenuDrawing, MeasuresOnTheBarsOwnDC) {
    insert(L"text");
    const ULONG_PTR data = entry(0);
    spy.watchAll({"GetDC", "ReleaseDC"});
    spy.clearCalls();
    measured(data);
    ASSERT_EQ(spy.count("GetDC"), 1);
    EXPECT_EQ(reinterpret_cast<HWND>(spy.callsOf("GetDC")[0].arguments[0]), bar);
    EXPECT_EQ(spy.count("ReleaseDC"), 1);
}

}  // namespace
}  // namespace kortest
