// Focus changes between the grid and its edit.
#include "grid/equation_fixture.h"

namespace kortest {
namespace {

class EquationFocus : public EquationUse {};

TEST_F(EquationFocus, NobodyHadItAtFirst) { EXPECT_EQ(GetControlWithFocus(), nullptr); }

TEST_F(EquationFocus, LastOfTheTwoIsRemembered) {
    SetFocus(edit);
    EXPECT_EQ(GetControlWithFocus(), edit);
    SetFocus(host.window());
    EXPECT_EQ(GetControlWithFocus(), edit);
    SetFocus(grid);
    EXPECT_EQ(GetControlWithFocus(), grid);
    SetFocus(OkButtonOf(grid));
    EXPECT_EQ(GetControlWithFocus(), grid);
    SetFocus(nullptr);
    EXPECT_EQ(GetControlWithFocus(), grid);
}

TEST_F(EquationFocus, IsStoredBeforeTheHostIsTold) {
    HWND seen = nullptr;
    host.onMessage = [&](UINT message, WPARAM wParam, LPARAM) {
        if (message == WM_NOTIFY && wParam == GRIDN_EDITFOCUS) seen = GetControlWithFocus();
        return LRESULT{0};
    };
    SetFocus(edit);
    EXPECT_EQ(seen, edit);
}

TEST_F(EquationFocus, GainAndLossAreHandedOn) {
    SetFocus(grid);
    spy.watch("CallWindowProcW");
    const auto count = [&](UINT message) {
        int found = 0;
        for (const ImportCall& call : spy.callsOf("CallWindowProcW")) {
            found += ArgumentsOf(call)[1] == HandleValue(edit) && ArgumentsOf(call)[2] == message;
        }
        return found;
    };
    SetFocus(edit);
    EXPECT_EQ(count(WM_SETFOCUS), 1);
    SetFocus(grid);
    EXPECT_EQ(count(WM_KILLFOCUS), 1);
}

TEST_F(EquationFocus, GridsFocusGoesOnToTheSystem) {
    spy.watch("DefWindowProcW");
    SetFocus(grid);
    int passed = 0;
    for (const ImportCall& call : spy.callsOf("DefWindowProcW")) {
        passed += ArgumentsOf(call)[0] == HandleValue(grid) &&
                  ArgumentsOf(call)[1] == static_cast<DWORD>(WM_SETFOCUS);
    }
    EXPECT_EQ(passed, 1);
    EXPECT_EQ(told(), Lines{});
}

TEST_F(EquationFocus, LossIsToldBeforeTheCommit) {
    startTyping(L"5");
    bool wasModified = false;
    host.onMessage = [&](UINT message, WPARAM wParam, LPARAM) {
        if (message == WM_NOTIFY && wParam == GRIDN_EDITKILLFOCUS) wasModified = isModified();
        return LRESULT{0};
    };
    SetFocus(host.window());
    EXPECT_TRUE(wasModified);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EDITKILLFOCUS 0", "sent GRIDN_EQUATIONENTERED \"5\" B2",
                             kPainted}));
}

// The host can take a text back while the edit loses the focus.
TEST_F(EquationFocus, HostCanUndoTheChangeWhenItIsTold) {
    startTyping(L"5");
    host.onMessage = [&](UINT message, WPARAM wParam, LPARAM) {
        if (message == WM_NOTIFY && wParam == GRIDN_EDITKILLFOCUS) setModified(false);
        return LRESULT{0};
    };
    SetFocus(grid);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EDITKILLFOCUS 0"}));
}

TEST_F(EquationFocus, OnlyThePressInTheGridCountsAsOne) {
    startTyping(L"5");
    press(middleX(3), middleY(3));
    release();
    EXPECT_EQ(told()[0], "sent GRIDN_EDITKILLFOCUS 1");
    SetFocus(edit);
    told();
    SetFocus(grid);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EDITKILLFOCUS 0"}));
    // A press while the grid has the focus already must not be remembered either.
    press(middleX(3), middleY(3));
    release();
    SetFocus(edit);
    told();
    SetFocus(grid);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EDITKILLFOCUS 0"}));
}

TEST_F(EquationFocus, EmptyTextIsCommittedByEveryLoss) {
    startTyping(L"");
    SetFocus(grid);
    SetFocus(edit);
    SetFocus(grid);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EDITKILLFOCUS 0", "sent GRIDN_EQUATIONEMPTY B2", kPainted,
                             "sent GRIDN_EDITFOCUS 0", "sent GRIDN_EDITKILLFOCUS 0",
                             "sent GRIDN_EQUATIONEMPTY B2", kPainted}));
}

TEST_F(EquationFocus, SelectionMovedMeanwhileGetsTheText) {
    startTyping(L"5");
    Select(3, 3, 3, 3);
    SetFocus(grid);
    EXPECT_EQ(told()[1], "sent GRIDN_EQUATIONENTERED \"5\" D4");
}

}  // namespace
}  // namespace kortest
