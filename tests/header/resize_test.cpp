// Dragging a border.
#include "header_fixture.h"

#include "support/pixels.h"

namespace kortest {
namespace {

using Sizes = std::vector<int>;

// 400 pixels wide, three items of 60.
class HeaderResize : public HeaderTest {
protected:
    HeaderResize() { AppendSizes(header, {60, 60, 60}); }
    ~HeaderResize() override { ReleaseCapture(); }

    // Drags from one position to another and lets go there.
    void drag(HWND strip, int from, int to) {
        const bool isVertical = (GetWindowLongW(strip, GWL_STYLE) & HCS_VERTICAL) != 0;
        const auto at = [&](auto send, int position) {
            send(strip, isVertical ? 3 : position, isVertical ? position : 3);
        };
        at(PressAt, from);
        at(MoveTo, to);
        at(ReleaseAt, to);
    }
    void drag(int from, int to) { drag(header, from, to); }

    RECT updateRect() {
        RECT rect{};
        GetUpdateRect(header, &rect, FALSE);
        return rect;
    }

    HWND header = createHorizontal();
};

TEST_F(HeaderResize, TakesTheCaptureUntilTheRelease) {
    PressAt(header, 118, 3);
    EXPECT_EQ(GetCapture(), header);
    EXPECT_EQ(posted(), Lines{});
    ReleaseAt(header, 118, 3);
    EXPECT_EQ(GetCapture(), nullptr);
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMRESIZED column 1 60"});
}

TEST_F(HeaderResize, GrowsByTheWayOfThePointer) {
    PressAt(header, 118, 3);
    MoveTo(header, 128, 3);
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMRESIZING column 60 130"});
    EXPECT_EQ(SizesOf(header), (Sizes{60, 70, 60}));
    MoveTo(header, 131, 3);
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMRESIZING column 60 133"});
    ReleaseAt(header, 131, 3);
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMRESIZED column 1 73"});
    EXPECT_EQ(SizesOf(header), (Sizes{60, 73, 60}));
}

TEST_F(HeaderResize, ShrinksByTheWayOfThePointer) {
    PressAt(header, 124, 3);
    MoveTo(header, 114, 3);
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMRESIZING column 60 110"});
    MoveTo(header, 104, 3);
    MoveTo(header, 109, 3);
    ReleaseAt(header, 300, 3);  // where the button is released does not matter
    EXPECT_EQ(posted(), (Lines{"posted HCN_ITEMRESIZING column 60 100",
                               "posted HCN_ITEMRESIZING column 60 105",
                               "posted HCN_ITEMRESIZED column 1 45"}));
    EXPECT_EQ(SizesOf(header), (Sizes{60, 45, 60}));
}

TEST_F(HeaderResize, IsToldOnEveryMove) {
    PressAt(header, 58, 3);
    MoveTo(header, 58, 3);
    MoveTo(header, 60, 3);
    MoveTo(header, 60, 3);
    EXPECT_EQ(posted(),
              (Lines{"posted HCN_ITEMRESIZING column 0 60", "posted HCN_ITEMRESIZING column 0 62",
                     "posted HCN_ITEMRESIZING column 0 62"}));
}

TEST_F(HeaderResize, StopsAtThreePixels) {
    drag(118, 62);  // would leave 4
    EXPECT_EQ(SizesOf(header), (Sizes{60, 4, 60}));
    SetItem(header, 1, L"", 60);
    drag(118, 61);
    EXPECT_EQ(SizesOf(header), (Sizes{60, 3, 60}));
    SetItem(header, 1, L"", 60);
    drag(118, 60);
    EXPECT_EQ(SizesOf(header), (Sizes{60, 3, 60}));
}

TEST_F(HeaderResize, StopsAtThreePixelsLeftOfTheItemItself) {
    PressAt(header, 118, 3);
    MoveTo(header, 58, 3);  // exactly the item's size
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMRESIZING column 60 63"});
    MoveTo(header, 0, 3);
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMRESIZING column 60 63"});
    ReleaseAt(header, 0, 3);
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMRESIZED column 1 3"});
}

TEST_F(HeaderResize, RaisesATinyItemToThreePixels) {
    SetItem(header, 1, L"", 1);  // 60 to 61: its border is 61 - 5 to 61 + 5
    PressAt(header, 66, 3);
    MoveTo(header, 66, 3);
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMRESIZING column 60 63"});
}

TEST_F(HeaderResize, StopsTenPixelsBeforeTheStripsExtent) {
    PressAt(header, 58, 3);
    MoveTo(header, 387, 3);
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMRESIZING column 0 389"});
    MoveTo(header, 388, 3);
    MoveTo(header, 400, 3);
    EXPECT_EQ(posted(), (Lines{"posted HCN_ITEMRESIZING column 0 390",
                               "posted HCN_ITEMRESIZING column 0 390"}));
    ReleaseAt(header, 400, 3);
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMRESIZED column 0 390"});
}

TEST_F(HeaderResize, CutsAnItemThatIsTooLargeAlready) {
    SetItem(header, 0, L"", 350);
    createHorizontal(310);  // now at most 300
    PressAt(header, 348, 3);
    MoveTo(header, 347, 3);
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMRESIZING column 0 349"});
    MoveTo(header, 348, 3);
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMRESIZING column 0 300"});
}

TEST_F(HeaderResize, IgnoresMovesBeyondTheStrip) {
    PressAt(header, 58, 3);
    MoveTo(header, 401, 3);
    MoveTo(header, 32767, 3);
    MoveTo(header, -1, 3);
    MoveTo(header, -32768, 3);
    EXPECT_EQ(posted(), Lines{});
    MoveTo(header, 59, 3);  // goes on from 58
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMRESIZING column 0 61"});
    MoveTo(header, 0, 3);
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMRESIZING column 0 3"});
}

TEST_F(HeaderResize, GoesDownAVerticalStrip) {
    HWND rows = createVertical(300);
    AppendSizes(rows, {40, 40});
    PressAt(rows, 3, 78);
    MoveTo(rows, 500, 88);
    ReleaseAt(rows, 500, 88);
    EXPECT_EQ(posted(),
              (Lines{"posted HCN_ITEMRESIZING row 40 90", "posted HCN_ITEMRESIZED row 1 50"}));
    PressAt(rows, 3, 88);
    MoveTo(rows, 3, 301);
    MoveTo(rows, 3, -1);
    EXPECT_EQ(posted(), Lines{});
    MoveTo(rows, 3, 300);
    EXPECT_EQ(posted(), Lines{"posted HCN_ITEMRESIZING row 40 302"});  // 50 + 212
    ReleaseAt(rows, 3, 300);
    posted();
    drag(rows, 40, 300);
    EXPECT_EQ(SizesOf(rows), (Sizes{290, 262}));
}

TEST_F(HeaderResize, UsesTheBoundOfTheStripSizedLast) {
    HWND other = createHorizontal(300);
    AppendSizes(other, {60});
    drag(header, 58, 399);
    EXPECT_EQ(SizesOf(header)[0], 290);
    MoveWindow(header, 0, 0, 350, 16, FALSE);
    drag(other, 58, 300);
    EXPECT_EQ(SizesOf(other)[0], 302);  // 60 + 242, and at most 340
}

TEST_F(HeaderResize, KeepsOneBoundForEachDirection) {
    HWND rows = createVertical(100);
    AppendSizes(rows, {40});
    drag(header, 58, 399);
    EXPECT_EQ(SizesOf(header)[0], 390);
    MoveWindow(header, 0, 0, 60, 200, FALSE);
    drag(rows, 38, 100);
    EXPECT_EQ(SizesOf(rows)[0], 90);
}

TEST_F(HeaderResize, NeverHasABoundBelowThreePixels) {
    for (int width : {0, 5, 12, 13}) {
        createHorizontal(width);
        SetItem(header, 0, L"", 60);
        drag(header, 58, 59);
        EXPECT_EQ(SizesOf(header)[0], 3) << width;
    }
    createHorizontal(14);
    SetItem(header, 0, L"", 60);
    drag(header, 58, 59);
    EXPECT_EQ(SizesOf(header)[0], 4);
}

TEST_F(HeaderResize, NeverHasARowBoundBelowThreePixels) {
    HWND rows = createVertical(300);
    AppendSizes(rows, {60});
    for (int height : {0, 5, 12, 13}) {
        createVertical(height);
        SetItem(rows, 0, L"", 60);
        drag(rows, 58, 59);
        EXPECT_EQ(SizesOf(rows)[0], 3) << height;
    }
}

TEST_F(HeaderResize, TellsTheSizeAtFullZoom) {
    struct Case {
        DWORD zoom;
        int pixels;
        int units;
    };
    for (const Case& c : {Case{4, 60, 60}, Case{2, 40, 81}, Case{8, 40, 20}, Case{8, 41, 20},
                          Case{8, 43, 21}, Case{1, 40, 162}, Case{3, 40, 54}, Case{3, 41, 55},
                          Case{6, 100, 67}, Case{16, 3, 0}, Case{2, 3, 7}}) {
        SetGridZoomLevel(c.zoom);
        SetItem(header, 0, L"", c.pixels);
        const int end = c.pixels;
        PressAt(header, end + 5, 3);
        ReleaseAt(header, end + 5, 3);
        EXPECT_EQ(posted(), Lines{"posted HCN_ITEMRESIZED column 0 " + std::to_string(c.units)})
            << c.zoom << " " << c.pixels;
        EXPECT_EQ(SizesOf(header)[0], c.pixels);
    }
    SetGridZoomLevel(4);
}

TEST_F(HeaderResize, InvalidatesFromTheItemOn) {
    spy.watch("InvalidateRect");
    PressAt(header, 118, 3);
    Repaint(header);
    spy.clearCalls();
    MoveTo(header, 128, 3);
    EXPECT_EQ(updateRect(), (RECT{60, 0, 400, 16}));
    ASSERT_EQ(spy.count("InvalidateRect"), 1);
    EXPECT_EQ(static_cast<BOOL>(spy.callsOf("InvalidateRect")[0].arguments[2]), TRUE);
}

TEST_F(HeaderResize, InvalidatesFromTheRowOn) {
    HWND rows = createVertical(300);
    AppendSizes(rows, {40, 40});
    PressAt(rows, 3, 78);
    Repaint(rows);
    MoveTo(rows, 3, 79);
    RECT rect{};
    GetUpdateRect(rows, &rect, FALSE);
    EXPECT_EQ(rect, (RECT{0, 40, 30, 300}));
}

// The item's begin is multiplied by the zoom number, not by the factor it stands for.
TEST_F(HeaderResize, InvalidatesFromFarBehindTheItemWhenLetGo) {
    spy.watch("InvalidateRect");
    PressAt(header, 118, 3);
    Repaint(header);
    spy.clearCalls();
    ReleaseAt(header, 118, 3);
    EXPECT_EQ(updateRect(), (RECT{240, 0, 400, 16}));
    ASSERT_EQ(spy.count("InvalidateRect"), 1);
    EXPECT_EQ(static_cast<BOOL>(spy.callsOf("InvalidateRect")[0].arguments[2]), TRUE);

    SetGridZoomLevel(2);
    PressAt(header, 178, 3);
    Repaint(header);
    ReleaseAt(header, 178, 3);
    EXPECT_EQ(updateRect(), (RECT{240, 0, 400, 16}));

    PressAt(header, 58, 3);
    Repaint(header);
    ReleaseAt(header, 58, 3);
    EXPECT_EQ(updateRect(), (RECT{0, 0, 400, 16}));
    SetGridZoomLevel(4);
}

TEST_F(HeaderResize, InvalidatesDownAVerticalStripWhenLetGo) {
    HWND rows = createVertical(300);
    AppendSizes(rows, {40, 40});
    PressAt(rows, 3, 78);
    Repaint(rows);
    ReleaseAt(rows, 3, 78);
    RECT rect{};
    GetUpdateRect(rows, &rect, FALSE);
    EXPECT_EQ(rect, (RECT{0, 160, 30, 300}));
}

TEST_F(HeaderResize, EndsWithTheRelease) {
    drag(58, 70);
    posted();
    MoveTo(header, 100, 3);
    ReleaseAt(header, 100, 3);
    EXPECT_EQ(posted(), Lines{});
    EXPECT_EQ(SizesOf(header), (Sizes{72, 60, 60}));
}

TEST_F(HeaderResize, KeepsLabelsAndCount) {
    drag(58, 70);
    EXPECT_EQ(LabelsOf(header), (std::vector<std::wstring>{L"0", L"1", L"2"}));
}

TEST_F(HeaderResize, SurvivesItsItemsDeletion) {
    PressAt(header, 178, 3);
    for (int i = 0; i < 3; ++i) KorHeader_DeleteItem(header, 0);
    MoveTo(header, 190, 3);
    MoveTo(header, 100, 3);
    ReleaseAt(header, 100, 3);
    EXPECT_EQ(KorHeader_GetItemCount(header), 0);
    EXPECT_EQ(GetCapture(), nullptr);
}

TEST_F(HeaderResize, SurvivesItsItemsDeletionInFullArrays) {
    AppendSizes(header, Sizes(7, 20));
    PressAt(header, 318, 3);  // border of item 9, the last of ten places
    for (int i = 0; i < 10; ++i) KorHeader_DeleteItem(header, 0);
    MoveTo(header, 350, 3);
    ReleaseAt(header, 350, 3);
    EXPECT_EQ(KorHeader_GetItemCount(header), 0);
}

// One drag is tracked in the process: the item's number then means the other strip's item.
TEST_F(HeaderResize, SurvivesAMoveOnAStripWithFewerItems) {
    HWND other = createHorizontal();
    AppendSizes(other, {50});
    PressAt(header, 178, 3);
    MoveTo(other, 60, 3);
    ReleaseAt(other, 60, 3);
    EXPECT_EQ(SizesOf(header), (Sizes{60, 60, 60}));
    EXPECT_EQ(SizesOf(other), (Sizes{50}));
}

TEST_F(HeaderResize, SurvivesAMoveOnAStripWithFewerPlaces) {
    for (int i = 0; i < 3; ++i) KorHeader_DeleteItem(header, 0);
    AppendSizes(header, Sizes(40, 9));
    HWND other = createHorizontal();
    AppendSizes(other, {50});
    PressAt(header, 357, 3);  // border of item 39; the other strip has places for ten
    MoveTo(other, 300, 3);
    MoveTo(other, 390, 3);
    EXPECT_EQ(heap.report(), "");
    ReleaseAt(other, 300, 3);
    EXPECT_EQ(heap.report(), "");
    EXPECT_EQ(SizesOf(other), (Sizes{50}));
    EXPECT_EQ(SizesOf(header), Sizes(40, 9));
}

}  // namespace
}  // namespace kortest
