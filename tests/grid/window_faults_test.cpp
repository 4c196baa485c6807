// Creation that fails half-way, and messages that nobody would send.
#include "grid/grid_fixture.h"

#include <random>

namespace kortest {
namespace {

class GridCreationFaults : public GuardedGridTest,
                           public ::testing::WithParamInterface<const char*> {
protected:
    // A short life of a grid, whatever of it could be made.
    void live() {
        grid = host.createGrid(160, 110);
        if (!grid) return;
        host.pump();
        SetColumnWidth(0, 50);
        SetFirstVisibleCell(KORGRID_CELL(1, 1));
        PressAt(grid, 60, 60);
        MoveTo(grid, 90, 80);
        ReleaseAt(grid, 90, 80);
        TypeCharacter(grid, L'5');
        PressKey(grid, VK_RIGHT);
        SendMessageW(grid, WM_COMMAND, 7, 0);
        SetGridZoomLevel(5);
        SetGridZoomLevel(4);
        SetWindowPos(grid, nullptr, 0, 0, 150, 100, SWP_NOMOVE | SWP_NOZORDER);
        UpdateWindow(grid);
        DestroyWindow(grid);
        ResetGrid();
    }
};

TEST_P(GridCreationFaults, AreSurvivedOneByOne) {
    const std::string name = GetParam();
    live();
    if (!spy.watch(name)) {
        GTEST_SKIP() << "the library does not call " << name;
    }
    int failures = 0;
    for (int nth = 1; nth <= 80; ++nth) {
        spy.clearCalls();
        spy.failNth(name, nth);
        live();
        bool failed = false;
        for (const auto& call : spy.callsOf(name)) failed |= call.failed;
        spy.stopFailing(name);
        if (IsWindow(grid)) DestroyWindow(grid);
        if (!failed) break;
        ++failures;
    }
    EXPECT_GT(failures, 0) << name << " was never called";
    EXPECT_NE(SetSelectedRanged(0, 0), 0u);
    create(160, 110);
    EXPECT_EQ(VisibleRange(), expected.visibleRange()) << "the next grid is whole";
    EXPECT_EQ(HeaderSizes(columnHeader), ExpectedColumnSizes(expected));
    Canvas canvas(160, 110, RGB(0, 0, 0));
    DrawExpectedRedraw(canvas.dc(), expected, expected.client());
    EXPECT_TRUE(SamePicture(canvas.picture(), image()));
}

std::string ImportTestName(const ::testing::TestParamInfo<const char*>& info) { return info.param; }

INSTANTIATE_TEST_SUITE_P(Imports, GridCreationFaults,
                         ::testing::Values("CreateWindowExW", "CreatePen", "GetDC",
                                           "CreateCompatibleDC", "CreateCompatibleBitmap",
                                           "CreateFontIndirectW", "CreateSolidBrush",
                                           "GetTextMetricsW", "SelectObject", "GetObjectW",
                                           "RegisterClassW", "LocalAlloc", "SetTimer",
                                           "BeginPaint"),
                         ImportTestName);

// ---- Messages ---------------------------------------------------------------------------------

class GridSenselessMessages : public GuardedGridTest,
                              public ::testing::WithParamInterface<unsigned> {
protected:
    ULONG_PTR number() {
        static const ULONG_PTR kExtremes[] = {
            0,   1,      2,      3,      4,       7,          8,          255,
            256, 0x7FFF, 0x8000, 0xFFFF, 0x10000, 0x7FFFFFFF, 0x80000000, 0xFFFFFFFF};
        switch (random() % 4) {
        case 0: return kExtremes[random() % std::size(kExtremes)];
        case 1: return random() & 0xFFFFFFFF;
        default: return MAKELONG(random() % 300, random() % 200);
        }
    }

    void sendToGrid() {
        static const UINT kMessages[] = {
            WM_SIZE,         WM_SETFOCUS,   WM_KILLFOCUS,  WM_PAINT,         WM_KEYDOWN,
            WM_KEYUP,        WM_CHAR,       WM_COMMAND,    WM_TIMER,         WM_HSCROLL,
            WM_VSCROLL,      WM_MOUSEMOVE,  WM_MOUSEMOVE,  WM_LBUTTONDOWN,   WM_LBUTTONDOWN,
            WM_LBUTTONUP,    HCN_ITEMCLICK, HCN_ITEMCLICK, HCN_ITEMRESIZING, HCN_ITEMRESIZED,
            HCN_ITEMRESIZED, GRIDM_REDRAW,  WM_NULL,       WM_ENABLE,        WM_RBUTTONDOWN};
        const UINT message = kMessages[random() % std::size(kMessages)];
        WPARAM wParam = number();
        LPARAM lParam = static_cast<LPARAM>(number());
        if (message >= HCN_ITEMCLICK && message <= HCN_ITEMRESIZED && random() % 8)
            wParam = reinterpret_cast<WPARAM>(random() % 2 ? columnHeader : rowHeader);
        if (message == WM_KEYDOWN) wParam = 9 + random() % 38;
        if (message == WM_HSCROLL || message == WM_VSCROLL)
            wParam = MAKEWPARAM(random() % 6, random() % 3 ? random() % 300 : random());
        if (message == WM_TIMER) lParam = 0;
        if (message == WM_SETFOCUS || message == WM_KILLFOCUS) wParam = 0;
        if (message == WM_COMMAND || message == WM_HSCROLL || message == WM_VSCROLL) lParam = 0;
        SendMessageW(grid, message, wParam, lParam);
    }

    void sendToHeader() {
        static const UINT kMessages[] = {WM_MOUSEMOVE,   WM_LBUTTONDOWN,   WM_LBUTTONUP,   WM_PAINT,
                                         HCM_DELETEITEM, HCM_SETITEMSTATE, HCM_GETITEMSIZE};
        SendMessageW(random() % 2 ? columnHeader : rowHeader,
                     kMessages[random() % std::size(kMessages)], number() & 0x7FFFFFFF,
                     static_cast<LPARAM>(number()));
    }

    std::mt19937 random;
};

TEST_P(GridSenselessMessages, LeaveTheGridAlive) {
    random.seed(GetParam() * 7919);
    create(200, 120,
           GetParam() % 2 ? RecordingHost::kGridStyle : RecordingHost::kGridStyleWithBars);
    host.leaveOut(GRIDN_PAINTCELLS);
    for (int i = 0; i < 250; ++i) {
        if (random() % 5)
            sendToGrid();
        else
            sendToHeader();
        if (random() % 10 == 0) SetGridZoomLevel(1 + random() % 8);
        if (i % 25 == 0) host.pump();
        if (i % 60 == 59) ResetGrid();
        host.clear();
        spy.clearCalls();
    }
    ReleaseCapture();
    EXPECT_TRUE(IsWindow(grid));
    SetGridZoomLevel(4);
    ResetGrid();
    SetFirstVisibleCell(0);
    EXPECT_EQ(KorHeader_GetItemSize(columnHeader, 0), 60);
    EXPECT_EQ(HeaderLabel(columnHeader, 0), L"A");
}

INSTANTIATE_TEST_SUITE_P(Seeds, GridSenselessMessages, ::testing::Range(1u, 17u));

using GridUnknownHeader = GuardedGridTest;

TEST_F(GridUnknownHeader, NotificationsInAnotherNameDoNothing) {
    create(200, 120);
    const Picture before = ReadWindow(grid);
    for (const WPARAM sender :
         {WPARAM{0}, reinterpret_cast<WPARAM>(grid), reinterpret_cast<WPARAM>(edit), WPARAM{1}})
        for (const UINT message :
             {UINT{HCN_ITEMRESIZING}, UINT{HCN_ITEMRESIZED}, UINT{HCN_ITEMCLICK}})
            SendMessageW(grid, message, sender, MAKELPARAM(1, 40));
    EXPECT_TRUE(SamePicture(before, ReadWindow(grid)));
    SetFirstVisibleCell(0);
    for (const int size : HeaderSizes(columnHeader)) EXPECT_EQ(size, 60);
    for (const int size : HeaderSizes(rowHeader)) EXPECT_EQ(size, 16);
}

using GridAlone = GuardedGridTest;

// Without a parent there is nobody to notify; the screen's text gives the equation bar's height.
TEST_F(GridAlone, WindowWithoutAParentWorks) {
    ASSERT_NE(RegisterGridControl(GetModuleHandleW(nullptr)), 0u);
    grid = CreateWindowExW(0, KORGRID_CLASS, L"", WS_POPUP | WS_VISIBLE | WS_CLIPCHILDREN, 0, 0,
                           300, 200, nullptr, nullptr, GetModuleHandleW(nullptr), nullptr);
    ASSERT_NE(grid, nullptr);
    host.pump();
    EXPECT_EQ(ChildRect(EquationEditOf(grid)), (RECT{75, 0, 300, EquationBarHeightFor(nullptr)}));
    SendMessageW(grid, GRIDM_REDRAW, 0, 0);
    PressAt(grid, 100, 100);
    ReleaseAt(grid, 100, 100);
    SendResized(grid, ColumnHeaderOf(grid), 0, 70);
    EXPECT_EQ(KorHeader_GetItemSize(ColumnHeaderOf(grid), 0), 70);
}

using GridTwice = GuardedGridTest;

// There is one grid in a process; a second window takes its place and breaks nothing else.
TEST_F(GridTwice, SecondWindowDoesNoHarm) {
    create(300, 200);
    const HWND first = grid;
    SetColumnWidth(0, 70);
    create(200, 150);
    for (const HWND window : {first, grid}) {
        SendMessageW(window, GRIDM_REDRAW, 0, 0);
        PressAt(window, 60, 60);
        ReleaseAt(window, 60, 60);
        SetWindowPos(window, nullptr, 0, 0, 220, 160, SWP_NOMOVE | SWP_NOZORDER);
    }
    DestroyWindow(first);
    SendMessageW(grid, GRIDM_REDRAW, 0, 0);
    SetColumnWidth(0, 70);
    DestroyWindow(grid);
    ResetGrid();
    EXPECT_EQ(heap.report(), "");
}

}  // namespace
}  // namespace kortest
