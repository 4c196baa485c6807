// What the bar itself looks like, compared with plain GDI calls of the test's own.
#include "funkybar/bar_fixture.h"

namespace kortest {
namespace {

constexpr COLORREF kRed = RGB(255, 0, 0);
constexpr COLORREF kGreen = RGB(0, 255, 0);

struct Expected {
    const wchar_t* text = nullptr;
    bool hasImage = false;  // says so in its mask
    int imageWidth = 0;
    int imageHeight = 0;
    COLORREF image = 0;
    COLORREF textColour = CLR_INVALID;
    COLORREF background = CLR_INVALID;
};

// The arrow is black: rows of 11, 9, 7, 5, 3 and 1 pixels below an empty one.
void DrawArrow(HDC dc, int left, int top) {
    for (int row = 0; row < 6; ++row) {
        const RECT line = {left + 1 + row, top + 1 + row, left + 12 - row, top + 2 + row};
        FillRect(dc, &line, static_cast<HBRUSH>(GetStockObject(BLACK_BRUSH)));
    }
}

class BarDrawing : public BarTest {
protected:
    void createWide() { create(180, 25); }

    static HFONT makeFont() {
        LOGFONTW description{};
        GetObjectW(GetStockObject(SYSTEM_FONT), sizeof description, &description);
        const HDC dc = GetDC(nullptr);
        description.lfHeight = -10 * GetDeviceCaps(dc, LOGPIXELSY) / 72;
        ReleaseDC(nullptr, dc);
        description.lfWeight = FW_BOLD;
        return CreateFontIndirectW(&description);
    }

    Picture expected(const Expected& want) const {
        const RECT client = ClientOf(bar);
        Canvas canvas(static_cast<int>(client.right), static_cast<int>(client.bottom),
                      GetSysColor(COLOR_BTNFACE));
        if (!want.text) return canvas.picture();
        HDC dc = canvas.dc();
        HFONT font = makeFont();
        HGDIOBJ previous = SelectObject(dc, font);
        int x = 3;
        if (want.hasImage) {
            const int top = static_cast<int>(client.bottom) / 2 - want.imageHeight / 2;
            const RECT image = {3, top, 3 + want.imageWidth, top + want.imageHeight};
            HBRUSH brush = CreateSolidBrush(want.image);
            FillRect(dc, &image, brush);
            DeleteObject(brush);
            x = 3 + want.imageWidth + 3;
        }
        SetTextColor(dc, want.textColour == CLR_INVALID ? 0 : want.textColour);
        SetBkColor(dc,
                   want.background == CLR_INVALID ? GetSysColor(COLOR_BTNFACE) : want.background);
        RECT text = {x, 0, client.right, client.bottom};
        DrawTextW(dc, want.text, -1, &text, DT_VCENTER);
        SIZE size{};
        GetTextExtentPoint32W(dc, want.text, lstrlenW(want.text), &size);
        DrawArrow(dc, x + static_cast<int>(size.cx) + 6, static_cast<int>(client.bottom) - 13);
        SelectObject(dc, previous);
        DeleteObject(font);
        return canvas.picture();
    }

    Picture shown() {
        host.pump();
        return ReadWindow(bar);
    }
};

TEST_F(BarDrawing, WithoutItemsIsEmpty) {
    createWide();
    EXPECT_TRUE(SamePicture(expected({}), shown()));
}

TEST_F(BarDrawing, ShowsTheFirstItemByItself) {
    createWide();
    insertAll({L"Calendar", L"Contacts"});
    EXPECT_TRUE(SamePicture(expected({L"Calendar"}), shown()));
}

TEST_F(BarDrawing, HasItsArrow) {
    createWide();
    insert(L"");
    const Picture picture = shown();
    EXPECT_EQ(picture.count(RGB(0, 0, 0)), 11 + 9 + 7 + 5 + 3 + 1);
    EXPECT_EQ(RectText(picture.boundsOfOthers(GetSysColor(COLOR_BTNFACE))), "(10,13)-(21,19)");
}

TEST_F(BarDrawing, ShowsTheItemThatIsSelected) {
    createWide();
    insertAll({L"Calendar", L"Contacts"});
    settle();
    select(1);
    EXPECT_TRUE(SamePicture(expected({L"Contacts"}), ReadWindow(bar))) << "at once";
    select(0);
    EXPECT_TRUE(SamePicture(expected({L"Calendar"}), ReadWindow(bar))) << "nothing of the other";
}

TEST_F(BarDrawing, ShowsTheNextItemWhenTheFirstGoes) {
    createWide();
    insertAll({L"Calendar", L"Contacts"});
    settle();
    remove(0);
    EXPECT_TRUE(SamePicture(expected({L"Contacts"}), ReadWindow(bar)));
    remove(0);
    EXPECT_TRUE(SamePicture(expected({}), ReadWindow(bar)));
}

TEST_F(BarDrawing, ShowsNothingWithoutACurrentItem) {
    createWide();
    insertAll({L"Calendar", L"Contacts"});
    settle();
    select(-2);
    InvalidateRect(bar, nullptr, FALSE);
    EXPECT_TRUE(SamePicture(expected({}), shown()));
}

TEST_F(BarDrawing, WithAnImageOfEitherParity) {
    for (const int height : {10, 11, 17}) {
        create(180, 25);
        KorFunkyBar_SetImageList(bar, makeImages(12, height, {kRed, kGreen}));
        FunkyBarItemDesc item = described(L"Calendar");
        item.mask |= FBIF_IMAGE;
        item.image = 1;
        insert(item);
        const Expected want = {L"Calendar", true, 12, height, kGreen, CLR_INVALID, CLR_INVALID};
        EXPECT_TRUE(SamePicture(expected(want), shown())) << height;
        DestroyWindow(bar);
    }
}

TEST_F(BarDrawing, AsksForTheWholeTextAndSeeThroughImages) {
    createWide();
    KorFunkyBar_SetImageList(bar, makeImages(12, 10, {kRed}));
    FunkyBarItemDesc item = described(L"Calendar");
    item.mask |= FBIF_IMAGE;
    insert(item);
    settle();
    spy.watchAll({"DrawTextW", "ImageList_Draw"});
    InvalidateRect(bar, nullptr, FALSE);
    UpdateWindow(bar);
    ASSERT_EQ(spy.count("DrawTextW"), 1);
    const ImportCall text = spy.callsOf("DrawTextW")[0];
    EXPECT_EQ(static_cast<int>(text.arguments[2]), -1);
    EXPECT_EQ(static_cast<UINT>(text.arguments[4]), UINT{DT_VCENTER});
    const auto images = spy.callsOf("ImageList_Draw");
    ASSERT_EQ(images.size(), 2u) << "the item's and the arrow";
    for (const ImportCall& image : images)
        EXPECT_EQ(static_cast<UINT>(image.arguments[5]), UINT{ILD_TRANSPARENT});
}

TEST_F(BarDrawing, WithoutAnImageListKeepsTheGap) {
    createWide();
    FunkyBarItemDesc item = described(L"Calendar");
    item.mask |= FBIF_IMAGE;
    insert(item);
    EXPECT_TRUE(
        SamePicture(expected({L"Calendar", true, 0, 0, 0, CLR_INVALID, CLR_INVALID}), shown()));
}

TEST_F(BarDrawing, WithItsColours) {
    createWide();
    FunkyBarItemDesc item = described(L"Calendar");
    item.mask |= FBIF_COLOURS;
    item.textColour = RGB(200, 0, 100);
    item.backgroundColour = RGB(255, 255, 0);
    insert(item);
    insert(L"plain");
    EXPECT_TRUE(SamePicture(
        expected({L"Calendar", false, 0, 0, 0, RGB(200, 0, 100), RGB(255, 255, 0)}), shown()));
    select(1);
    EXPECT_TRUE(SamePicture(expected({L"plain"}), shown())) << "the next item has its own";
}

TEST_F(BarDrawing, OfALongTextEndsAtTheEdge) {
    create(60, 25);
    const std::wstring text(60, L'W');
    insert(text.c_str());
    EXPECT_TRUE(SamePicture(expected({text.c_str()}), shown()));
}

TEST_F(BarDrawing, OfADestroyedImageListDrawsTheRest) {
    createWide();
    const HIMAGELIST images = ImageList_Create(12, 12, ILC_COLOR24, 1, 1);
    KorFunkyBar_SetImageList(bar, images);
    FunkyBarItemDesc item = described(L"Calendar");
    item.mask |= FBIF_IMAGE;
    insert(item);
    ImageList_Destroy(images);
    EXPECT_TRUE(
        SamePicture(expected({L"Calendar", true, 0, 0, 0, CLR_INVALID, CLR_INVALID}), shown()));
}

TEST_F(BarDrawing, OfAnEmptyWindowDoesNothing) {
    create(0, 0);
    insert(L"Calendar");
    InvalidateRect(bar, nullptr, TRUE);
    UpdateWindow(bar);
    EXPECT_FALSE(GetUpdateRect(bar, nullptr, FALSE));
}

TEST_F(BarDrawing, ValidatesTheWindow) {
    createWide();
    insert(L"Calendar");
    EXPECT_TRUE(GetUpdateRect(bar, nullptr, FALSE));
    UpdateWindow(bar);
    EXPECT_FALSE(GetUpdateRect(bar, nullptr, FALSE));
}

}  // namespace
}  // namespace kortest
