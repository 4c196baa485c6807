// The off-screen image: its size, and how WM_PAINT copies it.
#include "graph/graph_fixture.h"

namespace kortest {
namespace {

class GraphImage : public GraphTest {};

TEST_F(GraphImage, IsRoundedUpToFours) {
    create(101, 50);
    EXPECT_EQ(bitmapSize().cx, 104);
    EXPECT_EQ(bitmapSize().cy, 52);
    const struct {
        int width, height, bitmapWidth, bitmapHeight;
    } sizes[] = {{100, 52, 100, 52}, {102, 53, 104, 56}, {103, 54, 104, 56},
                 {104, 55, 104, 56}, {105, 56, 108, 56}, {1, 1, 4, 4}};
    for (const auto& size : sizes) {
        resize(size.width, size.height);
        EXPECT_EQ(bitmapSize().cx, size.bitmapWidth) << size.width;
        EXPECT_EQ(bitmapSize().cy, size.bitmapHeight) << size.height;
    }
}

// The plot is laid out in the unrounded size.
TEST_F(GraphImage, PlotKeepsTheUnroundedSize) {
    createPlain(101, 131);
    send(GM_SETTYPE, 0, KORGRAPH_BAR);
    KorGraph_SetRange(graph, KORGRAPH_X, 0, 71);  // 101 less two margins: a pixel a unit
    add({70});
    redraw();
    host.pump();
    // from the centre, 35.5 in column 50, to 70
    EXPECT_EQ(tap(84, 65), L"Value:70");
    EXPECT_EQ(tap(85, 65), L"-");
}

TEST_F(GraphImage, HasTheBackgroundUpToTheUnroundedSize) {
    createPlain(101, 50);
    const RECT whole = {0, 0, 104, 52};
    const Picture picture = ReadDC(imageDC, whole);
    EXPECT_EQ(picture.pixel(100, 49), RGB(255, 255, 255));
    EXPECT_EQ(picture.pixel(100, 2), RGB(255, 255, 255));
}

TEST_F(GraphImage, IsDrawnAnewAfterASizeChange) {
    createPlain(101, 50);
    send(GM_SETBKCOLOR, 0, RGB(9, 8, 7));
    resize(120, 60);
    EXPECT_EQ(image().pixel(118, 58), RGB(9, 8, 7));
    UpdateWindow(graph);
    EXPECT_TRUE(SamePicture(image(), ReadWindow(graph)));
}

TEST_F(GraphImage, SizeChangePassesDefaultProcessingFirst) {
    create();
    spy.watchAll({"DefWindowProcW", "CreateCompatibleBitmap"});
    EXPECT_EQ(send(WM_SIZE, 0, MAKELPARAM(90, 60)), 0);
    ASSERT_GE(spy.calls().size(), 2u);
    EXPECT_EQ(spy.calls()[0].name, "DefWindowProcW");
    EXPECT_EQ(defaultCalls(WM_SIZE), 1);
    EXPECT_EQ(bitmapSize().cx, 92);
    EXPECT_EQ(bitmapSize().cy, 60);
}

TEST_F(GraphImage, SizesSmallerThanTheMarginsAreSurvived) {
    create();
    add({1, 5, 3}, L"name");
    categories({L"a", L"b"});
    KorGraph_SetTitle(graph, L"title");
    for (const SIZE size : {SIZE{0, 0}, SIZE{1, 0}, SIZE{0, 90}, SIZE{29, 29}, SIZE{30, 30},
                            SIZE{31, 31}, SIZE{200, 5}, SIZE{5, 200}})
        for (LONG type = 0; type <= 4; ++type) {
            resize(size.cx, size.cy);
            KorGraph_SetType(graph, type);
            redraw();
            tap(2, 2);
            tap(20, 20);
            host.pump();
        }
    resize(230, 130);
    EXPECT_EQ(bitmapSize().cx, 232);
    EXPECT_EQ(range(KORGRAPH_X), (std::pair{0.0, 4.0}));
}

TEST_F(GraphImage, GreatestSizesAreSurvived) {
    create();
    add({1, 5, 3});
    send(WM_SIZE, 0, MAKELPARAM(0xFFFF, 8));
    send(WM_SIZE, 0, MAKELPARAM(8, 0xFFFF));
    resize(100, 80);
    EXPECT_EQ(bitmapSize().cx, 100);
}

TEST_F(GraphImage, RedrawsReturnEveryHandle) {
    create();
    add({1, 5, 3}, L"name");
    add({1, -5});
    categories({L"a", L"b"});
    KorGraph_SetTitle(graph, L"title");
    settle();
    WatchHandles(spy);
    for (LONG type = 0; type <= 4; ++type) {
        KorGraph_SetType(graph, type);
        redraw();
        UpdateWindow(graph);
    }
    EXPECT_EQ(UnreturnedHandles(spy), std::vector<std::string>{});
}

// The bitmap of before goes; what is left is one bitmap, whatever the number of size changes.
TEST_F(GraphImage, SizeChangesLeaveOneBitmap) {
    create();
    WatchHandles(spy);
    spy.clearCalls();
    for (int size = 60; size < 80; ++size) resize(size, size);
    EXPECT_EQ(UnreturnedHandles(spy), std::vector<std::string>{"CreateCompatibleBitmap"});
}

// ---- Paint ------------------------------------------------------------------------------------

class GraphPaint : public GraphTest {};

// What becomes invalid in the meantime is validated, and not drawn.
TEST_F(GraphPaint, LeavesTheRestToDefaultProcessing) {
    create();
    InvalidateRect(graph, nullptr, FALSE);
    spy.watchAll({"BitBlt", "EndPaint", "DefWindowProcW"});
    spy.replace("EndPaint", [&](ULONG_PTR* arguments) {
        const ULONG_PTR result = spy.callReal("EndPaint", arguments);
        InvalidateRect(graph, nullptr, FALSE);
        return result;
    });
    EXPECT_EQ(send(WM_PAINT), 0);
    EXPECT_EQ(spy.count("BitBlt"), 1);
    EXPECT_EQ(defaultCalls(WM_PAINT), 1);
    EXPECT_FALSE(GetUpdateRect(graph, nullptr, FALSE));
}

// Width and height are the right and bottom edges: more than the rectangle, which the update
// region cuts.
TEST_F(GraphPaint, CopiesFromTheRectanglesLeftTop) {
    create();
    const RECT part = {50, 30, 120, 70};
    InvalidateRect(graph, &part, FALSE);
    spy.watchAll({"BeginPaint", "BitBlt", "EndPaint", "DefWindowProcW"});
    send(WM_PAINT);
    std::vector<std::string> names;
    for (const auto& call : spy.calls())
        if (call.name != "DefWindowProcW" || NumberAt(call, 1) == WM_PAINT)
            names.push_back(call.name);
    EXPECT_EQ(names, (std::vector<std::string>{"BeginPaint", "BitBlt", "EndPaint"}));
    const auto copies = spy.callsOf("BitBlt");
    ASSERT_EQ(copies.size(), 1u);
    EXPECT_EQ(copies[0].arguments[0], spy.callsOf("BeginPaint")[0].result);
    EXPECT_EQ(copies[0].arguments[5], reinterpret_cast<ULONG_PTR>(imageDC));
    const struct {
        size_t place;
        DWORD value;
    } numbers[] = {{1, 50}, {2, 30}, {3, 120}, {4, 70}, {6, 50}, {7, 30}, {8, SRCCOPY}};
    for (const auto& number : numbers)
        EXPECT_EQ(NumberAt(copies[0], number.place), number.value) << number.place;
}

TEST_F(GraphPaint, ShowsTheImage) {
    create();
    add({1, 5, 3});
    redraw();
    UpdateWindow(graph);
    EXPECT_TRUE(SamePicture(image(), ReadWindow(graph)));
    EXPECT_GT(image().count(RGB(0, 255, 0)), 50) << "the series is in it";
}

TEST_F(GraphPaint, TouchesNothingOutsideTheInvalidRectangle) {
    create();
    UpdateWindow(graph);
    const Picture before = ReadWindow(graph);
    PatBlt(imageDC, 0, 0, 230, 130, BLACKNESS);
    const RECT part = {50, 30, 120, 70};
    InvalidateRect(graph, &part, FALSE);
    UpdateWindow(graph);
    const Picture after = ReadWindow(graph);
    EXPECT_EQ(after.count(RGB(0, 0, 0), part), 70 * 40);
    EXPECT_EQ(after.count(RGB(0, 0, 0)) - before.count(RGB(0, 0, 0)),
              70 * 40 - before.count(RGB(0, 0, 0), part));
}

TEST_F(GraphPaint, WithoutAPaintDCCopiesTheWholeImage) {
    create();
    InvalidateRect(graph, nullptr, FALSE);
    spy.watchAll({"BeginPaint", "GetDC", "ReleaseDC", "BitBlt"});
    spy.failNth("BeginPaint", 1);
    send(WM_PAINT);
    const auto copies = spy.callsOf("BitBlt");
    ASSERT_EQ(copies.size(), 1u);
    const DWORD expected[] = {0, 0, 230, 130};
    for (size_t i = 0; i < 4; ++i) EXPECT_EQ(NumberAt(copies[0], i + 1), expected[i]) << i;
    EXPECT_EQ(spy.count("GetDC"), 1);
    EXPECT_EQ(spy.count("ReleaseDC"), 1);
    EXPECT_EQ(copies[0].arguments[0], spy.callsOf("GetDC")[0].result);
}

TEST_F(GraphPaint, DrawsNothingItself) {
    create();
    InvalidateRect(graph, nullptr, FALSE);
    spy.watchAll({"DrawTextW", "FillRect", "Polyline", "Polygon", "LineTo", "InvalidateRect"});
    UpdateWindow(graph);
    EXPECT_EQ(spy.sequence(), "");
    EXPECT_FALSE(GetUpdateRect(graph, nullptr, FALSE));
}

// Drawing, by zoom or redraw, reaches the screen with the next paint.
TEST_F(GraphPaint, FollowsEveryDrawing) {
    create();
    settle();
    for (const UINT what : {0u, 1u, 2u}) {
        ValidateRect(graph, nullptr);
        if (what == 0) redraw();
        if (what == 1) send(GM_SETZOOM, 0, KORGRAPH_ZOOM200);
        if (what == 2) send(GM_SETTYPE, 0, KORGRAPH_AREA);
        RECT area{};
        EXPECT_TRUE(GetUpdateRect(graph, &area, FALSE)) << what;
        EXPECT_EQ(area, ClientOf(graph)) << what;
    }
}

TEST_F(GraphPaint, FollowsNoDataChange) {
    create();
    add({1, 2, 3});
    settle();
    const Picture before = image();
    watchInvalidations();
    add({4, 5});
    setValue(0, 1, 50);
    replace(0, {7, 8, 9});
    categories({L"a"});
    KorGraph_SetRange(graph, KORGRAPH_X, 0, 2);
    KorGraph_AutoRange(graph, KORGRAPH_X);
    notify(GN_CLEAR);
    EXPECT_EQ(invalidations.size(), 0u);
    EXPECT_TRUE(SamePicture(before, image()));
}

}  // namespace
}  // namespace kortest
