// WM_PAINT copies the off-screen image and does nothing else.
#include "grid/grid_fixture.h"

namespace kortest {
namespace {

using GridPaint = GridTest;

// Calls of one message's default processing.
int CountDefault(const ImportSpy& spy, UINT message) {
    int count = 0;
    for (const auto& call : spy.callsOf("DefWindowProcW")) count += NumberAt(call, 1) == message;
    return count;
}

TEST_F(GridPaint, CopiesThePaintRectangleThenGoesOnToDefaultProcessing) {
    create(400, 300);
    const RECT part = {50, 90, 170, 140};
    InvalidateRect(grid, &part, FALSE);
    spy.watchAll({"BeginPaint", "BitBlt", "EndPaint", "DefWindowProcW"});
    HDC paintDC = nullptr;
    spy.replace("BeginPaint", [&](ULONG_PTR* arguments) {
        const ULONG_PTR dc = spy.callReal("BeginPaint", arguments);
        paintDC = reinterpret_cast<HDC>(dc);
        return dc;
    });
    SendMessageW(grid, WM_PAINT, 0, 0);
    std::vector<std::string> names;
    for (const auto& call : spy.calls())
        if (call.name != "DefWindowProcW" || NumberAt(call, 1) == WM_PAINT)
            names.push_back(call.name);
    EXPECT_EQ(names,
              (std::vector<std::string>{"BeginPaint", "BitBlt", "EndPaint", "DefWindowProcW"}));
    const auto copies = spy.callsOf("BitBlt");
    ASSERT_EQ(copies.size(), 1u);
    EXPECT_EQ(copies[0].arguments[0], reinterpret_cast<ULONG_PTR>(paintDC));
    EXPECT_EQ(copies[0].arguments[5], reinterpret_cast<ULONG_PTR>(imageDC));
    const struct {
        size_t place;
        DWORD value;
    } numbers[] = {{1, 50}, {2, 90}, {3, 120}, {4, 50}, {6, 50}, {7, 90}, {8, SRCCOPY}};
    for (const auto& number : numbers)
        EXPECT_EQ(NumberAt(copies[0], number.place), number.value) << number.place;
}

TEST_F(GridPaint, ShowsTheImage) {
    create(400, 300);
    const HBRUSH brush = CreateSolidBrush(RGB(10, 200, 30));
    const RECT part = {33, 70, 260, 200};
    FillRect(imageDC, &part, brush);
    DeleteObject(brush);
    InvalidateRect(grid, nullptr, FALSE);
    UpdateWindow(grid);
    const RECT cells = expected.cells();
    EXPECT_TRUE(SamePicture(image().part(cells), ReadWindow(grid).part(cells)));
}

TEST_F(GridPaint, TouchesNothingOutsideTheInvalidRectangle) {
    create(400, 300);
    PatBlt(imageDC, 0, 0, 400, 300, BLACKNESS);
    const Picture before = ReadWindow(grid);
    const RECT part = {100, 100, 150, 130};
    InvalidateRect(grid, &part, FALSE);
    UpdateWindow(grid);
    const Picture after = ReadWindow(grid);
    EXPECT_EQ(after.count(RGB(0, 0, 0), part), 50 * 30);
    Picture wanted = before;
    for (int y = 100; y < 130; ++y)
        for (int x = 100; x < 150; ++x) wanted.setPixel(x, y, RGB(0, 0, 0));
    EXPECT_TRUE(SamePicture(wanted, after));
}

TEST_F(GridPaint, LeavesTheImageAloneAndAsksNobodyToPaint) {
    create(400, 300);
    PatBlt(imageDC, 10, 100, 300, 150, DSTINVERT);
    const Picture before = image();
    InvalidateRect(grid, nullptr, TRUE);
    UpdateWindow(grid);
    EXPECT_TRUE(SamePicture(before, image()));
    EXPECT_EQ(host.transcript(), Lines{});
    EXPECT_EQ(TakeInvalid(grid), std::nullopt) << "painting validates";
}

TEST_F(GridPaint, PaintsWhileNothingIsInvalid) {
    create(400, 300);
    const Picture before = ReadWindow(grid);
    PatBlt(imageDC, 0, 0, 400, 300, BLACKNESS);
    SendMessageW(grid, WM_PAINT, 0, 0);
    EXPECT_TRUE(SamePicture(before, ReadWindow(grid)));
}

TEST_F(GridPaint, RedrawnRectanglesAreNotErased) {
    create(400, 300);
    spy.watch("InvalidateRect");
    SendMessageW(grid, GRIDM_REDRAW, 0, 0);
    const DWORD one = KORGRID_PAIR(1, 1);
    SetSelectedRanged(one, one);
    int ofGrid = 0;
    for (const auto& call : spy.callsOf("InvalidateRect"))
        if (call.arguments[0] == reinterpret_cast<ULONG_PTR>(grid)) {
            EXPECT_EQ(NumberAt(call, 2), static_cast<DWORD>(FALSE));
            ++ofGrid;
        }
    EXPECT_EQ(ofGrid, 3);
}

TEST_F(GridPaint, DefaultProcessingComesOncePerPaint) {
    create(400, 300);
    spy.watch("DefWindowProcW");
    InvalidateRect(grid, nullptr, FALSE);
    UpdateWindow(grid);
    EXPECT_EQ(CountDefault(spy, WM_PAINT), 1);
}

}  // namespace
}  // namespace kortest
