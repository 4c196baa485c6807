// Where WM_SIZE puts the grid's children, and what else it does.
#include "grid/grid_fixture.h"

#include <algorithm>

namespace kortest {
namespace {

using GridLayout = GridTest;

RECT Place(int x, int y, int width, int height) {
    return {x, y, x + std::max(width, 0), y + std::max(height, 0)};
}

// Compares every child's rectangle with the table of the layout.
void ExpectLayout(HWND grid, const ExpectedGrid& expected) {
    const int width = expected.clientWidth;
    const int height = expected.clientHeight;
    const int bar = expected.equationBarHeight;
    const int left = expected.cellsLeft();
    const int top = expected.cellsTop();
    const int strip = static_cast<int>(expected.zoom * 4);  // also while the headers are hidden
    EXPECT_EQ(ChildRect(CancelButtonOf(grid)), Place(0, 0, 25, bar));
    EXPECT_EQ(ChildRect(OkButtonOf(grid)), Place(25, 0, 25, bar));
    EXPECT_EQ(ChildRect(FunctionButtonOf(grid)), Place(50, 0, 25, bar));
    EXPECT_EQ(ChildRect(EquationEditOf(grid)), Place(75, 0, width - 75, bar));
    EXPECT_EQ(ChildRect(CornerButtonOf(grid)), Place(0, bar, left, strip));
    EXPECT_EQ(ChildRect(ColumnHeaderOf(grid)), Place(left, bar, width - left, strip));
    EXPECT_EQ(ChildRect(RowHeaderOf(grid)), Place(0, top, left, height - top));
}

TEST_F(GridLayout, FirstSizeGivesTheLayoutAt100Percent) {
    create(400, 300);
    const int bar = expected.equationBarHeight;
    EXPECT_EQ(ChildRect(columnHeader), (RECT{30, bar, 400, bar + 16}));
    EXPECT_EQ(ChildRect(rowHeader), (RECT{0, bar + 16, 30, 300}));
    EXPECT_EQ(ChildRect(CornerButtonOf(grid)), (RECT{0, bar, 30, bar + 16}));
    EXPECT_EQ(ChildRect(edit), (RECT{75, 0, 400, bar}));
}

TEST_F(GridLayout, FollowsEverySize) {
    create(400, 300);
    const SIZE sizes[] = {{640, 480}, {1, 1},     {29, 20},   {30, 36},    {31, 37},   {74, 100},
                          {75, 100},  {76, 100},  {90, 53},   {91, 54},    {240, 320}, {320, 240},
                          {639, 479}, {2000, 30}, {30, 2000}, {1024, 768}, {400, 300}};
    for (const SIZE& size : sizes) {
        SCOPED_TRACE(::testing::Message() << size.cx << " x " << size.cy);
        resize(static_cast<int>(size.cx), static_cast<int>(size.cy));
        ExpectLayout(grid, expected);
        EXPECT_EQ(VisibleRange(), expected.visibleRange());
        EXPECT_EQ(HeaderSizes(columnHeader), ExpectedColumnSizes(expected));
        EXPECT_EQ(HeaderSizes(rowHeader), ExpectedRowSizes(expected));
    }
}

TEST_F(GridLayout, FollowsEveryZoomWithAndWithoutHeaders) {
    create(400, 300);
    for (const unsigned zoom : {1u, 2u, 3u, 4u, 5u, 6u, 8u, 16u, 40u})
        for (const bool hidden : {false, true}) {
            SCOPED_TRACE(::testing::Message() << "zoom " << zoom << " hidden " << hidden);
            if (hidden != expected.headersHidden) {
                ToggleViewStateOfHeaders();
                expected.headersHidden = hidden;
            }
            SetGridZoomLevel(zoom);
            expected.zoom = zoom;
            refit();
            ExpectLayout(grid, expected);
            EXPECT_EQ(VisibleRange(), expected.visibleRange());
            EXPECT_EQ(HeaderSizes(columnHeader), ExpectedColumnSizes(expected));
            EXPECT_EQ(HeaderSizes(rowHeader), ExpectedRowSizes(expected));
        }
}

TEST_F(GridLayout, HiddenHeadersKeepTheirHeightOutOfSight) {
    create(400, 300);
    ToggleViewStateOfHeaders();
    const int bar = expected.equationBarHeight;
    EXPECT_EQ(ChildRect(CornerButtonOf(grid)), (RECT{0, bar, 0, bar + 16}));
    EXPECT_EQ(ChildRect(columnHeader), (RECT{0, bar, 400, bar + 16}));
    EXPECT_EQ(ChildRect(rowHeader), (RECT{0, bar, 0, 300}));
    EXPECT_FALSE(IsWindowVisible(columnHeader));
}

TEST_F(GridLayout, LeavesTheOrderOfTheChildrenAlone) {
    create(400, 300);
    spy.watch("SetWindowPos");
    resize(410, 310);
    const auto calls = spy.callsOf("SetWindowPos");
    ASSERT_EQ(calls.size(), 7u);
    for (const auto& call : calls) EXPECT_EQ(NumberAt(call, 6), static_cast<DWORD>(SWP_NOZORDER));
}

TEST_F(GridLayout, SizeMessageIgnoresItsParametersAndReturnsZero) {
    create(400, 300);
    EXPECT_EQ(SendMessageW(grid, WM_SIZE, 3, MAKELPARAM(50, 50)), 0);
    ExpectLayout(grid, expected);
    EXPECT_EQ(host.transcript(), (Lines{"sent GRIDN_PAINTCELLS columns 0-7 rows 0-" +
                                        std::to_string(expected.rowCount)}));
}

TEST_F(GridLayout, EachSizeAsksTheHostOnceToPaint) {
    create(400, 300);
    resize(500, 310);
    const GridVisibleRange range = expected.visibleRange();
    EXPECT_EQ(host.transcript(),
              (Lines{"sent GRIDN_PAINTCELLS columns 0-" + std::to_string(range.endColumn) +
                     " rows 0-" + std::to_string(range.endRow)}));
}

TEST_F(GridLayout, RedrawsTheWholeClientAreaIntoANewImage) {
    create(400, 300);
    PatBlt(imageDC, 0, 0, 400, 300, BLACKNESS);
    resize(500, 320);
    Canvas canvas(500, 320, RGB(255, 0, 0));
    DrawExpectedLines(canvas.dc(), expected, expected.client());
    InvertExpectedSelection(canvas.dc(), expected);
    EXPECT_TRUE(SamePicture(canvas.picture(), image()));
}

TEST_F(GridLayout, ImageHasTheClientAreasSize) {
    create(400, 300);
    for (const SIZE& size : {SIZE{500, 320}, SIZE{1, 1}, SIZE{31, 500}}) {
        resize(static_cast<int>(size.cx), static_cast<int>(size.cy));
        BITMAP bitmap{};
        ASSERT_NE(GetObjectW(GetCurrentObject(imageDC, OBJ_BITMAP), sizeof bitmap, &bitmap), 0);
        EXPECT_EQ(bitmap.bmWidth, size.cx);
        EXPECT_EQ(bitmap.bmHeight, size.cy);
    }
}

TEST_F(GridLayout, EachSizeDeletesTheImageBefore) {
    create(400, 300);
    spy.watchAll({"CreateCompatibleBitmap", "DeleteObject", "GetDC", "ReleaseDC"});
    HGDIOBJ before = GetCurrentObject(imageDC, OBJ_BITMAP);
    for (int i = 1; i <= 5; ++i) {
        spy.clearCalls();
        resize(400 + i, 300);
        int deleted = 0;
        for (const auto& call : spy.callsOf("DeleteObject"))
            deleted += call.arguments[0] == reinterpret_cast<ULONG_PTR>(before);
        EXPECT_EQ(deleted, 1);
        ASSERT_EQ(spy.count("CreateCompatibleBitmap"), 1);
        const auto made = spy.callsOf("CreateCompatibleBitmap")[0];
        EXPECT_EQ(NumberAt(made, 1), static_cast<DWORD>(400 + i));
        EXPECT_EQ(NumberAt(made, 2), 300u);
        before = GetCurrentObject(imageDC, OBJ_BITMAP);
        EXPECT_EQ(made.result, reinterpret_cast<ULONG_PTR>(before));
        EXPECT_EQ(spy.count("GetDC"), spy.count("ReleaseDC"));
    }
}

TEST_F(GridLayout, TakesTheImageFromTheGridsOwnDC) {
    create(400, 300);
    spy.watchAll({"CreateCompatibleBitmap", "GetDC", "ReleaseDC"});
    resize(410, 300);
    const auto bitmaps = spy.callsOf("CreateCompatibleBitmap");
    ASSERT_EQ(bitmaps.size(), 1u);
    const ULONG_PTR dc = bitmaps[0].arguments[0];
    const ULONG_PTR window = reinterpret_cast<ULONG_PTR>(grid);
    int taken = 0;
    int released = 0;
    for (const auto& call : spy.callsOf("GetDC"))
        taken += call.arguments[0] == window && call.result == dc;
    for (const auto& call : spy.callsOf("ReleaseDC"))
        released += call.arguments == std::vector<ULONG_PTR>{window, dc};
    EXPECT_GE(taken, 1);
    EXPECT_EQ(taken, released);
}

TEST_F(GridLayout, WidthZeroKeepsImageAndLayout) {
    create(400, 300);
    const HGDIOBJ bitmap = GetCurrentObject(imageDC, OBJ_BITMAP);
    const Picture before = image();
    spy.watchAll({"CreateCompatibleBitmap", "DeleteObject", "SetWindowPos"});
    SetWindowPos(grid, nullptr, 0, 0, 0, 200, SWP_NOMOVE | SWP_NOZORDER);
    EXPECT_EQ(SendMessageW(grid, WM_SIZE, 0, MAKELPARAM(100, 100)), 0);
    EXPECT_EQ(spy.sequence(), "");
    EXPECT_EQ(host.transcript(), Lines{});
    EXPECT_EQ(GetCurrentObject(imageDC, OBJ_BITMAP), bitmap);
    EXPECT_TRUE(SamePicture(before, ReadDC(imageDC, {0, 0, 400, 300})));
    ExpectLayout(grid, expected);
    EXPECT_EQ(VisibleRange(), expected.visibleRange());
}

TEST_F(GridLayout, WidthOneIsASizeLikeOthers) {
    create(400, 300);
    resize(1, 300);
    EXPECT_EQ(host.transcript().size(), 1u);
    ExpectLayout(grid, expected);
    EXPECT_EQ(VisibleRange(), expected.visibleRange());
}

TEST_F(GridLayout, HeightZeroIsASizeLikeOthers) {
    create(400, 300);
    resize(400, 0);
    EXPECT_EQ(GetNumberOfVisibleRows(), 0u);
    EXPECT_EQ(KorHeader_GetItemCount(rowHeader), 0);
    EXPECT_EQ(host.transcript(), (Lines{"sent GRIDN_PAINTCELLS columns 0-7 rows 0-0"}));
    resize(400, 300);
    ExpectLayout(grid, expected);
    EXPECT_EQ(VisibleRange(), expected.visibleRange());
}

TEST_F(GridLayout, VisibleCountsIncludeThePartlyVisibleLastOne) {
    create(30 + 5 * 60, expected.equationBarHeight + 200);
    const int top = expected.cellsTop();
    struct {
        int width, height;
        DWORD columns, rows;
    } const cases[] = {
        {30 + 300, top + 160, 5, 10},
        {30 + 301, top + 161, 6, 11},
        {30 + 299, top + 159, 5, 10},
        {31, top + 1, 1, 1},
        {30, top, 0, 0},
    };
    for (const auto& each : cases) {
        resize(each.width, each.height);
        EXPECT_EQ(GetNumberOfVisibleColumns(), each.columns) << each.width;
        EXPECT_EQ(GetNumberOfVisibleRows(), each.rows) << each.height;
    }
}

// ---- Showing and hiding the headers ----------------------------------------------------------

TEST_F(GridLayout, ToggleShowsAndHidesHeadersAndCorner) {
    create(400, 300);
    const HWND parts[] = {columnHeader, rowHeader, CornerButtonOf(grid)};
    for (const DWORD hidden : {1u, 0u, 1u, 0u}) {
        EXPECT_EQ(ToggleViewStateOfHeaders(), hidden);
        for (const HWND part : parts)
            EXPECT_EQ((GetWindowLongW(part, GWL_STYLE) & WS_VISIBLE) == 0, hidden == 1);
        EXPECT_TRUE(IsWindowVisible(edit));
        EXPECT_TRUE(IsWindowVisible(OkButtonOf(grid)));
    }
}

TEST_F(GridLayout, ToggleShowsWithThePlainShowCommands) {
    create(400, 300);
    spy.watch("ShowWindow");
    ToggleViewStateOfHeaders();
    ASSERT_EQ(spy.count("ShowWindow"), 3);
    for (const auto& call : spy.callsOf("ShowWindow"))
        EXPECT_EQ(NumberAt(call, 1), static_cast<DWORD>(SW_HIDE));
    spy.clearCalls();
    ToggleViewStateOfHeaders();
    ASSERT_EQ(spy.count("ShowWindow"), 3);
    for (const auto& call : spy.callsOf("ShowWindow"))
        EXPECT_EQ(NumberAt(call, 1), static_cast<DWORD>(SW_SHOW));
}

// WM_SIZE messages that reach a window.
std::vector<std::pair<WPARAM, LPARAM>> g_sizes;
WNDPROC g_sizedProc;

LRESULT CALLBACK SizeProbe(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    if (message == WM_SIZE) g_sizes.emplace_back(wParam, lParam);
    return CallWindowProcW(g_sizedProc, window, message, wParam, lParam);
}

void ProbeSizes(HWND window) {
    g_sizedProc = reinterpret_cast<WNDPROC>(
        SetWindowLongPtrW(window, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(&SizeProbe)));
}

TEST_F(GridLayout, ToggleSendsTheCellAreasSize) {
    create(400, 300);
    ProbeSizes(grid);
    const int bar = expected.equationBarHeight;
    ToggleViewStateOfHeaders();
    ToggleViewStateOfHeaders();
    using Sizes = std::vector<std::pair<WPARAM, LPARAM>>;
    EXPECT_EQ(g_sizes,
              (Sizes{{3, MAKELPARAM(400, 300 - bar)}, {3, MAKELPARAM(400 - 30, 300 - bar - 16)}}));
}

TEST_F(GridLayout, ZoomSendsTheCellAreasSize) {
    create(400, 300);
    ProbeSizes(grid);
    SetGridZoomLevel(6);
    using Sizes = std::vector<std::pair<WPARAM, LPARAM>>;
    EXPECT_EQ(g_sizes, (Sizes{{3, MAKELPARAM(400 - 30, 300 - expected.equationBarHeight - 24)}}));
}

TEST_F(GridLayout, ToggledGridIsDrawnFromTheLeftEdge) {
    create(400, 300);
    ToggleViewStateOfHeaders();
    expected.headersHidden = true;
    refit();
    Canvas canvas(400, 300, RGB(255, 0, 0));
    DrawExpectedRedraw(canvas.dc(), expected, expected.client());
    // The whitening comes between the two inversions, so the highlight is drawn once.
    EXPECT_TRUE(SamePicture(canvas.picture(), image()));
    EXPECT_EQ(image().pixel(60, 299), kGridLineColour);
}

// Rows from 1000 on make the row header wider; hiding and showing keeps that width.
TEST_F(GridLayout, ShownAgainTheRowHeaderHasItsWiderWidth) {
    create(400, 300);
    SetFirstVisibleCell(KORGRID_CELL(0, 2000));
    expected.firstRow = 2000;
    expected.rowHeaderWidth = 35;
    refit();
    ExpectLayout(grid, expected);
    ToggleViewStateOfHeaders();
    ToggleViewStateOfHeaders();
    ExpectLayout(grid, expected);
    SetGridZoomLevel(8);
    expected.zoom = 8;
    refit();
    ExpectLayout(grid, expected);
}

TEST_F(GridLayout, BarsOfTheWindowNarrowTheLayout) {
    create(400, 300, RecordingHost::kGridStyleWithBars);
    SetHorizontalDataRange(200);
    SetVerticalDataRange(200);
    host.pump();
    refit();
    ASSERT_LT(expected.clientWidth, 400);
    ASSERT_LT(expected.clientHeight, 300);
    ExpectLayout(grid, expected);
}

}  // namespace
}  // namespace kortest
