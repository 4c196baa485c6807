// SetCellValue in telling cases: rectangle, colours, fonts, "#", spans and what it leaves behind.
#include "grid/grid_fixture.h"

#include <algorithm>

namespace kortest {
namespace {

constexpr COLORREF kInk = RGB(0, 0, 0);
constexpr COLORREF kPaper = RGB(255, 255, 255);

class GridText : public GridTest {
protected:
    ~GridText() override {
        if (font) DeleteObject(font);
    }

    void start() {
        create(400, 300);
        PatBlt(imageDC, 0, 0, 400, 300, WHITENESS);
        spy.watchAll({"CreateFontIndirectW", "GetObjectW", "SelectObject", "DeleteObject",
                      "SetTextColor", "SetBkColor"});
        spy.clearCalls();
    }

    void makeFont(int height, int width = 0) {
        font = CreateFontW(height, width, 0, 0, 700, TRUE, 0, 0, DEFAULT_CHARSET, 0, 0, 0, 0,
                           L"Arial");
    }

    CellText value(const std::wstring& text) const {
        CellText made;
        made.cell = KORGRID_CELL(2, 3);
        made.text = text;
        made.font = font;
        return made;
    }

    // Draws one text over white, here and as stated, and compares.
    void compare(const CellText& text) {
        PatBlt(imageDC, 0, 0, 400, 300, WHITENESS);
        Canvas canvas(400, 300, kPaper);
        DrawExpectedText(canvas.dc(), expected, text);
        SetCellText(text);
        EXPECT_TRUE(SamePicture(canvas.picture(), image()));
    }

    // The rectangle that holds all ink.
    RECT inked() const { return image().boundsOfOthers(kPaper); }

    // The descriptions of the fonts that one call makes.
    std::vector<LOGFONTW> fontsOf(const CellText& text) {
        std::vector<LOGFONTW> made;
        spy.replace("CreateFontIndirectW", [&](ULONG_PTR* arguments) {
            made.push_back(*reinterpret_cast<const LOGFONTW*>(arguments[0]));
            return spy.callReal("CreateFontIndirectW", arguments);
        });
        SetCellText(text);
        spy.restore("CreateFontIndirectW");
        return made;
    }

    HFONT font = nullptr;
};

int WidthOf(HDC dc, const std::wstring& text) {
    RECT measured{};
    DrawTextW(dc, text.c_str(), -1, &measured, DT_CALCRECT);
    return static_cast<int>(measured.right);
}

// ---- Where ------------------------------------------------------------------------------------

TEST_F(GridText, LeftAlignedBeginsThreePixelsInOnePixelDown) {
    start();
    CellText text = value(L"\u2588\u2588\u2588\u2588\u2588\u2588\u2588\u2588\u2588");
    text.format = DT_NOPREFIX;
    Canvas canvas(400, 300, kPaper);
    RECT area = {153, expected.cellsTop() + 49, 207, expected.cellsTop() + 64};
    DrawTextW(canvas.dc(), text.text.c_str(), -1, &area, DT_NOPREFIX);
    SetCellText(text);
    EXPECT_TRUE(SamePicture(canvas.picture(), image()));
    EXPECT_LE(inked().right, 207) << "cut three pixels before the right edge";
    EXPECT_GE(inked().left, 153);
}

TEST_F(GridText, FormatZeroIsCentredInItsCell) {
    start();
    compare(value(L"ab&c"));
    CellText same = value(L"ab&c");
    const Picture with0 = image();
    same.format = DT_NOPREFIX | DT_VCENTER | DT_CENTER;
    compare(same);
    EXPECT_TRUE(SamePicture(with0, image()));
    const RECT ink = inked();
    EXPECT_NEAR(static_cast<double>(ink.left + ink.right) / 2, 180, 2);
}

TEST_F(GridText, EveryAlignment) {
    start();
    for (const UINT format :
         {UINT{DT_NOPREFIX}, UINT{DT_RIGHT}, UINT{DT_CENTER},
          UINT{DT_SINGLELINE | DT_VCENTER | DT_RIGHT}, UINT{DT_SINGLELINE | DT_BOTTOM},
          UINT{DT_WORDBREAK}, UINT{DT_NOCLIP | DT_RIGHT}, UINT{DT_EXPANDTABS}})
        for (const wchar_t* sample : {L"12", L"one two three four five six", L"a&b\tc\r\nd"}) {
            CellText text = value(sample);
            text.format = format;
            compare(text);
        }
}

// ---- Spans ------------------------------------------------------------------------------------

TEST_F(GridText, LeftAlignedTextKeepsItsSpanThoughItFits) {
    start();
    CellText text = value(L"right");
    text.format = DT_RIGHT;
    text.spanRight = 2;
    compare(text);
    EXPECT_GT(inked().left, 270) << "at the right of three columns";
    EXPECT_LE(inked().right, 330 - 3);
}

TEST_F(GridText, CentredTextThatFitsGoesBackToItsCell) {
    start();
    CellText text = value(L"mid");
    text.spanRight = 2;
    text.spanLeft = 1;
    compare(text);
    const RECT ink = inked();
    EXPECT_NEAR(static_cast<double>(ink.left + ink.right) / 2, 180, 2);
    text.keepSpan = 1;
    compare(text);
    const RECT kept = inked();
    EXPECT_NEAR(static_cast<double>(kept.left + kept.right) / 2, (90 + 330) / 2, 2);
}

// The default format has the centring bit, another one may have it too.
TEST_F(GridText, CentringBitOfAnyFormatCounts) {
    start();
    CellText text = value(L"mid");
    text.spanRight = 3;
    text.format = DT_CENTER | DT_SINGLELINE;
    compare(text);
    EXPECT_LT(inked().right, 210);
}

TEST_F(GridText, CentredTextTooWideStaysOverItsSpan) {
    start();
    CellText text = value(L"a text that is much wider than two columns of the grid");
    text.spanRight = 1;
    compare(text);
    const RECT ink = inked();
    EXPECT_GE(ink.left, 153);
    EXPECT_GT(ink.right, 250);
    EXPECT_LE(ink.right, 267);
}

// "Narrower" is strict: a text exactly as wide as the span is not taken back to its cell.
TEST_F(GridText, TextAsWideAsTheSpanStaysOverIt) {
    start();
    const std::wstring text = L"exactly as wide";
    const int textWidth = WidthOf(imageDC, text);
    ASSERT_GT(textWidth + 6, 60);
    for (const int more : {-1, 0, 1}) {
        SCOPED_TRACE(more);
        endColumnResize(3, textWidth + 6 - 60 + more);
        CellText each = value(text);
        each.spanRight = 1;
        compare(each);
    }
}

TEST_F(GridText, SpanToTheLeftStopsAtTheFirstVisibleColumn) {
    start();
    SetFirstVisibleCell(KORGRID_CELL(1, 0));
    expected.firstColumn = 1;
    expected.fitColumns(400);
    CellText text = value(L"x");
    text.format = DT_NOPREFIX;
    for (const LONG span : {1L, 2L, 3L, 100L, 70000L, 0x7FFFFFFFL}) {
        text.spanLeft = span;
        compare(text);
        EXPECT_LT(inked().left, 40) << span;
    }
    text.spanLeft = -1;
    compare(text);
    EXPECT_GT(inked().left, 90) << "a negative span to the left is none";
}

TEST_F(GridText, NegativeSpanToTheRightRunsPastTheClientArea) {
    start();
    CellText text = value(L"a text that runs over the columns at its right and on and on and on");
    text.format = DT_NOPREFIX;
    for (const LONG span : {-1L, -2L, -100000L}) {
        text.spanRight = span;
        compare(text);
        EXPECT_GT(inked().right, 390);
    }
    text = value(L"end");
    text.format = DT_RIGHT;
    text.spanRight = -1;
    endColumnResize(2, 12);  // the area ends 12 - 3 pixels past the client area's edge
    compare(text);
    EXPECT_EQ(inked().right, 400);
}

// ---- Too wide a text --------------------------------------------------------------------------

TEST_F(GridText, NumberTooWideBecomesAsManySharpsAsFit) {
    start();
    CellText text = value(L"123456789012");
    text.fitCheck = 1;
    compare(text);
    const int sharps = 54 / WidthOf(imageDC, L"#");
    ASSERT_GT(sharps, 2);
    Canvas canvas(400, 300, kPaper);
    RECT area = {153, expected.cellsTop() + 49, 207, expected.cellsTop() + 64};
    DrawTextW(canvas.dc(), std::wstring(static_cast<size_t>(sharps), L'#').c_str(), -1, &area,
              0x805);
    EXPECT_TRUE(SamePicture(canvas.picture(), image()));
}

TEST_F(GridText, SharpsUseTheDefaultFormat) {
    start();
    CellText text = value(L"123456789012");
    text.fitCheck = 1;
    text.format = DT_RIGHT | DT_SINGLELINE | DT_BOTTOM;
    compare(text);
}

TEST_F(GridText, TextThatFitsIsShownAsItIs) {
    start();
    const std::wstring text = L"8888";
    const int textWidth = WidthOf(imageDC, text);
    for (const int more : {-1, 0, 1}) {
        SCOPED_TRACE(more);
        endColumnResize(2, textWidth + 6 + more);
        CellText each = value(text);
        each.fitCheck = 1;
        compare(each);
    }
}

// With the check a fitting text is centred over its whole span.
TEST_F(GridText, CheckedTextStaysOverItsSpan) {
    start();
    CellText text = value(L"mid");
    text.spanRight = 2;
    text.fitCheck = 1;
    compare(text);
    const RECT ink = inked();
    EXPECT_NEAR(static_cast<double>(ink.left + ink.right) / 2, (150 + 330) / 2, 2);
}

TEST_F(GridText, NarrowCellsShowNoSharp) {
    start();
    for (const int width : {0, 1, 5, 6, 7, 12}) {
        SCOPED_TRACE(width);
        endColumnResize(2, width);
        CellText text = value(L"123456789");
        text.fitCheck = 1;
        compare(text);
        EXPECT_EQ(image().count(kPaper), 400 * 300);
    }
    endColumnResize(2, 6 + WidthOf(imageDC, L"#"));
    CellText text = value(L"123456789");
    text.fitCheck = 1;
    compare(text);
    EXPECT_NE(image().count(kPaper), 400 * 300);
}

TEST_F(GridText, AtMost255Sharps) {
    start();
    const int columnWidth = (255 * WidthOf(imageDC, L"#") + 400) / 10;
    for (int i = 0; i < 12; ++i) endColumnResize(i, columnWidth);
    SetFirstVisibleCell(0);
    expected.fitColumns(400);
    CellText text = value(std::wstring(2000, L'8'));
    text.cell = KORGRID_CELL(0, 3);
    text.fitCheck = 1;
    text.spanRight = 9;
    compare(text);
    EXPECT_NEAR(static_cast<double>(inked().left), 30 + 200, 10) << "255 are centred in the span";
}

TEST_F(GridText, EmptyTextDrawsNothing) {
    start();
    for (const DWORD check : {0u, 1u}) {
        CellText text = value(L"");
        text.fitCheck = check;
        compare(text);
        EXPECT_EQ(image().count(kPaper), 400 * 300);
    }
}

// ---- Colours ----------------------------------------------------------------------------------

TEST_F(GridText, ColoursAreSetInTheImage) {
    start();
    CellText text = value(L"colours");
    text.textColour = RGB(200, 10, 20);
    text.backColour = RGB(1, 250, 3);
    SetBkMode(imageDC, OPAQUE);
    SetCellText(text);
    EXPECT_EQ(GetTextColor(imageDC), text.textColour);
    EXPECT_EQ(GetBkColor(imageDC), text.backColour);
    EXPECT_GT(image().count(text.backColour), 100);
    EXPECT_EQ(GetBkMode(imageDC), OPAQUE);
    PatBlt(imageDC, 0, 0, 400, 300, WHITENESS);
    SetBkMode(imageDC, TRANSPARENT);
    SetCellText(text);
    EXPECT_EQ(image().count(text.backColour), 0);
    EXPECT_GT(image().count(text.textColour), 10);
    EXPECT_EQ(GetBkMode(imageDC), TRANSPARENT) << "nobody sets the mode";
}

TEST_F(GridText, BackgroundModeIsThePlatformsDefault) {
    start();
    const HDC fresh = CreateCompatibleDC(nullptr);
    EXPECT_EQ(GetBkMode(imageDC), GetBkMode(fresh));
    DeleteDC(fresh);
}

TEST_F(GridText, InvisibleCellSetsNoColours) {
    start();
    CellText text = value(L"x");
    text.cell = KORGRID_CELL(100, 100);
    text.textColour = RGB(9, 8, 7);
    SetCellText(text);
    EXPECT_EQ(spy.count("SetTextColor"), 0);
    EXPECT_EQ(spy.count("SelectObject"), 0);
}

// ---- Fonts ------------------------------------------------------------------------------------

TEST_F(GridText, At100PercentTheHostsFontItselfIsSelected) {
    makeFont(-20);
    start();
    EXPECT_TRUE(fontsOf(value(L"text")).empty());
    int selected = 0;
    for (const auto& call : spy.callsOf("SelectObject"))
        selected += call.arguments[1] == reinterpret_cast<ULONG_PTR>(font);
    EXPECT_EQ(selected, 1);
    EXPECT_EQ(spy.count("DeleteObject"), 0);
    compare(value(L"text"));
}

TEST_F(GridText, AtOtherZoomsAScaledFontIsMadeAndDeleted) {
    start();
    struct {
        unsigned zoom;
        int height, scaled;
    } const cases[] = {{2, -16, -8}, {2, 16, -8},   {8, -13, -26},   {8, 13, -26}, {3, -13, -9},
                       {3, 13, -9},  {1, -15, -3},  {1, 3, 0},       {1, -3, 0},   {5, -11, -13},
                       {6, 0, 0},    {7, -12, -21}, {1000, -2, -500}};
    for (const auto& each : cases) {
        SCOPED_TRACE(::testing::Message() << "zoom " << each.zoom << " height " << each.height);
        makeFont(each.height, 9);
        SetGridZoomLevel(each.zoom);
        SetFirstVisibleCell(0);
        spy.clearCalls();
        CellText text = value(L"text");
        text.cell = 0;
        const bool visible = GetNumberOfVisibleRows() > 0;
        const auto made = fontsOf(text);
        if (visible) {
            ASSERT_EQ(made.size(), 1u);
            LOGFONTW wanted{};
            GetObjectW(font, sizeof wanted, &wanted);
            wanted.lfHeight = each.scaled;
            wanted.lfWidth = 0;
            EXPECT_EQ(made[0].lfHeight, each.scaled);
            EXPECT_EQ(made[0].lfWidth, 0);
            EXPECT_EQ(made[0].lfWeight, 700);
            EXPECT_EQ(made[0].lfItalic, wanted.lfItalic);
            EXPECT_STREQ(made[0].lfFaceName, L"Arial");
            const ULONG_PTR handle = spy.callsOf("CreateFontIndirectW")[0].result;
            int deleted = 0;
            for (const auto& call : spy.callsOf("DeleteObject"))
                deleted += call.arguments[0] == handle;
            EXPECT_EQ(deleted, 1);
            EXPECT_EQ(NumberAt(spy.callsOf("GetObjectW")[0], 1), 92u);
        } else {
            EXPECT_TRUE(made.empty());
        }
        DeleteObject(font);
        font = nullptr;
    }
}

TEST_F(GridText, WithoutAFontNothingIsSelectedAtAnyZoom) {
    start();
    for (const unsigned zoom : {4u, 2u, 7u}) {
        SetGridZoomLevel(zoom);
        expected.zoom = zoom;
        refit();
        spy.clearCalls();
        CellText text = value(L"text");
        text.font = nullptr;
        SetCellText(text);
        EXPECT_EQ(spy.count("CreateFontIndirectW"), 0);
        EXPECT_EQ(spy.count("SelectObject"), 0);
        compare(text);
    }
}

TEST_F(GridText, PreviousFontComesBack) {
    makeFont(-20);
    start();
    const HFONT own = CreateFontW(-9, 0, 0, 0, 400, 0, 0, 0, DEFAULT_CHARSET, 0, 0, 0, 0, L"");
    SelectObject(imageDC, own);
    for (const unsigned zoom : {4u, 2u, 7u}) {
        SetGridZoomLevel(zoom);
        for (const DWORD check : {0u, 1u}) {
            CellText text = value(L"a rather long text");
            text.fitCheck = check;
            SetCellText(text);
            EXPECT_EQ(GetCurrentObject(imageDC, OBJ_FONT), own);
        }
    }
    SelectObject(imageDC, GetStockObject(SYSTEM_FONT));
    DeleteObject(own);
}

TEST_F(GridText, FontThatCannotBeMadeIsDoneWithout) {
    makeFont(-20);
    start();
    SetGridZoomLevel(6);
    expected.zoom = 6;
    refit();
    const HGDIOBJ before = GetCurrentObject(imageDC, OBJ_FONT);
    spy.clearCalls();
    spy.failNth("CreateFontIndirectW", 1);
    PatBlt(imageDC, 0, 0, 400, 300, WHITENESS);
    SetCellText(value(L"text"));
    EXPECT_EQ(GetCurrentObject(imageDC, OBJ_FONT), before);
    EXPECT_EQ(spy.count("DeleteObject"), 0);
    EXPECT_NE(image().count(kPaper), 400 * 300) << "drawn in the image's own font";
}

}  // namespace
}  // namespace kortest
