// Committing and cancelling the equation bar, and the texts that the host puts there.
#include "grid/equation_fixture.h"

namespace kortest {
namespace {

class EquationCommit : public EquationUse {};

TEST_F(EquationCommit, NothingTypedAnswersOneAndTellsNothing) {
    EXPECT_EQ(PressOKButton(), 1);
    SetWindowTextW(edit, L"shown, not typed");
    setModified(false);
    EXPECT_EQ(PressOKButton(), 1);
    EXPECT_EQ(told(), Lines{});
    EXPECT_EQ(TextOf(edit), L"shown, not typed");
}

TEST_F(EquationCommit, TypedTextIsToldForTheCurrentCell) {
    Select(2, 5, 7, 9);
    enter(L"=SUM(A1:A3)");
    EXPECT_EQ(PressOKButton(), 0);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EQUATIONENTERED \"=SUM(A1:A3)\" C8", kPainted}));
    EXPECT_FALSE(isModified());
    EXPECT_EQ(TextOf(edit), L"=SUM(A1:A3)");
    EXPECT_EQ(PressOKButton(), 1);
    EXPECT_EQ(told(), Lines{});
}

TEST_F(EquationCommit, ModifiedFlagIsClearedBeforeTheHostIsTold) {
    bool wasModified = true;
    LONG nested = -1;
    host.onMessage = [&](UINT message, WPARAM, LPARAM) {
        if (message == GRIDN_EQUATIONENTERED) {
            wasModified = isModified();
            nested = PressOKButton();
        }
        return LRESULT{0};
    };
    enter(L"5");
    PressOKButton();
    EXPECT_FALSE(wasModified);
    EXPECT_EQ(nested, 1);
}

TEST_F(EquationCommit, EmptyTextStaysModifiedAndIsToldAgain) {
    Select(2, 2, 7, 7);
    enter(L"");
    EXPECT_EQ(PressOKButton(), 0);
    EXPECT_TRUE(isModified());
    EXPECT_EQ(PressOKButton(), 0);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EQUATIONEMPTY C8", kPainted, "sent GRIDN_EQUATIONEMPTY C8",
                             kPainted}));
}

TEST_F(EquationCommit, GridIsRedrawnAfterTheHostWasTold) {
    host.alsoRecord(grid, "grid");
    enter(L"5");
    told();
    PressOKButton();
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EQUATIONENTERED \"5\" A1", "grid sent GRIDM_REDRAW 0 0",
                             kPainted}));
    enter(L"");
    told();
    PressOKButton();
    EXPECT_EQ(told(),
              (Lines{"sent GRIDN_EQUATIONEMPTY A1", "grid sent GRIDM_REDRAW 0 0", kPainted}));
}

TEST_F(EquationCommit, CommandSevenCommits) {
    EXPECT_EQ(send(WM_COMMAND, 7), 1);
    enter(L"5");
    EXPECT_EQ(send(WM_COMMAND, 7), 0);
    EXPECT_EQ(told(), (Lines{"sent GRIDN_EQUATIONENTERED \"5\" A1", kPainted}));
    EXPECT_EQ(send(WM_COMMAND, 7), 1);
}

TEST_F(EquationCommit, AtMost255CharactersAreTold) {
    for (const size_t length : {1u, 254u, 255u, 256u, 257u, 260u, 300u, 1000u}) {
        std::wstring text;
        for (size_t i = 0; i < length; ++i) text += static_cast<wchar_t>(L'a' + i % 26);
        std::wstring heard;
        host.onMessage = [&](UINT message, WPARAM wParam, LPARAM) {
            if (message == GRIDN_EQUATIONENTERED) heard = reinterpret_cast<LPCWSTR>(wParam);
            return LRESULT{0};
        };
        enter(text.c_str());
        EXPECT_EQ(PressOKButton(), 0);
        EXPECT_EQ(heard, text.substr(0, 255)) << length;
    }
}

TEST_F(EquationCommit, TextIsReadWithALimitOf256) {
    spy.watch("SendMessageW");
    enter(L"5");
    PressOKButton();
    int reads = 0;
    for (const ImportCall& call : spy.callsOf("SendMessageW")) {
        const std::vector<DWORD> arguments = ArgumentsOf(call);
        if (arguments[0] != HandleValue(edit) || arguments[1] != WM_GETTEXT) continue;
        EXPECT_EQ(arguments[2], 256u);
        ++reads;
    }
    EXPECT_EQ(reads, 1);
}

TEST_F(EquationCommit, EditTakes260CharactersOfWhichTheCommitReads255) {
    SetFocus(edit);
    for (int i = 0; i < 300; ++i) TypeCharacter(edit, L'x');
    EXPECT_EQ(TextOf(edit).size(), 260u);
    size_t heard = 0;
    host.onMessage = [&](UINT message, WPARAM wParam, LPARAM) {
        if (message == GRIDN_EQUATIONENTERED) {
            heard = std::wstring(reinterpret_cast<LPCWSTR>(wParam)).size();
        }
        return LRESULT{0};
    };
    PressOKButton();
    EXPECT_EQ(heard, 255u);
}

TEST_F(EquationCommit, TextOfAnyLettersIsUnchanged) {
    std::wstring heard;
    host.onMessage = [&](UINT message, WPARAM wParam, LPARAM) {
        if (message == GRIDN_EQUATIONENTERED) heard = reinterpret_cast<LPCWSTR>(wParam);
        return LRESULT{0};
    };
    const std::wstring text = L" Gr\u00F6\u00DFe \u20AC \u4E2D\U0001F600 ";
    enter(text.c_str());
    PressOKButton();
    EXPECT_EQ(heard, text);
}

// ---- Cancelling ------------------------------------------------------------------------------

class EquationCancel : public EquationUse {};

TEST_F(EquationCancel, EmptiesTheBarAndTellsTheCurrentCell) {
    Select(2, 4, 7, 8);
    enter(L"5");
    EXPECT_EQ(send(WM_COMMAND, 8), 0);
    EXPECT_EQ(TextOf(edit), L"");
    EXPECT_EQ(told(), (Lines{"sent GRIDN_CURRENTCELL C8"}));
    EXPECT_EQ(Selection(), Block(2, 4, 7, 8));
}

TEST_F(EquationCancel, LeavesTheModifiedFlagToThePlatform) {
    spy.watch("SendMessageW");
    spy.watch("PostMessageW");
    enter(L"5");
    send(WM_COMMAND, 8);
    EXPECT_EQ(sentByLibrary(edit, EM_SETMODIFY), 0);
    EXPECT_EQ(sentByLibrary(edit, WM_SETTEXT), 1);
}

TEST_F(EquationCancel, IsEmptyAlreadyWhenTheHostIsTold) {
    std::wstring seen = L"not told";
    host.onMessage = [&](UINT message, WPARAM wParam, LPARAM) {
        if (message == WM_NOTIFY && wParam == GRIDN_CURRENTCELL) {
            seen = TextOf(edit);
            KorGrid_SetEquationText(grid, L"old value");
        }
        return LRESULT{0};
    };
    enter(L"5");
    send(WM_COMMAND, 8);
    EXPECT_EQ(seen, L"");
    EXPECT_EQ(TextOf(edit), L"old value");  // the host's text stays
}

// ---- The host's texts ------------------------------------------------------------------------

class EquationText : public EquationUse {};

TEST_F(EquationText, MessageShowsATextAndTellsNothing) {
    EXPECT_EQ(send(GRIDM_SETEQUATIONTEXT, 0, reinterpret_cast<LPARAM>(L"12.5")), 0);
    EXPECT_EQ(TextOf(edit), L"12.5");
    EXPECT_FALSE(isModified());
    EXPECT_EQ(told(), Lines{});
    EXPECT_EQ(PressOKButton(), 1);
}

TEST_F(EquationText, MessageIsForwardedWithBothParameters) {
    spy.watch("SendMessageW");
    const wchar_t text[] = L"12.5";
    send(GRIDM_SETEQUATIONTEXT, 17, reinterpret_cast<LPARAM>(text));
    const auto calls = spy.callsOf("SendMessageW");
    ASSERT_EQ(calls.size(), 1u);
    EXPECT_EQ(calls[0].arguments,
              (std::vector<ULONG_PTR>{reinterpret_cast<ULONG_PTR>(edit), WM_SETTEXT, 17,
                                      reinterpret_cast<ULONG_PTR>(text)}));
}

TEST_F(EquationText, NullIsRefused) {
    KorGrid_SetEquationText(grid, L"12.5");
    EXPECT_EQ(send(GRIDM_SETEQUATIONTEXT), 0);
    EXPECT_EQ(TextOf(edit), L"12.5");
}

TEST_F(EquationText, ResetGridEmptiesTheBarAndNoMore) {
    enter(L"12.5");
    host.alsoRecord(edit, "edit");
    spy.watch("SendMessageW");
    told();
    ResetGrid();
    EXPECT_EQ(TextOf(edit), L"");
    EXPECT_EQ(sentByLibrary(edit, WM_SETTEXT), 1);
    EXPECT_EQ(ArgumentsOf(spy.callsOf("SendMessageW")[0])[2], 256u);
    EXPECT_EQ(sentByLibrary(edit, EM_SETMODIFY), 0);
    for (const std::string& line : told()) EXPECT_EQ(line.rfind("edit ", 0), 0u) << line;
}

TEST_F(EquationText, EditIsTheHostsToUse) {
    EXPECT_EQ(GetHandleToEquationControl(), edit);
    EXPECT_EQ(GetParent(edit), grid);
    SendMessageW(GetHandleToEquationControl(), WM_SETTEXT, 0, reinterpret_cast<LPARAM>(L"7"));
    EXPECT_EQ(TextOf(edit), L"7");
}

}  // namespace
}  // namespace kortest
