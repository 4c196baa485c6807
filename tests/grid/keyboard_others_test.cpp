// Tab, Enter, Delete, the keys without a meaning, and the keys of the system.
#include "grid/use_grid.h"

namespace kortest {
namespace {

class OtherKeys : public GridUse {
protected:
    void SetUp() override {
        open(330, 168);
        told();
    }
};

TEST_F(OtherKeys, TabGoesRightAndWithShiftLeft) {
    Select(2, 2, 3, 3);
    EXPECT_EQ(PressKey(grid, VK_TAB), 0);
    EXPECT_EQ(Selection(), Block(3, 3, 3, 3));
    KeyHeld shift(VK_SHIFT);
    EXPECT_EQ(PressKey(grid, VK_TAB), 0);
    EXPECT_EQ(PressKey(grid, VK_TAB), 0);
    EXPECT_EQ(Selection(), Block(1, 1, 3, 3));
    EXPECT_EQ(told(), (Lines{"sent GRIDN_CURRENTCELL D4", "sent GRIDN_CURRENTCELL C4",
                             "sent GRIDN_CURRENTCELL B4"}));
}

TEST_F(OtherKeys, EnterGoesDownAlsoWithShift) {
    Select(2, 2, 3, 3);
    EXPECT_EQ(PressKey(grid, VK_RETURN), 0);
    EXPECT_EQ(Selection(), Block(2, 2, 4, 4));
    KeyHeld shift(VK_SHIFT);
    EXPECT_EQ(PressKey(grid, VK_RETURN), 0);
    EXPECT_EQ(Selection(), Block(2, 2, 5, 5));
    EXPECT_EQ(told(), (Lines{"sent GRIDN_CURRENTCELL C5", "sent GRIDN_CURRENTCELL C6"}));
}

// They go through the grid's own key message, with the anchor gone already.
TEST_F(OtherKeys, TabAndEnterSendAnArrowKey) {
    anchorAt(2, 3);
    host.alsoRecord(grid, "grid");
    SetFocus(grid);
    told();
    PressKey(grid, VK_TAB);
    EXPECT_EQ(told(), (Lines{"grid sent WM_KEYDOWN 9 1", "grid sent WM_KEYDOWN 39 1",
                             "sent GRIDN_CURRENTCELL D4"}));
    KeyHeld shift(VK_SHIFT);
    PressKey(grid, VK_TAB);
    EXPECT_EQ(told(), (Lines{"grid sent WM_KEYDOWN 9 1", "grid sent WM_KEYDOWN 37 1",
                             "sent GRIDN_CURRENTCELL C4"}));
    PressKey(grid, VK_RETURN);
    EXPECT_EQ(told(), (Lines{"grid sent WM_KEYDOWN 13 1", "grid sent WM_KEYDOWN 40 1",
                             "sent GRIDN_CURRENTCELL C5"}));
    EXPECT_EQ(Selection(), Block(2, 2, 4, 4));
}

// The anchor is gone before the arrow key comes, so Shift does not extend.
TEST_F(OtherKeys, TabAndEnterWithShiftMoveAlsoWithAnAnchor) {
    anchorAt(2, 3);
    KeyHeld shift(VK_SHIFT);
    PressKey(grid, VK_TAB);
    EXPECT_EQ(Selection(), Block(1, 1, 3, 3));
    anchorAt(2, 3);
    PressKey(grid, VK_RETURN);
    EXPECT_EQ(Selection(), Block(2, 2, 4, 4));
}

TEST_F(OtherKeys, TabAndEnterTakeTheFocus) {
    SetFocus(edit);
    told();
    PressKey(grid, VK_TAB);
    EXPECT_EQ(GetFocus(), grid);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EDITKILLFOCUS 0", "sent GRIDN_CURRENTCELL B1"}));
    SetFocus(edit);
    told();
    PressKey(grid, VK_RETURN);
    EXPECT_EQ(GetFocus(), grid);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EDITKILLFOCUS 0", "sent GRIDN_CURRENTCELL B2"}));
}

TEST_F(OtherKeys, ArrowKeysLeaveTheFocus) {
    SetFocus(edit);
    PressKey(grid, VK_RIGHT);
    EXPECT_EQ(GetFocus(), edit);
}

TEST_F(OtherKeys, DeleteIsTheHosts) {
    anchorAt(2, 3);
    Select(2, 4, 3, 5);
    told();
    EXPECT_EQ(PressKey(grid, VK_DELETE), 0);
    EXPECT_EQ(told(), (Lines{"sent WM_KEYDOWN 46 1"}));
    EXPECT_EQ(SendMessageW(grid, WM_KEYDOWN, VK_DELETE, 0x00530001), 0);
    EXPECT_EQ(told(), (Lines{"sent WM_KEYDOWN 46 1"}));
    EXPECT_EQ(Selection(), Block(2, 4, 3, 5));
}

// Of the keys from Tab to Delete those without a row of their own are swallowed; all others are
// the system's.
TEST_F(OtherKeys, EveryKeyWithoutAMeaning) {
    spy.watch("DefWindowProcW");
    host.pump();
    for (WPARAM key = 0; key < 256; ++key) {
        const bool isInTable = key == VK_TAB || key == VK_RETURN || key == VK_PRIOR ||
                               key == VK_NEXT || (key >= VK_LEFT && key <= VK_DOWN) ||
                               key == VK_DELETE;
        if (isInTable) continue;
        spy.clearCalls();
        const LRESULT result = PressKey(grid, key);
        const bool isExamined = key >= 9 && key <= 46;
        EXPECT_EQ(spy.count("DefWindowProcW"), isExamined ? 0 : 1) << key;
        if (isExamined) {
            EXPECT_EQ(result, 0) << key;
        }
    }
    EXPECT_EQ(Selection(), Block(0, 0, 0, 0));
    EXPECT_EQ(VisibleRange(), Range(0, 6, 0, 11));
    EXPECT_EQ(told(), Lines{});
}

TEST_F(OtherKeys, KeysOfTheTableAreNotTheSystems) {
    SetFocus(grid);
    host.pump();
    spy.watch("DefWindowProcW");
    for (const WPARAM key :
         {VK_TAB, VK_RETURN, VK_LEFT, VK_UP, VK_RIGHT, VK_DOWN, VK_DELETE, VK_CONTROL, VK_ESCAPE}) {
        spy.clearCalls();
        PressKey(grid, key);
        for (const ImportCall& call : spy.callsOf("DefWindowProcW")) {
            EXPECT_NE(ArgumentsOf(call)[1], static_cast<DWORD>(WM_KEYDOWN)) << key;
        }
    }
}

TEST_F(OtherKeys, KeyReleasesAnswerZeroAndDoNothing) {
    spy.watch("DefWindowProcW");
    for (const WPARAM key : {VK_TAB, VK_RIGHT, VK_DELETE, VK_F10, VK_MENU}) {
        EXPECT_EQ(SendMessageW(grid, WM_KEYUP, key, 1), 0);
    }
    EXPECT_EQ(spy.count("DefWindowProcW"), 0);
    EXPECT_EQ(told(), Lines{});
}

TEST_F(OtherKeys, ArrowKeysIgnoreTheRepeatCount) {
    EXPECT_EQ(SendMessageW(grid, WM_KEYDOWN, VK_RIGHT, 0x014D0005), 0);
    EXPECT_EQ(Selection(), Block(1, 1, 0, 0));
}

// ---- Without a current cell ---------------------------------------------------------------------

// A page down before the first size makes the view's origin negative; then there is no current
// cell.
class KeysWithoutACurrentCell : public GridUse {
protected:
    void SetUp() override {
        grid = host.createGrid(0, 0);
        edit = EquationEditOf(grid);
        scrollRows(SB_PAGEDOWN);
        GridCellPair cell{};
        ASSERT_EQ(GetCurrentSelectedCell(&cell), 0u);
        SetFocus(edit);
        told();
    }
};

TEST_F(KeysWithoutACurrentCell, TabAndEnterAnswerOneAndDoNothing) {
    EXPECT_EQ(PressKey(grid, VK_TAB), 1);
    EXPECT_EQ(PressKey(grid, VK_RETURN), 1);
    EXPECT_EQ(GetFocus(), edit);
    EXPECT_EQ(Selection(), Block(0, 0, 0, 0));
    EXPECT_EQ(told(), Lines{});
}

TEST_F(KeysWithoutACurrentCell, EditsKeysAnswerOneAndDoNothing) {
    EXPECT_EQ(PressKey(edit, VK_RETURN), 1);
    EXPECT_EQ(PressKey(edit, VK_TAB), 1);
    EXPECT_EQ(PressKey(edit, VK_LEFT), 1);
    EXPECT_EQ(PressKey(edit, VK_UP), 1);
    EXPECT_EQ(PressKey(edit, VK_RIGHT), 1);
    EXPECT_EQ(PressKey(edit, VK_DOWN), 1);
    EXPECT_EQ(GetFocus(), edit);
    EXPECT_EQ(told(), Lines{});
}

TEST_F(KeysWithoutACurrentCell, NothingIsCommitted) {
    SetWindowTextW(edit, L"5");
    SendMessageW(edit, EM_SETMODIFY, TRUE, 0);
    EXPECT_EQ(PressOKButton(), 1);
    EXPECT_EQ(send(WM_COMMAND, 7), 1);
    SetFocus(grid);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EDITKILLFOCUS 0"}));
    EXPECT_NE(SendMessageW(edit, EM_GETMODIFY, 0, 0), 0);
}

}  // namespace
}  // namespace kortest
