// How the items are drawn: on which DC, which of them, and in which font.
#include "header_fixture.h"

#include "expected_strip.h"
#include "support/handle_balance.h"

namespace kortest {
namespace {

using Indexes = std::vector<int>;

class HeaderPaintingCalls : public HeaderTest {
protected:
    HeaderPaintingCalls() {
        spy.watchAll({"GetDC", "Rectangle", "DrawTextW", "ExtTextOutW", "CreateFontIndirectW",
                      "BeginPaint", "EndPaint", "GetCurrentObject"});
        spy.replace("CreateFontIndirectW", [this](ULONG_PTR* arguments) {
            fonts.push_back(*reinterpret_cast<const LOGFONTW*>(arguments[0]));
            return spy.callReal("CreateFontIndirectW", arguments);
        });
    }
    ~HeaderPaintingCalls() override { SetGridZoomLevel(4); }

    // Five items of 60 pixels in a strip of 400, painted once.
    void create(bool isVertical) {
        forget();
        header = isVertical ? createVertical(400) : createHorizontal(400);
        ownDC = reinterpret_cast<HDC>(spy.callsOf("GetDC")[0].result);
        AppendSizes(header, {60, 60, 60, 60, 60});
        Repaint(header);
        forget();
    }

    void forget() {
        spy.clearCalls();
        fonts.clear();
    }

    // The items whose outline, a box over the whole strip's thickness, is drawn for a part of the
    // strip.
    Indexes paintedWithin(int lowEdge, int highEdge) {
        forget();
        const bool isVertical = (GetWindowLongW(header, GWL_STYLE) & HCS_VERTICAL) != 0;
        const RECT area =
            isVertical ? RECT{0, lowEdge, 30, highEdge} : RECT{lowEdge, 0, highEdge, 16};
        InvalidateRect(header, &area, TRUE);
        UpdateWindow(header);
        Indexes items;
        for (const ImportCall& call : spy.callsOf("Rectangle")) {
            const auto value = [&](size_t i) { return static_cast<int>(call.arguments[i]); };
            const RECT box{value(1), value(2), value(3), value(4)};
            if (isVertical && box.left == 0 && box.right == 30) items.push_back(box.top / 60);
            if (!isVertical && box.top == 0 && box.bottom == 16) items.push_back(box.left / 60);
        }
        return items;
    }

    HWND header = nullptr;
    HDC ownDC = nullptr;
    std::vector<LOGFONTW> fonts;
};

TEST_F(HeaderPaintingCalls, GoToTheDCTakenAtCreation) {
    create(false);
    Repaint(header);
    EXPECT_EQ(spy.count("BeginPaint"), 1);
    EXPECT_EQ(spy.count("EndPaint"), 1);
    EXPECT_GE(spy.count("Rectangle"), 10);
    EXPECT_GE(spy.count("DrawTextW") + spy.count("ExtTextOutW"), 5);
    for (const char* name : {"Rectangle", "DrawTextW", "ExtTextOutW"}) {
        for (const ImportCall& call : spy.callsOf(name)) {
            EXPECT_EQ(call.arguments[0], reinterpret_cast<ULONG_PTR>(ownDC)) << name;
        }
    }
}

// Strictly beyond counts: an item that ends at the near edge is left out, one that starts at the
// far edge is not yet the last.
TEST_F(HeaderPaintingCalls, CoverTheUpdateRegionAndOneItemBehindIt) {
    for (bool isVertical : {false, true}) {
        create(isVertical);
        EXPECT_EQ(paintedWithin(0, 400), (Indexes{0, 1, 2, 3, 4}));
        EXPECT_EQ(paintedWithin(60, 100), (Indexes{1, 2}));
        EXPECT_EQ(paintedWithin(59, 100), (Indexes{0, 1, 2}));
        EXPECT_EQ(paintedWithin(61, 119), (Indexes{1, 2}));
        EXPECT_EQ(paintedWithin(60, 120), (Indexes{1, 2, 3}));
        EXPECT_EQ(paintedWithin(60, 121), (Indexes{1, 2, 3}));
        EXPECT_EQ(paintedWithin(0, 10), (Indexes{0, 1}));
        EXPECT_EQ(paintedWithin(299, 310), (Indexes{4}));
        EXPECT_EQ(paintedWithin(300, 310), (Indexes{}));
        EXPECT_EQ(paintedWithin(310, 400), (Indexes{}));
    }
}

TEST_F(HeaderPaintingCalls, LeaveTheDCAsItWas) {
    create(false);
    HGDIOBJ const pen = GetCurrentObject(ownDC, OBJ_PEN);
    HGDIOBJ const brush = GetCurrentObject(ownDC, OBJ_BRUSH);
    HGDIOBJ const font = GetCurrentObject(ownDC, OBJ_FONT);
    EXPECT_EQ(pen, GetStockObject(BLACK_PEN));
    EXPECT_EQ(brush, GetStockObject(WHITE_BRUSH));
    for (DWORD state : {DWORD{HIS_SELECTED}, DWORD{HIS_FRAMED}}) {
        KorHeader_SetItemState(header, 4, state);
        Repaint(header);
        EXPECT_EQ(GetCurrentObject(ownDC, OBJ_PEN), pen);
        EXPECT_EQ(GetCurrentObject(ownDC, OBJ_BRUSH), brush);
        EXPECT_EQ(GetCurrentObject(ownDC, OBJ_FONT), font);
    }
}

TEST_F(HeaderPaintingCalls, WriteNothingForAnEmptyLabel) {
    create(false);
    for (int i = 0; i < 5; ++i) SetItem(header, i, i % 2 ? L"" : nullptr, 60);
    forget();
    Repaint(header);
    EXPECT_EQ(spy.count("DrawTextW") + spy.count("ExtTextOutW"), 0);
}

struct FontCase {
    DWORD zoom;
    LONG height;
    LONG scaled;
};

class HeaderFont : public HeaderPaintingCalls, public ::testing::WithParamInterface<FontCase> {};

TEST_P(HeaderFont, IsTheDCsFontScaled) {
    const FontCase c = GetParam();
    create(false);
    LOGFONTW font{};
    font.lfHeight = c.height;
    font.lfWidth = 7;
    font.lfWeight = FW_BOLD;
    font.lfItalic = 1;
    lstrcpyW(font.lfFaceName, L"Arial");
    HFONT own = CreateFontIndirectW(&font);
    HGDIOBJ previous = SelectObject(ownDC, own);
    SetGridZoomLevel(c.zoom);
    forget();
    Repaint(header);
    EXPECT_GE(fonts.size(), 1u);
    for (const LOGFONTW& created : fonts) {
        EXPECT_EQ(created.lfHeight, c.scaled);
        EXPECT_EQ(created.lfWidth, 0);
        EXPECT_EQ(created.lfWeight, FW_BOLD);
        EXPECT_EQ(created.lfItalic, 1);
        EXPECT_STREQ(created.lfFaceName, L"Arial");
    }
    EXPECT_EQ(GetCurrentObject(ownDC, OBJ_FONT), own);
    SelectObject(ownDC, previous);
    DeleteObject(own);
}

// A positive height, that of a line, becomes the negative one of a letter.
INSTANTIATE_TEST_SUITE_P(Heights, HeaderFont,
                         ::testing::Values(FontCase{2, -16, -8}, FontCase{2, 16, -8},
                                           FontCase{4, -13, -13}, FontCase{4, 13, -13},
                                           FontCase{3, -13, -9}, FontCase{3, 13, -9},
                                           FontCase{8, -16, -32}, FontCase{1, -3, 0},
                                           FontCase{1, 3, 0}, FontCase{5, -13, -16}));

// A strip does not handle WM_SETFONT: its labels keep the DC's font.
TEST_F(HeaderPaintingCalls, KeepTheDCsFontWhenToldAnother) {
    create(false);
    const Picture before = ReadWindow(header);
    HFONT large = CreateFontW(-30, 0, 0, 0, FW_BOLD, 0, 0, 0, 0, 0, 0, 0, 0, L"Arial");
    SendMessageW(header, WM_SETFONT, reinterpret_cast<WPARAM>(large), TRUE);
    Repaint(header);
    EXPECT_TRUE(SamePicture(before, ReadWindow(header)));
    DeleteObject(large);
}

TEST_F(HeaderPaintingCalls, UseTheUnscaledFontWhenNoneCanBeMade) {
    create(false);
    SetGridZoomLevel(8);
    std::vector<StripItem> items;
    for (int i = 0; i < 5; ++i) items.push_back({std::to_wstring(i), 60, 0});
    const Picture scaled = ExpectedStrip({400, 16, false, 8, items});
    const Picture unscaled = ExpectedStrip({400, 16, false, 0, items});
    ASSERT_FALSE(SamePicture(scaled, unscaled));
    for (const char* function : {"CreateFontIndirectW", "GetCurrentObject"}) {
        Repaint(header);
        EXPECT_TRUE(SamePicture(scaled, ReadWindow(header)));
        spy.failAlways(function);
        Repaint(header);
        EXPECT_TRUE(SamePicture(unscaled, ReadWindow(header))) << function;
        spy.stopFailing(function);
    }
}

TEST_F(HeaderPaintingCalls, GiveBackEachScaledFont) {
    create(false);
    WatchHandles(spy);
    forget();
    for (int i = 0; i < 20; ++i) Repaint(header);
    EXPECT_GE(fonts.size(), 20u);
    EXPECT_EQ(UnreturnedHandles(spy), std::vector<std::string>{});
}

}  // namespace
}  // namespace kortest
