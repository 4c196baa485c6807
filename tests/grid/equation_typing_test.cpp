// A character typed in the grid goes to the equation bar, and the first one replaces its text.
#include "grid/equation_fixture.h"

namespace kortest {
namespace {

class TypeAhead : public EquationUse {
protected:
    void SetUp() override {
        EquationUse::SetUp();
        Select(1, 1, 1, 1);
        SetFocus(grid);
        KorGrid_SetEquationText(grid, L"old value");
        told();
    }
};

TEST_F(TypeAhead, CharacterReplacesTheText) {
    TypeCharacter(grid, L'5');
    EXPECT_EQ(TextOf(edit), L"5");
    EXPECT_TRUE(isModified());
    EXPECT_EQ(GetFocus(), edit);
    EXPECT_EQ(GetControlWithFocus(), edit);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EDITFOCUS 0"}));
}

TEST_F(TypeAhead, FurtherCharactersAreAppended) {
    TypeCharacter(grid, L'5');
    TypeCharacter(GetFocus(), L'.');
    TypeCharacter(GetFocus(), L'7');
    EXPECT_EQ(TextOf(edit), L"5.7");
}

TEST_F(TypeAhead, ArrowKeyCommitsAndMoves) {
    TypeCharacter(grid, L'5');
    told();
    PressKey(edit, VK_RIGHT);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EDITKILLFOCUS 0", "sent GRIDN_EQUATIONENTERED \"5\" B2",
                             kPainted, "sent GRIDN_CURRENTCELL C2"}));
    EXPECT_EQ(GetFocus(), grid);
}

TEST_F(TypeAhead, StepsInOrder) {
    host.alsoRecord(edit, "edit");
    spy.watch("SendMessageW");
    std::vector<std::vector<DWORD>> sent;
    spy.replace("SendMessageW", [&](ULONG_PTR* arguments) {
        if (reinterpret_cast<HWND>(arguments[0]) == edit) {
            const auto message = static_cast<DWORD>(arguments[1]);
            const bool isText = message == WM_SETTEXT;
            if (isText) {
                EXPECT_STREQ(reinterpret_cast<LPCWSTR>(arguments[3]), L"");
            }
            sent.push_back({message, static_cast<DWORD>(arguments[2]),
                            isText ? 0 : static_cast<DWORD>(arguments[3])});
        }
        return spy.callReal("SendMessageW", arguments);
    });
    SendMessageW(grid, WM_CHAR, L'Q', 0x00100001);
    EXPECT_EQ(sent, (std::vector<std::vector<DWORD>>{
                        {WM_SETTEXT, 256, 0}, {WM_CHAR, L'Q', 0x00100001}, {EM_SETMODIFY, 1, 0}}));
}

TEST_F(TypeAhead, EveryCharacterButTabAndEnter) {
    for (const wchar_t character : {L'\b', L'\x1B', L' ', L'=', L'\x01', L'\u20AC'}) {
        SetFocus(grid);
        setModified(false);
        SetWindowTextW(edit, L"old value");
        setModified(false);
        TypeCharacter(grid, character);
        EXPECT_EQ(GetFocus(), edit) << static_cast<int>(character);
        EXPECT_NE(TextOf(edit), L"old value") << static_cast<int>(character);
        EXPECT_TRUE(isModified()) << static_cast<int>(character);
        setModified(false);
    }
    SetFocus(grid);
    SetWindowTextW(edit, L"old value");
    told();
    TypeCharacter(grid, L'\t');
    TypeCharacter(grid, L'\r');
    EXPECT_EQ(GetFocus(), grid);
    EXPECT_EQ(TextOf(edit), L"old value");
    EXPECT_FALSE(isModified());
    EXPECT_EQ(told(), Lines{});
}

TEST_F(TypeAhead, AllCharactersGoOnToTheSystem) {
    spy.watch("DefWindowProcW");
    for (const wchar_t character : {L'5', L'\t', L'\r'}) {
        spy.clearCalls();
        TypeCharacter(grid, character);
        int passed = 0;
        for (const ImportCall& call : spy.callsOf("DefWindowProcW")) {
            passed += ArgumentsOf(call)[0] == HandleValue(grid) &&
                      ArgumentsOf(call)[1] == static_cast<DWORD>(WM_CHAR);
        }
        EXPECT_EQ(passed, 1) << static_cast<int>(character);
    }
}

TEST_F(TypeAhead, WholeEntryThroughTheQueue) {
    for (const WPARAM key : {WPARAM{'4'}, WPARAM{'2'}}) {
        PostMessageW(GetFocus(), WM_KEYDOWN, key, 1);
        host.pump();
    }
    EXPECT_EQ(TextOf(edit), L"42");
    told();
    PostMessageW(edit, WM_KEYDOWN, VK_RETURN, 1);
    host.pump();
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EDITKILLFOCUS 0", "sent GRIDN_EQUATIONENTERED \"42\" B2",
                             kPainted, "sent GRIDN_CURRENTCELL B3"}));
    EXPECT_EQ(GetFocus(), grid);
    EXPECT_EQ(TextOf(edit), L"42");  // the Enter character was swallowed by the edit
}

// A host that puts the new cell's text into the bar, as hosts do.
TEST_F(TypeAhead, HostThatFollowsTheCurrentCell) {
    host.onMessage = [&](UINT message, WPARAM wParam, LPARAM lParam) {
        if (message == WM_NOTIFY && wParam == GRIDN_CURRENTCELL) {
            const auto& cell = *reinterpret_cast<const GridCellPair*>(lParam);
            const std::wstring text = L"text of row " + std::to_wstring(cell.row);
            KorGrid_SetEquationText(grid, text.c_str());
        }
        return LRESULT{0};
    };
    TypeCharacter(grid, L'5');
    PressKey(edit, VK_DOWN);
    EXPECT_EQ(TextOf(edit), L"text of row 2");
    EXPECT_FALSE(isModified());
    EXPECT_EQ(PressOKButton(), 1);
}

}  // namespace
}  // namespace kortest
