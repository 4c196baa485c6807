// "X", "OK" and "fx" beside the equation edit, pressed and released as by a pointer.
#include "grid/equation_fixture.h"

namespace kortest {
namespace {

class EquationButtons : public EquationUse {
protected:
    HWND ok() const { return OkButtonOf(grid); }
    HWND fx() const { return FunctionButtonOf(grid); }
    HWND cancel() const { return CancelButtonOf(grid); }

    Lines afterPress(HWND button) {
        told();
        EXPECT_EQ(PressAt(button, 5, 5), 0);
        return told();
    }
    Lines afterRelease(HWND button) {
        told();
        ReleaseAt(button, 5, 5);
        return told();
    }
};

TEST_F(EquationButtons, OkCommitsByTheFocusItTakesAndGoesDown) {
    startTyping(L"5");
    EXPECT_EQ(afterPress(ok()),
              (Lines{"sent GRIDN_EDITKILLFOCUS 0", "sent GRIDN_EQUATIONENTERED \"5\" B2", kPainted,
                     "sent GRIDN_CURRENTCELL B3"}));
    EXPECT_EQ(afterRelease(ok()), Lines{});  // its click finds nothing to commit
    host.pump();
    EXPECT_EQ(told(), Lines{});
}

TEST_F(EquationButtons, OkWithoutATextGoesDown) {
    Select(1, 1, 1, 1);
    EXPECT_EQ(afterPress(ok()), (Lines{"sent GRIDN_CURRENTCELL B3"}));
    EXPECT_EQ(afterRelease(ok()), Lines{});
}

// The click comes with the release: what is pending then goes to the cell that the press moved to.
TEST_F(EquationButtons, OkCommitsPendingTextWhenItIsReleased) {
    Select(1, 1, 1, 1);
    enter(L"5");
    EXPECT_EQ(afterPress(ok()), (Lines{"sent GRIDN_CURRENTCELL B3"}));
    EXPECT_EQ(afterRelease(ok()), (Lines{"sent GRIDN_EQUATIONENTERED \"5\" B3", kPainted}));
}

TEST_F(EquationButtons, OkPassesThePressOnBeforeTheKey) {
    host.alsoRecord(grid, "grid");
    spy.watch("CallWindowProcW");
    spy.watch("SendMessageW");
    told();
    PressAt(ok(), 5, 5);
    EXPECT_EQ(told(), (Lines{"grid sent WM_KEYDOWN 40 1", "sent GRIDN_CURRENTCELL A2"}));
    EXPECT_EQ(passedOn(ok(), WM_LBUTTONDOWN, MK_LBUTTON), 1);
    EXPECT_EQ(GetCapture(), ok());
    EXPECT_EQ(spy.calls()[0].name, "CallWindowProcW");
    told();
    ReleaseAt(ok(), 5, 5);
    const Lines lines = told();
    ASSERT_EQ(lines.size(), 1u);
    EXPECT_EQ(lines[0].rfind("grid sent WM_COMMAND 7 ", 0), 0u) << lines[0];
}

TEST_F(EquationButtons, OkWithShiftAndAnchorExtends) {
    anchorAt(2, 3);
    KeyHeld shift(VK_SHIFT);
    PressAt(ok(), 5, 5);
    EXPECT_EQ(Selection(), Block(2, 2, 3, 4));
}

TEST_F(EquationButtons, FunctionButtonPostsTheHostsCommand) {
    SetFunctionButtonMessageID(4711);
    EXPECT_EQ(afterPress(fx()), Lines{});
    host.pump();
    EXPECT_EQ(told(), (Lines{"posted WM_COMMAND 4711 0"}));
    EXPECT_EQ(afterRelease(fx()), Lines{});
    host.pump();
    EXPECT_EQ(told(), Lines{});
}

TEST_F(EquationButtons, FunctionButtonsCommandIsZeroAtFirst) {
    PressAt(fx(), 5, 5);
    host.pump();
    EXPECT_EQ(told(), (Lines{"posted WM_COMMAND 0 0"}));
}

TEST_F(EquationButtons, FunctionButtonsNumberHas32Bits) {
    spy.watch("PostMessageW");
    SetFunctionButtonMessageID(0xFEDCBA98);
    PressAt(fx(), 5, 5);
    const auto calls = spy.callsOf("PostMessageW");
    ASSERT_EQ(calls.size(), 1u);
    EXPECT_EQ(ArgumentsOf(calls[0]),
              (std::vector<DWORD>{HandleValue(host.window()), WM_COMMAND, 0xFEDCBA98, 0}));
}

TEST_F(EquationButtons, FunctionButtonMovesNothing) {
    Select(1, 1, 1, 1);
    PressAt(fx(), 5, 5);
    ReleaseAt(fx(), 5, 5);
    EXPECT_EQ(Selection(), Block(1, 1, 1, 1));
}

// Both buttons have id 7, so a click on "fx" commits as well.
TEST_F(EquationButtons, FunctionButtonCommitsToo) {
    EXPECT_EQ(GetDlgCtrlID(ok()), 7);
    EXPECT_EQ(GetDlgCtrlID(fx()), 7);
    Select(1, 1, 1, 1);
    enter(L"5");
    EXPECT_EQ(afterPress(fx()), Lines{});
    EXPECT_EQ(afterRelease(fx()), (Lines{"sent GRIDN_EQUATIONENTERED \"5\" B2", kPainted}));
    startTyping(L"6");
    EXPECT_EQ(afterPress(fx()), (Lines{"sent GRIDN_EDITKILLFOCUS 0",
                                       "sent GRIDN_EQUATIONENTERED \"6\" B2", kPainted}));
}

TEST_F(EquationButtons, FunctionButtonPassesThePressOnFirst) {
    spy.watch("CallWindowProcW");
    spy.watch("PostMessageW");
    PressAt(fx(), 5, 5);
    EXPECT_EQ(passedOn(fx(), WM_LBUTTONDOWN, MK_LBUTTON), 1);
    EXPECT_EQ(spy.calls()[0].name, "CallWindowProcW");
    EXPECT_EQ(spy.count("PostMessageW"), 1);
}

TEST_F(EquationButtons, CancelTellsOnThePressAndAgainOnTheClick) {
    Select(1, 1, 1, 1);
    SetWindowTextW(edit, L"5");
    EXPECT_EQ(afterPress(cancel()), (Lines{"sent GRIDN_CURRENTCELL B2"}));
    EXPECT_EQ(TextOf(edit), L"");
    SetWindowTextW(edit, L"6");
    EXPECT_EQ(afterRelease(cancel()), (Lines{"sent GRIDN_CURRENTCELL B2"}));
    EXPECT_EQ(TextOf(edit), L"");
}

TEST_F(EquationButtons, CancelComesBeforeTheFocusChange) {
    startTyping(L"5");
    spy.watch("CallWindowProcW");
    // With a modified flag that outlives a new text, taking the focus commits the emptied bar.
    host.onMessage = [&](UINT message, WPARAM wParam, LPARAM) {
        if (message == WM_NOTIFY && wParam == GRIDN_CURRENTCELL) setModified(true);
        return LRESULT{0};
    };
    EXPECT_EQ(afterPress(cancel()),
              (Lines{"sent GRIDN_CURRENTCELL B2", "sent GRIDN_EDITKILLFOCUS 0",
                     "sent GRIDN_EQUATIONEMPTY B2", kPainted}));
    EXPECT_EQ(passedOn(cancel(), WM_LBUTTONDOWN, MK_LBUTTON), 1);
}

TEST_F(EquationButtons, CancelClickIsCommandEight) {
    EXPECT_EQ(GetDlgCtrlID(cancel()), 8);
    host.alsoRecord(grid, "grid");
    PressAt(cancel(), 5, 5);
    told();
    ReleaseAt(cancel(), 5, 5);
    const Lines lines = told();  // between these two the edit tells of its new text
    ASSERT_GE(lines.size(), 2u);
    EXPECT_EQ(lines.front().rfind("grid sent WM_COMMAND 8 ", 0), 0u) << lines.front();
    EXPECT_EQ(lines.back(), "sent GRIDN_CURRENTCELL A1");
}

TEST_F(EquationButtons, ReleasedElsewhereNothingIsClicked) {
    Select(1, 1, 1, 1);
    enter(L"5");
    PressAt(ok(), 5, 5);
    EXPECT_EQ(GetCapture(), ok());
    told();
    ReleaseAt(ok(), 500, 500);
    EXPECT_EQ(told(), Lines{});
    EXPECT_TRUE(isModified());
}

TEST_F(EquationButtons, OnlyThePressIsSpecial) {
    Select(1, 1, 1, 1);
    told();
    for (HWND button : {ok(), fx(), cancel()}) {
        SendMessageW(button, WM_MOUSEMOVE, 0, MAKELPARAM(5, 5));
        SendMessageW(button, WM_RBUTTONDOWN, MK_RBUTTON, MAKELPARAM(5, 5));
        SendMessageW(button, WM_RBUTTONUP, 0, MAKELPARAM(5, 5));
        SendMessageW(button, WM_LBUTTONUP, 0, MAKELPARAM(5, 5));
        PressKey(button, VK_DOWN);
    }
    host.pump();
    EXPECT_EQ(told(), Lines{});
    EXPECT_EQ(Selection(), Block(1, 1, 1, 1));
}

TEST_F(EquationButtons, AllOtherMessagesReachTheSystemsButton) {
    spy.watch("CallWindowProcW");
    for (HWND button : {ok(), fx(), cancel()}) {
        spy.clearCalls();
        EXPECT_EQ(SendMessageW(button, WM_GETDLGCODE, 0, 0) & DLGC_BUTTON, DLGC_BUTTON);
        EXPECT_EQ(passedOn(button, WM_GETDLGCODE, 0), 1);
    }
    EXPECT_EQ(TextOf(ok()), L"OK");
    EXPECT_EQ(TextOf(fx()), L"fx");
    EXPECT_EQ(TextOf(cancel()), L"X");
}

}  // namespace
}  // namespace kortest
