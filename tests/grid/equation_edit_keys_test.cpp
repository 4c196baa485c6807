// The keys that the equation edit treats itself, and those that it leaves to the system's edit.
#include "grid/equation_fixture.h"

namespace kortest {
namespace {

class EditKeys : public EquationUse {
protected:
    void SetUp() override {
        EquationUse::SetUp();
        startTyping(L"5");
        spy.watch("CallWindowProcW");
    }

    const Lines committed{"sent GRIDN_EDITKILLFOCUS 0", "sent GRIDN_EQUATIONENTERED \"5\" B2",
                          kPainted};
    Lines committedThen(const std::string& line) const {
        Lines lines = committed;
        lines.push_back(line);
        return lines;
    }
};

TEST_F(EditKeys, EnterCommitsAndGoesDown) {
    PressKey(edit, VK_RETURN);
    EXPECT_EQ(told(), committedThen("sent GRIDN_CURRENTCELL B3"));
    EXPECT_EQ(GetFocus(), grid);
    EXPECT_EQ(passedOn(edit, WM_KEYDOWN, VK_RETURN), 1);
}

TEST_F(EditKeys, EnterWithNothingTypedJustGoesDown) {
    setModified(false);
    PressKey(edit, VK_RETURN);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EDITKILLFOCUS 0", "sent GRIDN_CURRENTCELL B3"}));
}

TEST_F(EditKeys, TabCommitsAndGoesRight) {
    EXPECT_EQ(PressKey(edit, VK_TAB), 0);
    EXPECT_EQ(told(), committedThen("sent GRIDN_CURRENTCELL C2"));
    EXPECT_EQ(GetFocus(), grid);
    EXPECT_EQ(passedOn(edit, WM_KEYDOWN, VK_TAB), 0);
}

TEST_F(EditKeys, ShiftTabCommitsAndGoesLeft) {
    KeyHeld shift(VK_SHIFT);
    EXPECT_EQ(PressKey(edit, VK_TAB), 0);
    EXPECT_EQ(told(), committedThen("sent GRIDN_CURRENTCELL A2"));
}

TEST_F(EditKeys, EnterAndTabSendTheGridAnArrowKey) {
    host.alsoRecord(grid, "grid");
    host.leaveOut(GRIDN_PAINTCELLS);
    host.leaveOut(GRIDM_REDRAW);
    host.leaveOut(WM_SETFOCUS);
    host.leaveOut(WM_COMMAND);
    PressKey(edit, VK_RETURN);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EDITKILLFOCUS 0", "sent GRIDN_EQUATIONENTERED \"5\" B2",
                             "grid sent WM_KEYDOWN 40 1", "sent GRIDN_CURRENTCELL B3"}));
}

// In the grid Tab and Enter clear the anchor; in the edit they do not.
TEST_F(EditKeys, EnterAndTabKeepTheAnchor) {
    anchorAt(2, 3);
    SetFocus(edit);
    KeyHeld shift(VK_SHIFT);
    PressKey(edit, VK_RETURN);
    EXPECT_EQ(Selection(), Block(2, 2, 3, 4));
    SetFocus(edit);
    PressKey(edit, VK_TAB);
    EXPECT_EQ(Selection(), Block(1, 2, 3, 4));
}

TEST_F(EditKeys, EscapeEmptiesTheBarWithoutACommit) {
    PressKey(edit, VK_ESCAPE);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EDITKILLFOCUS 0", "sent GRIDN_CURRENTCELL B2"}));
    EXPECT_EQ(TextOf(edit), L"");
    EXPECT_FALSE(isModified());
    EXPECT_EQ(GetFocus(), grid);
    EXPECT_EQ(passedOn(edit, WM_KEYDOWN, VK_ESCAPE), 1);
}

TEST_F(EditKeys, EscapeClearsTheModifiedFlagItself) {
    spy.watch("SendMessageW");
    PressKey(edit, VK_ESCAPE);
    int clears = 0;
    for (const ImportCall& call : spy.callsOf("SendMessageW")) {
        const std::vector<DWORD> arguments = ArgumentsOf(call);
        if (arguments[0] != HandleValue(edit) || arguments[1] != EM_SETMODIFY) continue;
        EXPECT_EQ(arguments[2], 0u);
        ++clears;
    }
    EXPECT_EQ(clears, 1);
}

TEST_F(EditKeys, EscapeTellsTheTopLeftCell) {
    Select(2, 4, 3, 8);
    PressKey(edit, VK_ESCAPE);
    EXPECT_EQ(told().back(), "sent GRIDN_CURRENTCELL C4");
}

TEST_F(EditKeys, BackspaceCountsAsAChange) {
    setModified(false);
    PressKey(edit, VK_BACK);
    EXPECT_TRUE(isModified());
    EXPECT_EQ(passedOn(edit, WM_KEYDOWN, VK_BACK), 1);
    EXPECT_EQ(GetFocus(), edit);
    SetFocus(grid);
    EXPECT_EQ(told(), committed);
}

TEST_F(EditKeys, ArrowsCommitForTheOldCellAndThenMove) {
    const struct {
        WPARAM key;
        const char* cell;
    } arrows[] = {{VK_LEFT, "A2"}, {VK_UP, "B1"}, {VK_RIGHT, "C2"}, {VK_DOWN, "B3"}};
    for (const auto& arrow : arrows) {
        startTyping(L"5");
        spy.clearCalls();
        EXPECT_EQ(PressKey(edit, arrow.key), 0);
        EXPECT_EQ(told(), committedThen(std::string("sent GRIDN_CURRENTCELL ") + arrow.cell));
        EXPECT_EQ(GetFocus(), grid);
        EXPECT_EQ(passedOn(edit, WM_KEYDOWN, arrow.key), 0);
    }
}

TEST_F(EditKeys, ArrowsReachTheGridWithTheirParameters) {
    host.alsoRecord(grid, "grid");
    setModified(false);
    SendMessageW(edit, WM_KEYDOWN, VK_UP, 0x00480003);
    const Lines lines = told();
    EXPECT_NE(std::find(lines.begin(), lines.end(),
                        "grid sent WM_KEYDOWN 38 " + std::to_string(0x00480003)),
              lines.end());
}

TEST_F(EditKeys, OtherKeysAreTheEdits) {
    for (const WPARAM key : {VK_HOME, VK_END, VK_DELETE, VK_PRIOR, VK_NEXT, VK_F2, 0x41}) {
        PressKey(edit, key);
        EXPECT_EQ(passedOn(edit, WM_KEYDOWN, key), 1) << key;
    }
    EXPECT_EQ(GetFocus(), edit);
    EXPECT_EQ(told(), Lines{});
}

TEST_F(EditKeys, EnterAndTabCharactersAreSwallowed) {
    EXPECT_EQ(TypeCharacter(edit, L'\r'), 0);
    EXPECT_EQ(TypeCharacter(edit, L'\t'), 0);
    EXPECT_EQ(passedOn(edit, WM_CHAR, L'\r'), 0);
    EXPECT_EQ(passedOn(edit, WM_CHAR, L'\t'), 0);
    EXPECT_EQ(TextOf(edit), L"5");
}

TEST_F(EditKeys, OtherCharactersAreTheEdits) {
    SendMessageW(edit, EM_SETSEL, 1, 1);
    TypeCharacter(edit, L'7');
    TypeCharacter(edit, L' ');
    EXPECT_EQ(TextOf(edit), L"57 ");
    TypeCharacter(edit, L'\b');
    EXPECT_EQ(TextOf(edit), L"57");
    EXPECT_EQ(passedOn(edit, WM_CHAR, L'\b'), 1);
    EXPECT_EQ(told(), Lines{});
}

// ---- Caret mode: after a click into the text the arrows move the caret --------------------------

class CaretMode : public EditKeys {
protected:
    void clickIntoText() {
        spy.clearCalls();
        PressAt(edit, 3, 3);
        EXPECT_EQ(passedOn(edit, WM_LBUTTONDOWN, MK_LBUTTON), 1);
        ReleaseAt(edit, 3, 3);
    }
};

TEST_F(CaretMode, ArrowsStayInTheText) {
    SetWindowTextW(edit, L"12345");
    setModified(true);
    clickIntoText();
    SendMessageW(edit, EM_SETSEL, 3, 3);
    told();
    PressKey(edit, VK_LEFT);
    EXPECT_EQ(LOWORD(SendMessageW(edit, EM_GETSEL, 0, 0)), 2);
    PressKey(edit, VK_RIGHT);
    PressKey(edit, VK_RIGHT);
    EXPECT_EQ(LOWORD(SendMessageW(edit, EM_GETSEL, 0, 0)), 4);
    PressKey(edit, VK_UP);
    PressKey(edit, VK_DOWN);
    for (const WPARAM key : {VK_LEFT, VK_UP, VK_DOWN}) {
        EXPECT_EQ(passedOn(edit, WM_KEYDOWN, key), 1) << key;
    }
    EXPECT_EQ(passedOn(edit, WM_KEYDOWN, VK_RIGHT), 2);
    EXPECT_EQ(GetFocus(), edit);
    EXPECT_EQ(told(), Lines{});
    EXPECT_EQ(Selection(), Block(1, 1, 1, 1));
}

TEST_F(CaretMode, EnterTabAndEscapeStillLeave) {
    clickIntoText();
    PressKey(edit, VK_RETURN);
    EXPECT_EQ(told(), committedThen("sent GRIDN_CURRENTCELL B3"));
    startTyping(L"5");
    clickIntoText();
    PressKey(edit, VK_TAB);
    EXPECT_EQ(told(), committedThen("sent GRIDN_CURRENTCELL C2"));
    startTyping(L"5");
    clickIntoText();
    PressKey(edit, VK_ESCAPE);
    EXPECT_EQ(GetFocus(), grid);
}

TEST_F(CaretMode, EndsWhenTheFocusLeaves) {
    clickIntoText();
    SetFocus(grid);
    startTyping(L"5");
    PressKey(edit, VK_RIGHT);
    EXPECT_EQ(told(), committedThen("sent GRIDN_CURRENTCELL C2"));
}

TEST_F(CaretMode, LastsWhileTheFocusStays) {
    clickIntoText();
    TypeCharacter(edit, L'7');
    KorGrid_SetEquationText(grid, L"other");
    Select(2, 2, 2, 2);
    told();
    PressKey(edit, VK_LEFT);
    EXPECT_EQ(GetFocus(), edit);
    EXPECT_EQ(told(), Lines{});
}

TEST_F(CaretMode, BeginsByAClickThatBringsTheFocus) {
    SetFocus(grid);
    setModified(false);
    told();
    clickIntoText();  // the system's edit takes the focus on the press
    ASSERT_EQ(GetFocus(), edit);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EDITFOCUS 0"}));
    PressKey(edit, VK_RIGHT);
    EXPECT_EQ(GetFocus(), edit);
}

}  // namespace
}  // namespace kortest
