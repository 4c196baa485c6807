#include "support/recording_host.h"

#include "support/input.h"

#include <gtest/gtest.h>

namespace kortest {
namespace {

template <typename Data>
LPARAM Pointer(const Data& data) {
    return reinterpret_cast<LPARAM>(&data);
}

int timerTicks;

void CALLBACK CountTick(HWND, UINT, UINT_PTR, DWORD) { ++timerTicks; }

// Never validates itself.
LRESULT CALLBACK StubbornProc(HWND window, UINT message, WPARAM wParam, LPARAM lParam) {
    if (message == WM_PAINT) return 1;
    return DefWindowProcW(window, message, wParam, lParam);
}

class RecordingHostTest : public ::testing::Test {
protected:
    RecordingHost host{200, 100};
};

TEST_F(RecordingHostTest, TellsPostedFromSent) {
    PostMessageW(host.window(), WM_COMMAND, 77, 0);
    SendMessageW(host.window(), WM_COMMAND, 78, 0);
    host.pump();
    EXPECT_EQ(host.transcript(), (Lines{"sent WM_COMMAND 78 0", "posted WM_COMMAND 77 0"}));
}

TEST_F(RecordingHostTest, CallsAMessageSentThatArrivesInsideAPostedOneOfItsNumber) {
    int rounds = 0;
    host.onMessage = [&](UINT message, WPARAM wParam, LPARAM lParam) -> LRESULT {
        if (rounds++ == 0) SendMessageW(host.window(), message, wParam, lParam);
        return 5;
    };
    PostMessageW(host.window(), WM_COMMAND, 77, 0);
    host.pump();
    EXPECT_EQ(host.transcript(), (Lines{"posted WM_COMMAND 77 0", "sent WM_COMMAND 77 0"}));
    EXPECT_EQ(SendMessageW(host.window(), WM_COMMAND, 77, 0), 5);
}

TEST_F(RecordingHostTest, DecodesTheGridsNotifications) {
    const GridVisibleRange range{1, 2, 3, 4};
    const GridCellPair cell{1, 3};
    const GridSelection block{1, 255, 3, 16383};
    SendMessageW(host.window(), WM_NOTIFY, GRIDN_PAINTCELLS, Pointer(range));
    SendMessageW(host.window(), WM_NOTIFY, GRIDN_CELLCLICKED, Pointer(cell));
    SendMessageW(host.window(), WM_NOTIFY, GRIDN_CURRENTCELL, Pointer(cell));
    SendMessageW(host.window(), WM_NOTIFY, GRIDN_SELECTING, Pointer(block));
    SendMessageW(host.window(), WM_NOTIFY, GRIDN_SELECTIONDONE, Pointer(block));
    SendMessageW(host.window(), WM_NOTIFY, GRIDN_COLUMNRESIZED, MAKELPARAM(50, 3));
    SendMessageW(host.window(), WM_NOTIFY, GRIDN_ROWRESIZED, MAKELPARAM(20, 4));
    SendMessageW(host.window(), WM_NOTIFY, GRIDN_EDITFOCUS, 0);
    SendMessageW(host.window(), WM_NOTIFY, GRIDN_EDITKILLFOCUS, 1);
    SendMessageW(host.window(), WM_NOTIFY, 3426, 9);
    EXPECT_EQ(host.transcript(),
              (Lines{"sent GRIDN_PAINTCELLS columns 1-2 rows 3-4", "sent GRIDN_CELLCLICKED B4",
                     "sent GRIDN_CURRENTCELL B4", "sent GRIDN_SELECTING B4:IV16384",
                     "sent GRIDN_SELECTIONDONE B4:IV16384", "sent GRIDN_COLUMNRESIZED 3 50",
                     "sent GRIDN_ROWRESIZED 4 20", "sent GRIDN_EDITFOCUS 0",
                     "sent GRIDN_EDITKILLFOCUS 1", "sent WM_NOTIFY 3426 9"}));
}

TEST_F(RecordingHostTest, DecodesTheOtherMessages) {
    SendMessageW(host.window(), GRIDN_EQUATIONENTERED, reinterpret_cast<WPARAM>(L"5\u00e9"),
                 MAKELPARAM(3, 1));
    SendMessageW(host.window(), GRIDN_EQUATIONEMPTY, 0, MAKELPARAM(3, 1));
    SendMessageW(host.window(), WM_KEYDOWN, VK_DELETE, 1);
    SendMessageW(host.window(), HCN_ITEMCLICK, 1, MAKELPARAM(2, 3));
    EXPECT_EQ(host.transcript(),
              (Lines{"sent GRIDN_EQUATIONENTERED \"5\u00e9\" B4", "sent GRIDN_EQUATIONEMPTY B4",
                     "sent WM_KEYDOWN 46 1", "sent HCN_ITEMCLICK unknown 2 3"}));
}

TEST_F(RecordingHostTest, LeavesOutWhatItIsToldAndClears) {
    host.leaveOut(WM_COMMAND);
    SendMessageW(host.window(), WM_COMMAND, 1, 0);
    SendMessageW(host.window(), WM_KEYDOWN, 46, 1);
    EXPECT_EQ(host.transcript(), Lines{"sent WM_KEYDOWN 46 1"});
    host.clear();
    EXPECT_EQ(host.transcript(), Lines{});
}

TEST_F(RecordingHostTest, LetsTheTestDrawCells) {
    GridVisibleRange seen{};
    host.onPaintCells = [&](const GridVisibleRange& range) { seen = range; };
    const GridVisibleRange range{1, 2, 3, 4};
    SendMessageW(host.window(), WM_NOTIFY, GRIDN_PAINTCELLS, Pointer(range));
    EXPECT_EQ(seen.endRow, 4);
}

TEST_F(RecordingHostTest, RecordsAnotherWindowWithItsLabel) {
    HWND edit = CreateWindowExW(0, L"EDIT", L"", WS_CHILD | WS_VISIBLE, 0, 0, 50, 20, host.window(),
                                nullptr, nullptr, nullptr);
    host.alsoRecord(edit, "edit");
    PostMessageW(edit, WM_CHAR, 'x', 1);
    host.pump();
    SendMessageW(edit, EM_SETMODIFY, 0, 0);
    EXPECT_EQ(TextOf(edit), L"x");
    Lines lines = host.transcript();
    std::erase_if(lines, [](const std::string& line) { return line.rfind("edit ", 0) != 0; });
    EXPECT_EQ(lines, (Lines{"edit posted WM_CHAR 120 1", "edit sent EM_SETMODIFY 0 0"}));
}

TEST_F(RecordingHostTest, LetsTimersRunWhilePumpingForATime) {
    timerTicks = 0;
    SetTimer(host.window(), 1, 20, CountTick);
    host.pumpFor(300);
    KillTimer(host.window(), 1);
    EXPECT_GE(timerTicks, 3);
}

TEST_F(RecordingHostTest, ThrowsAwayMovesThatNoTestMade) {
    HWND edit = CreateWindowExW(0, L"EDIT", L"select", WS_CHILD | WS_VISIBLE, 0, 0, 90, 20,
                                host.window(), nullptr, nullptr, nullptr);
    SendMessageW(edit, WM_LBUTTONDOWN, MK_LBUTTON, MAKELPARAM(2, 5));
    PostMessageW(edit, WM_MOUSEMOVE, 0, MAKELPARAM(60, 5));
    host.pump();
    DWORD end = 0;
    SendMessageW(edit, EM_GETSEL, 0, reinterpret_cast<LPARAM>(&end));
    EXPECT_EQ(end, 0u);
    PostMessageW(edit, WM_MOUSEMOVE, MK_LBUTTON, MAKELPARAM(60, 5));
    host.pump();
    SendMessageW(edit, EM_GETSEL, 0, reinterpret_cast<LPARAM>(&end));
    EXPECT_EQ(end, 6u);
    SendMessageW(edit, WM_LBUTTONUP, 0, MAKELPARAM(60, 5));
}

TEST_F(RecordingHostTest, GivesUpOnAWindowThatStaysInvalid) {
    HWND stubborn = CreateWindowExW(0, L"STATIC", L"", WS_CHILD | WS_VISIBLE, 0, 0, 50, 20,
                                    host.window(), nullptr, nullptr, nullptr);
    SetWindowLongPtrW(stubborn, GWLP_WNDPROC, reinterpret_cast<LONG_PTR>(&StubbornProc));
    InvalidateRect(stubborn, nullptr, TRUE);
    host.pump();
    EXPECT_TRUE(GetUpdateRect(stubborn, nullptr, FALSE));
}

TEST_F(RecordingHostTest, HoldsAKeyDown) {
    EXPECT_FALSE(GetKeyState(VK_SHIFT) & 0x8000);
    {
        const KeyHeld shift(VK_SHIFT);
        EXPECT_TRUE(GetKeyState(VK_SHIFT) & 0x8000);
    }
    EXPECT_FALSE(GetKeyState(VK_SHIFT) & 0x8000);
}

TEST(CellNames, ReachPastTheSheet) {
    EXPECT_EQ(CellName(0, 0), "A1");
    EXPECT_EQ(CellName(25, 9), "Z10");
    EXPECT_EQ(CellName(26, 9), "AA10");
    EXPECT_EQ(CellName(255, 16383), "IV16384");
    EXPECT_EQ(CellName(256, 16384), "IW16385");
    EXPECT_EQ(CellName(702, 0), "AAA1");
}

}  // namespace
}  // namespace kortest
