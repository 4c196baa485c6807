// Dragging a header's border: the line that follows the pointer, and what the host hears.
#include "grid/grid_fixture.h"

namespace kortest {
namespace {

using GridResizeLine = GridTest;
using GridResizeEnd = GridTest;

COLORREF Inverted(COLORREF colour) { return ~colour & 0xFFFFFF; }

void InvertPart(Picture& picture, const RECT& part) {
    for (int y = static_cast<int>(part.top); y < part.bottom; ++y)
        for (int x = static_cast<int>(part.left); x < part.right; ++x)
            picture.setPixel(x, y, Inverted(picture.pixel(x, y)));
}

// ---- The line -----------------------------------------------------------------------------------

TEST_F(GridResizeLine, FollowsTheColumnsBorderOnTheWindow) {
    create(400, 300);
    const Picture before = ReadWindow(grid);
    const int top = expected.cellsTop();
    for (const int end : {70, 71, 90, 0, 369}) {
        SendResizing(grid, columnHeader, end);
        Picture wanted = before;
        InvertPart(wanted, {30 + end, top, 31 + end, 300});
        EXPECT_TRUE(SamePicture(wanted, ReadWindow(grid))) << end;
    }
}

TEST_F(GridResizeLine, FollowsTheRowsBorderOnTheWindow) {
    create(400, 300);
    const Picture before = ReadWindow(grid);
    const int top = expected.cellsTop();
    for (const int end : {16, 17, 90, 0, 299 - top}) {
        SendResizing(grid, rowHeader, end);
        Picture wanted = before;
        InvertPart(wanted, {30, top + end, 400, top + end + 1});
        EXPECT_TRUE(SamePicture(wanted, ReadWindow(grid))) << end;
    }
}

TEST_F(GridResizeLine, SamePositionTwiceShowsTheLineOnce) {
    create(400, 300);
    SendResizing(grid, columnHeader, 70);
    const Picture once = ReadWindow(grid);
    SendResizing(grid, columnHeader, 70);
    EXPECT_TRUE(SamePicture(once, ReadWindow(grid)));
}

TEST_F(GridResizeLine, IsNotDrawnIntoTheImage) {
    create(400, 300);
    const Picture before = image();
    SendResizing(grid, columnHeader, 70);
    SendResizing(grid, rowHeader, 40);
    EXPECT_TRUE(SamePicture(before, image()));
    InvalidateRect(grid, nullptr, FALSE);
    UpdateWindow(grid);
    const RECT cells = expected.cells();
    EXPECT_TRUE(SamePicture(before.part(cells), ReadWindow(grid).part(cells)));
}

// The window-DC strips that the tracking inverted, as x, y, width, height.
std::vector<std::vector<int>> InvertedStrips(const ImportSpy& spy, HDC imageDC) {
    std::vector<std::vector<int>> strips;
    for (const auto& call : spy.callsOf("PatBlt")) {
        if (call.arguments[0] == reinterpret_cast<ULONG_PTR>(imageDC)) continue;
        EXPECT_EQ(NumberAt(call, 5), static_cast<DWORD>(DSTINVERT));
        std::vector<int> strip;
        for (size_t i = 1; i < 5; ++i) strip.push_back(static_cast<int>(NumberAt(call, i)));
        strips.push_back(strip);
    }
    return strips;
}

using Strips = std::vector<std::vector<int>>;

TEST_F(GridResizeLine, StripsCrossTheWholeClientArea) {
    create(400, 300);
    spy.watchAll({"PatBlt", "GetDC", "ReleaseDC"});
    SendResizing(grid, columnHeader, 70);
    SendResizing(grid, columnHeader, 80);
    EXPECT_EQ(InvertedStrips(spy, imageDC),
              (Strips{{100, 0, 1, 300}, {100, 0, 1, 300}, {110, 0, 1, 300}}));
    SendResized(grid, columnHeader, 100, 60);  // stores only, so the line stays where it is
    spy.clearCalls();
    SendResizing(grid, columnHeader, 20);
    EXPECT_EQ(InvertedStrips(spy, imageDC), (Strips{{110, 0, 1, 300}, {50, 0, 1, 300}}));
    EXPECT_EQ(spy.count("GetDC"), 1);
    EXPECT_EQ(spy.callsOf("GetDC")[0].arguments[0], reinterpret_cast<ULONG_PTR>(grid));
    EXPECT_EQ(spy.count("ReleaseDC"), 1);
}

TEST_F(GridResizeLine, RowStripsCrossTheWholeClientArea) {
    create(400, 300);
    spy.watch("PatBlt");
    const int top = expected.cellsTop();
    SendResizing(grid, rowHeader, 20);
    SendResizing(grid, rowHeader, 33);
    EXPECT_EQ(InvertedStrips(spy, imageDC),
              (Strips{{0, top + 20, 400, 1}, {0, top + 20, 400, 1}, {0, top + 33, 400, 1}}));
}

// One position serves both headers, so a line that was left is erased in the other direction.
TEST_F(GridResizeLine, OneLineServesBothHeaders) {
    create(400, 300);
    spy.watch("PatBlt");
    const int top = expected.cellsTop();
    SendResizing(grid, columnHeader, 70);
    SendResizing(grid, rowHeader, 33);
    SendResizing(grid, columnHeader, 10);
    EXPECT_EQ(InvertedStrips(spy, imageDC), (Strips{{100, 0, 1, 300},
                                                    {0, 100, 400, 1},
                                                    {0, top + 33, 400, 1},
                                                    {top + 33, 0, 1, 300},
                                                    {40, 0, 1, 300}}));
}

TEST_F(GridResizeLine, HiddenHeadersMoveTheOrigin) {
    create(400, 300);
    ToggleViewStateOfHeaders();
    host.pump();
    spy.watch("PatBlt");
    SendResizing(grid, columnHeader, 70);
    EXPECT_EQ(InvertedStrips(spy, imageDC), (Strips{{70, 0, 1, 300}}));
    spy.clearCalls();
    SendResizing(grid, rowHeader, 20);
    EXPECT_EQ(InvertedStrips(spy, imageDC).back(),
              (std::vector<int>{0, expected.equationBarHeight + 20, 400, 1}));
}

TEST_F(GridResizeLine, EndForgetsTheLine) {
    create(400, 300);
    spy.watch("PatBlt");
    SendResizing(grid, columnHeader, 70);
    SendResized(grid, columnHeader, 0, 70);
    spy.clearCalls();
    SendResizing(grid, columnHeader, 80);
    EXPECT_EQ(InvertedStrips(spy, imageDC), (Strips{{110, 0, 1, 300}}));
    SendResized(grid, rowHeader, 0, 20);
    spy.clearCalls();
    SendResizing(grid, rowHeader, 5);
    EXPECT_EQ(InvertedStrips(spy, imageDC).size(), 1u);
}

// ---- What the host hears ------------------------------------------------------------------------

TEST_F(GridResizeEnd, HostHearsAfterTheRedraw) {
    create(400, 300);
    SetFirstVisibleCell(KORGRID_CELL(3, 50));
    host.clear();
    SendResized(grid, columnHeader, 2, 75);
    SendResized(grid, rowHeader, 4, 22);
    const Lines lines = host.transcript();
    ASSERT_EQ(lines.size(), 4u);
    EXPECT_EQ(lines[0].rfind("sent GRIDN_PAINTCELLS", 0), 0u);
    EXPECT_EQ(lines[1], "sent GRIDN_COLUMNRESIZED 5 75");
    EXPECT_EQ(lines[2].rfind("sent GRIDN_PAINTCELLS", 0), 0u);
    EXPECT_EQ(lines[3], "sent GRIDN_ROWRESIZED 54 22");
}

TEST_F(GridResizeEnd, HostHearsOfInvisibleOnesToo) {
    create(400, 300);
    SendResized(grid, columnHeader, 200, 75);
    SendResized(grid, rowHeader, 9000, 22);
    EXPECT_EQ(host.transcript(),
              (Lines{"sent GRIDN_COLUMNRESIZED 200 75", "sent GRIDN_ROWRESIZED 9000 22"}));
}

TEST_F(GridResizeEnd, SizeIsNotCutToTheCellArea) {
    create(400, 300);
    SendResized(grid, columnHeader, 0, 2000);
    SendResized(grid, rowHeader, 0, 3000);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0), 2000);
    EXPECT_EQ(KorHeader_GetItemSize(rowHeader, 0), 3000);
    EXPECT_EQ(VisibleRange(), (GridVisibleRange{0, 1, 0, 1}));
}

// With real presses on the header the messages arrive posted, and the size is the dragged one.
TEST_F(GridResizeEnd, DraggingAHeadersBorderResizes) {
    create(400, 300);
    PressAt(columnHeader, 119, 5);
    MoveTo(columnHeader, 150, 5);
    ReleaseAt(columnHeader, 150, 5);
    host.pump();
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 1), 91);
    EXPECT_EQ(host.transcript().back(), "sent GRIDN_COLUMNRESIZED 1 91");
    PressAt(rowHeader, 5, 31);
    MoveTo(rowHeader, 5, 41);
    ReleaseAt(rowHeader, 5, 41);
    host.pump();
    EXPECT_EQ(KorHeader_GetItemSize(rowHeader, 1), 26);
    EXPECT_EQ(host.transcript().back(), "sent GRIDN_ROWRESIZED 1 26");
}

}  // namespace
}  // namespace kortest
